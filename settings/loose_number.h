#pragma once

#include <string>
#include <string_view>

// The number at the start of `text`, read loosely: blanks, tabs and line feeds are skipped
// wherever they stand; then a sign, digits, one decimal point and an exponent are taken up to the
// first other character, or "&H"/"&O" and hexadecimal/octal digits. No number, or one too large
// to hold, gives 0.
double LooseNumber(std::string_view text);
// `value` in its shortest plain decimal form, never with an exponent: "800", "0.5", "-3".
std::string PlainNumberText(double value);
// How a settings box shows `text`: "0800" -> "800", "1024 ; comment" -> "1024", "abc" -> "0".
std::string LooseNumberText(std::string_view text);
