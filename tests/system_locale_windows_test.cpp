// What depends on the system's language settings on Windows. scripts/test_windows.sh runs these
// once more under a Russian and a Turkish system locale.
#include "base/names.h"
#include "base/text_encoding.h"

#include <windows.h>

#include <gtest/gtest.h>

// NTFS ignores case by one fixed table; the user's language must not change which names match.
TEST(SystemLocale, NamesFoldAsTheFileSystemFoldsThem) {
  for (wchar_t c = 0x80; c < 0xD800; ++c) {
    const std::string name = BytesFromWide(std::wstring(1, c), CP_UTF8);
    const std::wstring folded = WideFromBytes(FoldName(name), CP_UTF8);
    ASSERT_EQ(CompareStringOrdinal(&c, 1, folded.data(), static_cast<int>(folded.size()), TRUE),
              CSTR_EQUAL)
        << static_cast<unsigned>(c);
  }
  EXPECT_EQ(FoldName("\xC3\xA4i"), "\xC3\x84I");               // "äi": a Turkish "i" is still "I"
  EXPECT_EQ(FoldName("\xC3\xA4\xC4\xB1"), "\xC3\x84\xC4\xB1"); // dotless "ı" has no upper case here
}

TEST(SystemLocale, TextThatIsNotUtf8IsReadInTheAnsiCodePage) {
  const std::string bytes = "\xC0\xE1\x80\x9F";
  std::string expected;
  if (GetACP() == 1252 || GetACP() == 1254)
    expected = "\xC3\x80\xC3\xA1\xE2\x82\xAC\xC5\xB8"; // "Àá€Ÿ", Western and Turkish alike
  else if (GetACP() == 1251)
    expected = "\xD0\x90\xD0\xB1\xD0\x82\xD1\x9F"; // "АбЂџ"
  else
    GTEST_SKIP() << "no expectation for code page " << GetACP();
  EXPECT_EQ(TextAsUtf8(bytes), expected);
  EXPECT_EQ(ToAnsi(expected), bytes);
  EXPECT_EQ(TextAsUtf8("\xD0\x90"), "\xD0\x90"); // valid UTF-8 stays
}
