#include "base/text_encoding.h"

#include <algorithm>

#include <array>

#ifdef _WIN32
#include <windows.h>
#endif

namespace {

// The characters of bytes 0x80 to 0x9F; the undefined ones keep their own number.
constexpr std::array<char32_t, 32> kHighControls = {
    0x20AC, 0x0081, 0x201A, 0x0192, 0x201E, 0x2026, 0x2020, 0x2021, 0x02C6, 0x2030, 0x0160,
    0x2039, 0x0152, 0x008D, 0x017D, 0x008F, 0x0090, 0x2018, 0x2019, 0x201C, 0x201D, 0x2022,
    0x2013, 0x2014, 0x02DC, 0x2122, 0x0161, 0x203A, 0x0153, 0x009D, 0x017E, 0x0178};

} // namespace

void AppendUtf8(std::string &out, char32_t c) {
  if (c < 0x80) {
    out += static_cast<char>(c);
  } else if (c < 0x800) {
    out += static_cast<char>(0xC0 | (c >> 6));
    out += static_cast<char>(0x80 | (c & 0x3F));
  } else if (c < 0x10000) {
    out += static_cast<char>(0xE0 | (c >> 12));
    out += static_cast<char>(0x80 | ((c >> 6) & 0x3F));
    out += static_cast<char>(0x80 | (c & 0x3F));
  } else {
    out += static_cast<char>(0xF0 | (c >> 18));
    out += static_cast<char>(0x80 | ((c >> 12) & 0x3F));
    out += static_cast<char>(0x80 | ((c >> 6) & 0x3F));
    out += static_cast<char>(0x80 | (c & 0x3F));
  }
}

bool NextCodePoint(std::string_view text, size_t &at, char32_t &c) {
  const auto lead = static_cast<unsigned char>(text[at]);
  int length = 0;
  char32_t smallest = 0;
  if (lead < 0x80) {
    c = lead;
    ++at;
    return true;
  }
  if (lead >= 0xC2 && lead <= 0xDF) {
    length = 2, c = lead & 0x1F, smallest = 0x80;
  } else if (lead >= 0xE0 && lead <= 0xEF) {
    length = 3, c = lead & 0x0F, smallest = 0x800;
  } else if (lead >= 0xF0 && lead <= 0xF4) {
    length = 4, c = lead & 0x07, smallest = 0x10000;
  } else {
    return false;
  }
  if (at + static_cast<size_t>(length) > text.size())
    return false;
  for (int i = 1; i < length; ++i) {
    const auto next = static_cast<unsigned char>(text[at + static_cast<size_t>(i)]);
    if ((next & 0xC0) != 0x80)
      return false;
    c = (c << 6) | (next & 0x3F);
  }
  if (c < smallest || c > 0x10FFFF || (c >= 0xD800 && c <= 0xDFFF))
    return false;
  at += static_cast<size_t>(length);
  return true;
}

bool IsUtf8(std::string_view bytes) {
  char32_t c = 0;
  for (size_t at = 0; at < bytes.size();)
    if (!NextCodePoint(bytes, at, c))
      return false;
  return true;
}

std::string Windows1252ToUtf8(std::string_view bytes) {
  std::string out;
  out.reserve(bytes.size() + bytes.size() / 4);
  for (char byte : bytes) {
    const auto b = static_cast<unsigned char>(byte);
    AppendUtf8(out, b >= 0x80 && b < 0xA0 ? kHighControls[b - 0x80] : char32_t(b));
  }
  return out;
}

static char Windows1252Byte(char32_t c) {
  if (c < 0x80 || (c >= 0xA0 && c <= 0xFF))
    return static_cast<char>(c);
  for (size_t i = 0; i < kHighControls.size(); ++i)
    if (kHighControls[i] == c)
      return static_cast<char>(0x80 + i);
  return '?';
}

std::string ToWindows1252(std::string_view utf8) {
  std::string out;
  out.reserve(utf8.size());
  char32_t c = 0;
  for (size_t at = 0; at < utf8.size();) {
    if (NextCodePoint(utf8, at, c)) {
      out += Windows1252Byte(c);
    } else {
      out += '?';
      ++at;
    }
  }
  return out;
}

#ifdef _WIN32
std::wstring WideFromBytes(std::string_view bytes, unsigned codePage) {
  const int size = static_cast<int>(bytes.size());
  std::wstring wide(
      static_cast<size_t>(MultiByteToWideChar(codePage, 0, bytes.data(), size, nullptr, 0)), L'\0');
  MultiByteToWideChar(codePage, 0, bytes.data(), size, wide.data(), static_cast<int>(wide.size()));
  return wide;
}

std::string BytesFromWide(std::wstring_view wide, unsigned codePage) {
  const int size = static_cast<int>(wide.size());
  // UTF-8 takes no default character.
  const char *unknown = codePage == CP_UTF8 ? nullptr : "?";
  std::string bytes(static_cast<size_t>(WideCharToMultiByte(codePage, 0, wide.data(), size, nullptr,
                                                            0, unknown, nullptr)),
                    '\0');
  WideCharToMultiByte(codePage, 0, wide.data(), size, bytes.data(), static_cast<int>(bytes.size()),
                      unknown, nullptr);
  return bytes;
}

// Windows-1252 keeps the table above, which gives back the five bytes the system leaves
// undefined; other code pages go through the system.
std::string AnsiToUtf8(std::string_view bytes) {
  const unsigned codePage = GetACP();
  if (codePage == 1252)
    return Windows1252ToUtf8(bytes);
  return BytesFromWide(WideFromBytes(bytes, codePage), CP_UTF8);
}

std::string ToAnsi(std::string_view utf8) {
  const unsigned codePage = GetACP();
  if (codePage == 1252)
    return ToWindows1252(utf8);
  return BytesFromWide(WideFromBytes(utf8, CP_UTF8), codePage);
}
#else
std::string AnsiToUtf8(std::string_view bytes) { return Windows1252ToUtf8(bytes); }
std::string ToAnsi(std::string_view utf8) { return ToWindows1252(utf8); }
#endif

std::string TextAsUtf8(std::string_view bytes) {
  return IsUtf8(bytes) ? std::string(bytes) : AnsiToUtf8(bytes);
}

std::string NameFromText(std::string_view bytes) {
#ifdef _WIN32
  return TextAsUtf8(bytes);
#else
  return std::string(bytes);
#endif
}

FirstCharacter FirstCharacterOf(std::string_view name) {
  if (name.empty())
    return {"", 0};
  // An ASCII byte is that character either way, without checking the rest of the name.
  if (static_cast<unsigned char>(name.front()) < 0x80)
    return {std::string(1, name.front()), 1};
  size_t at = 0;
  char32_t c = 0;
  if (IsUtf8(name) && NextCodePoint(name, at, c))
    return {std::string(name.substr(0, at)), at};
  return {Windows1252ToUtf8(name.substr(0, 1)), 1};
}

std::string LastCharacterOf(std::string_view text) {
  // A code point has at most four bytes; the last one that runs to the end is the character.
  for (size_t length = std::min<size_t>(4, text.size()); length > 1; --length) {
    size_t at = text.size() - length;
    char32_t c = 0;
    if (NextCodePoint(text, at, c) && at == text.size())
      return std::string(text.substr(text.size() - length));
  }
  return std::string(text.substr(text.empty() ? 0 : text.size() - 1));
}
