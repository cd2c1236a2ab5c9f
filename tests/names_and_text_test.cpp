#include "base/file_ops.h"
#include "base/listing.h"
#include "base/name_index.h"
#include "base/names.h"
#include "base/plain_name.h"
#include "base/text_encoding.h"
#include "base/text_file.h"
#include "library/reset_all.h"
#include "tests/selector_fixture.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <tuple>

TEST(TextFile, EveryKindOfLineEndEndsALine) {
  EXPECT_EQ(SplitLines("a\r\nb\rc\nd"), (Names{"a", "b", "c", "d"}));
  EXPECT_EQ(SplitLines("a\r\n\r\nb\r\n"), (Names{"a", "", "b"}));
  EXPECT_EQ(SplitLines("\n\n"), (Names{"", ""}));
  EXPECT_EQ(SplitLines(""), Names{});
  EXPECT_EQ(SplitLines("x\xff\x01y"), Names{"x\xff\x01y"});
}

// A folder holding a temporary name makes the write or copy that needs it fail, even for root.
TEST(NewFiles, AWriteOrCopyIsWholeOrLeavesTheOldFile) {
  TestFolder folder;
  const fs::path target = folder.Write("record.txt", "old");
  const fs::path source = folder.Write("source.dat", "new");
  Failures failures;
  EXPECT_TRUE(WriteAtomically(target, "new\r\n", failures));
  for (const char *name : {"record.txt", "free.dat", "kept.dat", "listed.dat"})
    folder.MakeFolder(std::string(name) + ".partial/in the way");
  folder.Write("kept.dat", "old");
  folder.Write("listed.dat", "old");
  EXPECT_FALSE(WriteAtomically(target, "newer", failures));
  EXPECT_TRUE(CopyJournaled(source, folder.Path() / "free.dat", failures)); // needs none
  EXPECT_FALSE(CopyReplacing(source, folder.Path() / "kept.dat", failures));
  EXPECT_FALSE(CopyJournaled(source, folder.Path() / "listed.dat", failures));
  EXPECT_EQ(folder.Read("record.txt") + folder.Read("free.dat") + folder.Read("kept.dat") +
                folder.Read("listed.dat"),
            "new\r\nnewoldold");
  EXPECT_TRUE(folder.Exists("record.txt.partial/in the way"));
  ASSERT_EQ(failures.Lines().size(), 3u);
  EXPECT_TRUE(Contains(failures.Lines()[0], "record.txt"));
}

// Windows' matching: "*" and "?" over whole characters, letters in any case, beyond ASCII too.
TEST(Listing, PatternsMatchLikeWindowsIgnoringCase) {
  // clang-format off
  const std::tuple<const char *, const char *, bool> cases[] = {
      {"mypic", "*.*", true}, {"PLANES.DAT", "*.dat", true}, {"pic1.bmp", "P*.BMP", true},
      {"title.bmp", "P*.bmp", false}, {"MyPic", "mypic", true}, {"mypic.jpg", "mypic", false},
      {"a1.txt", "a?.txt", true}, {"a12.txt", "a?.txt", false}, {"ÄRMEL.DAT", "ä*.dat", true},
      {"ä.txt", "?.TXT", true}, {"ä.txt", "??.txt", false}, {"ö.txt", "ä.txt", false}};
  // clang-format on
  for (const auto &[name, pattern, matches] : cases)
    EXPECT_EQ(MatchesPattern(name, pattern), matches) << name << " " << pattern;
  EXPECT_TRUE(MatchesPatternList("skin.GIF", "mypic;skinpic;*.jpg;*.bmp;*.gif"));
  EXPECT_FALSE(MatchesPatternList("skin.png", "mypic;;*.jpg"));
  EXPECT_FALSE(MatchesPatternList("anything", ""));
}

TEST(Listing, ALargeFolderComesInTheSameOrder) {
  // Enough names, sharing long beginnings, to be sorted byte by byte rather than compared.
  TestFolder folder;
  Names names;
  for (int i = 0; i < 150; ++i)
    for (const char *stem : {"Addon ", "addon_", "ADDON-A", "b"})
      names.push_back(stem + std::to_string(i * 7 % 150) + ".dat");
  if (IsCaseSensitive(folder.Path()))
    names.insert(names.end(), {"addon-a1.dat", "ADDON-A1.DAT", "Addon-A1.dat", "b", "B"});
  for (const std::string &name : names)
    folder.Write(name);
  std::sort(names.begin(), names.end(),
            [](const std::string &a, const std::string &b) { return NameLess(a, b); });
  EXPECT_EQ(ListFiles(folder.Path()), names);
}

TEST(Listing, FilesAndFoldersComeInOneNameOrder) {
  TestFolder folder;
  for (const char *name : {"b.dat", "A.dat", "a.DAT", "c.txt", "mypic"})
    folder.Write(name);
  folder.MakeFolder("sub.dat");
  // Where letter case makes no difference, "a.DAT" was written into "A.dat".
  const Names dat =
      IsCaseSensitive(folder.Path()) ? Names{"A.dat", "a.DAT", "b.dat"} : Names{"A.dat", "b.dat"};
  EXPECT_EQ(ListFiles(folder.Path(), "*.dat"), dat);
  Names all = dat;
  all.insert(all.end(), {"c.txt", "mypic"});
  EXPECT_EQ(ListFiles(folder.Path()), all);
  EXPECT_TRUE(ListFiles(folder.Path() / "missing").empty());

  for (const char *name : {"S-b", "s-a", "C x", "F-z"})
    folder.MakeFolder(std::string("lib/") + name);
  folder.Write("lib/file");
  EXPECT_EQ(ListFolderNames(folder.Path() / "lib"), (Names{"C x", "F-z", "s-a", "S-b"}));
  EXPECT_EQ(ListFolders(folder.Path() / "lib")[3], folder.Path() / "lib" / "S-b");
}

