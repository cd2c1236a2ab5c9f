#pragma once

#include <string_view>

// The whole part of the number that `text` starts with, after blanks and tabs, with an optional
// sign; text that does not start with a number gives 0. Very long numbers saturate instead of
// overflowing.
long long LeadingWholeNumber(std::string_view text);
