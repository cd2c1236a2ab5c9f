#include "slots/leading_number.h"

long long LeadingWholeNumber(std::string_view text) {
  constexpr long long kSaturation = 1000000000000LL;
  size_t at = 0;
  while (at < text.size() && (text[at] == ' ' || text[at] == '\t'))
    ++at;
  bool negative = false;
  if (at < text.size() && (text[at] == '+' || text[at] == '-'))
    negative = text[at++] == '-';
  long long value = 0;
  for (; at < text.size() && text[at] >= '0' && text[at] <= '9'; ++at) {
    if (value < kSaturation)
      value = value * 10 + (text[at] - '0');
  }
  return negative ? -value : value;
}