TEST(PlainName, TakesOrdinaryNamesOfAnyBytesAndRefusesEveryPathOrDevice) {
  for (const std::string name : {"game.cfg", "m1.msn", "F-Spitfire", "a..b", ".hidden",
                                 "\xC4nderung.txt", "COM0", "console.txt", "nul_x.dat"})
    EXPECT_TRUE(IsPlainName(name)) << name;
  using namespace std::string_literals;
  for (const std::string &name :
       {""s, "a\0b"s, std::string(256, 'x'), "."s, ".."s, "../victim.dat"s, "a/b"s, "a\\b"s, "C:x"s,
        "/etc/passwd"s, "CON"s, "nul.txt"s, "Com1.ini"s, "lpt9"s, "nul .txt"s, "name."s, "name "s,
        "tab\there"s, "com\xC2\xB9.ini"s})
    EXPECT_FALSE(IsPlainName(name)) << name;
}

TEST(TextEncoding, WindowsTextBecomesUtf8AndGoesBackByteForByte) {
  EXPECT_TRUE(IsUtf8("plain \xC3\xA4 \xE2\x82\xAC \xF0\x9F\x98\x80"));
  for (const char *bad : {"\xE4", "\xC3", "\xC0\x80", "\xED\xA0\x80", "\xF4\x90\x80\x80", "\x93q"})
    EXPECT_FALSE(IsUtf8(bad)) << bad;
  EXPECT_EQ(Windows1252ToUtf8("S-J\xE4ger \x80 \x93q\x94"),
            "S-J\xC3\xA4ger \xE2\x82\xAC \xE2\x80\x9Cq\xE2\x80\x9D");
  std::string every;
  for (int byte = 0; byte < 256; ++byte)
    every += static_cast<char>(byte);
  EXPECT_EQ(ToWindows1252(Windows1252ToUtf8(every)), every);
  EXPECT_EQ(ToWindows1252("\xE2\x82\xAC \xE4\xB8\xAD"), "\x80 ?");
  EXPECT_EQ(TextAsUtf8("\xC3\xA4"), "\xC3\xA4");
  EXPECT_EQ(TextAsUtf8("\xE4"), "\xC3\xA4");
}

TEST(NameCase, LettersBeyondAsciiFoldToTheSameNameAndAreFoundSo) {
  // clang-format off
  const std::pair<const char *, const char *> same[] = {
      {"ärmel.dat", "ÄRMEL.DAT"}, {"Été", "éTÉ"}, {"άλφα", "ΆΛΦΑ"}, {"жук", "ЖУК"},
      {"mypic", "MyPic"}};
  // clang-format on
  for (const auto &[a, b] : same)
    EXPECT_EQ(FoldName(a), FoldName(b)) << a;
  EXPECT_NE(FoldName("ärmel"), FoldName("armel"));

  // A folder's index finds each file that folds like a wanted name. The Kelvin sign and the long s
  // fold to ASCII letters of fewer bytes where Unicode folding applies, so their names are no guide
  // to their folded length or first letter.
  TestFolder folder;
  for (const char *name :
       {"\xE2\x84\xAA.dat", "\xC5\xBF.dat", "k.DAT", "s.dat", "\xC3\x84rmel.dat", "armel.dat"})
    folder.Write(name);
  const Names wanted = {"K.dat", "S.DAT", "\xC3\xA4RMEL.DAT", "ARMEL.DAT", "x.dat"};
  const NameIndex index(folder.Path(), wanted);
  for (const std::string &name : wanted) {
    Names folded;
    for (const std::string &listed : ListFiles(folder.Path()))
      if (FoldName(listed) == FoldName(name))
        folded.push_back(listed);
    EXPECT_EQ(index.Matches(name), folded) << name;
  }
}

using Windows1252Files = SelectorTest;

// Notepad and older tools write Windows-1252: such files still name the folders and files.
TEST_F(Windows1252Files, NameTheFoldersAndFilesTheyMean) {
  game.WithCategories("Skins f\xFCr alle: S\r\n");
  game.Addon("S-J\xC3\xA4ger");
  game.WithRecord("S-J\xE4ger\r\n\r\n");
  game.Write("ZEP128/S-J\xC3\xA4ger/contents.txt", "\x93Gr\xFCn\x94 \x80");
  game.Write("Music.ini", "Kl\xE4nge\r\nStille\r\n");
  game.MakeFolder("Kl\xC3\xA4nge");
  game.Write("ZEP128/CleanUp.ini", "*.d\xE4t\r\n");
  game.Write("alt.d\xC3\xA4t");
  Gather(selector->StartUp());
  const SelectorState &state = selector->State();
  EXPECT_EQ(state.List3.back(), "Skins f\xC3\xBCr alle");
  EXPECT_EQ(RowNames(state.Unigrid, true), Names{"S-J\xC3\xA4ger [S]"});
  EXPECT_EQ(selector->HoverRow(0)->description,
            "\xE2\x80\x9CGr\xC3\xBCn\xE2\x80\x9D \xE2\x82\xAC\r\n");
  EXPECT_EQ(selector->MusicSets(failures).entries, Names{"Kl\xC3\xA4nge"});
  EXPECT_EQ(CleanUpNames(state, failures), Names{"alt.d\xC3\xA4t"});
  // Only the notice that the record from before the ledger gave the ledger.
  EXPECT_TRUE(OneFailure(Taken(), "earlier version"));
}
