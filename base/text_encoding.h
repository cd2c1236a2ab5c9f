#pragma once

#include <string>
#include <string_view>

// Reads the code point of UTF-8 `text` that starts at `at` into `c` and moves `at` past it;
// false, with `at` unchanged, for a byte that starts no valid sequence.
bool NextCodePoint(std::string_view text, size_t &at, char32_t &c);
// Appends code point `c` to `out` in UTF-8.
void AppendUtf8(std::string &out, char32_t c);
// Whether `bytes` are valid UTF-8 (shortest forms, no surrogates, nothing past U+10FFFF).
bool IsUtf8(std::string_view bytes);
// Windows-1252 bytes as UTF-8; the five bytes the code page leaves undefined become the control
// characters of the same number, so that ToWindows1252 gives every byte back.
std::string Windows1252ToUtf8(std::string_view bytes);
// UTF-8 text as Windows-1252 bytes, the inverse of Windows1252ToUtf8; a character the code page
// lacks becomes "?".
std::string ToWindows1252(std::string_view utf8);
// Bytes in the system's ANSI code page (what Notepad and older tools write) as UTF-8: on Windows
// the code page the system names (GetACP), elsewhere Windows-1252.
std::string AnsiToUtf8(std::string_view bytes);
// UTF-8 text as bytes in the system's ANSI code page, the inverse of AnsiToUtf8; a character the
// code page lacks becomes "?".
std::string ToAnsi(std::string_view utf8);
// Text from a file written on Windows: the bytes when they are valid UTF-8, otherwise read in the
// system's ANSI code page and given as UTF-8.
std::string TextAsUtf8(std::string_view bytes);
// The first character of a name.
struct FirstCharacter {
  std::string text; // as UTF-8
  size_t bytes;     // how many of the name's bytes it takes
};
// The first character of `name`: of a valid UTF-8 name its first code point, of any other its
// first byte read as Windows-1252. Empty for an empty name.
FirstCharacter FirstCharacterOf(std::string_view name);
// The last character of UTF-8 `text`: its last code point, or its last byte where that ends no
// valid sequence. Empty for an empty text.
std::string LastCharacterOf(std::string_view text);
// A file name read from a text file, as the platform keeps names: on Windows, where names are
// UTF-8 here, ANSI text becomes UTF-8; elsewhere the bytes are the name.
std::string NameFromText(std::string_view bytes);

#ifdef _WIN32
// Bytes in Windows code page `codePage` as UTF-16, and back; what a code page lacks becomes "?".
std::wstring WideFromBytes(std::string_view bytes, unsigned codePage);
std::string BytesFromWide(std::wstring_view wide, unsigned codePage);
#endif
