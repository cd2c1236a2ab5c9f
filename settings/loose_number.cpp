#include "settings/loose_number.h"

#include <charconv>
#include <cmath>
#include <system_error>

static bool IsSkipped(char c) { return c == ' ' || c == '\t' || c == '\n'; }

static std::string WithoutBlanks(std::string_view text) {
  std::string kept;
  for (char c : text)
    if (!IsSkipped(c))
      kept += c;
  return kept;
}

static int DigitValue(char c) {
  if (c >= '0' && c <= '9')
    return c - '0';
  if (c >= 'a' && c <= 'f')
    return c - 'a' + 10;
  if (c >= 'A' && c <= 'F')
    return c - 'A' + 10;
  return 99;
}

// The digits after "&H" or "&O", up to the first one that is not of the base.
static double RadixNumber(std::string_view digits, int base) {
  double value = 0;
  for (char c : digits) {
    const int digit = DigitValue(c);
    if (digit >= base)
      break;
    value = value * base + digit;
  }
  return value;
}

static size_t DigitsFrom(std::string_view text, size_t at) {
  while (at < text.size() && text[at] >= '0' && text[at] <= '9')
    ++at;
  return at;
}

// The longest start of `text` that is a decimal number, in the form from_chars reads.
static std::string DecimalPart(std::string_view text) {
  size_t end = 0;
  std::string sign;
  if (end < text.size() && (text[end] == '+' || text[end] == '-'))
    sign = text[end++] == '-' ? "-" : "";
  const size_t mantissaStart = end;
  end = DigitsFrom(text, end);
  size_t digitCount = end - mantissaStart;
  if (end < text.size() && text[end] == '.') {
    const size_t fractionEnd = DigitsFrom(text, end + 1);
    digitCount += fractionEnd - end - 1;
    end = fractionEnd;
  }
  if (digitCount == 0)
    return "";
  std::string number = sign + std::string(text.substr(mantissaStart, end - mantissaStart));
  if (end < text.size() &&
      (text[end] == 'E' || text[end] == 'e' || text[end] == 'D' || text[end] == 'd')) {
    size_t exponent = end + 1;
    if (exponent < text.size() && (text[exponent] == '+' || text[exponent] == '-'))
      ++exponent;
    const size_t exponentEnd = DigitsFrom(text, exponent);
    if (exponentEnd > exponent)
      number += "e" + std::string(text.substr(end + 1, exponentEnd - end - 1));
  }
  return number;
}

static double ReadNumber(std::string_view text) {
  const std::string kept = WithoutBlanks(text);
  if (kept.size() >= 2 && kept[0] == '&' && (kept[1] == 'H' || kept[1] == 'h'))
    return RadixNumber(std::string_view(kept).substr(2), 16);
  if (kept.size() >= 2 && kept[0] == '&' && (kept[1] == 'O' || kept[1] == 'o'))
    return RadixNumber(std::string_view(kept).substr(2), 8);
  const std::string number = DecimalPart(kept);
  double value = 0;
  const auto result = std::from_chars(number.data(), number.data() + number.size(), value);
  return result.ec == std::errc() ? value : 0;
}

double LooseNumber(std::string_view text) {
  const double value = ReadNumber(text);
  return std::isfinite(value) ? value : 0;
}

std::string PlainNumberText(double value) {
  if (value == 0)
    return "0";
  char buffer[400];
  const auto result =
      std::to_chars(buffer, buffer + sizeof buffer, value, std::chars_format::fixed);
  return result.ec == std::errc() ? std::string(buffer, result.ptr) : "0";
}

std::string LooseNumberText(std::string_view text) { return PlainNumberText(LooseNumber(text)); }
