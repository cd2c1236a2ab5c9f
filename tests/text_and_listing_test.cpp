#include "base/file_ops.h"
#include "base/listing.h"
#include "base/names.h"
#include "base/plain_name.h"
#include "base/text_file.h"
#include "tests/test_folder.h"

#include <gtest/gtest.h>

#include <algorithm>

namespace fs = std::filesystem;
using Lines = std::vector<std::string>;

TEST(TextFile, EveryKindOfLineEndEndsALine) {
  EXPECT_EQ(SplitLines("a\r\nb\rc\nd"), (Lines{"a", "b", "c", "d"}));
  EXPECT_EQ(SplitLines("a\r\n\r\nb\r\n"), (Lines{"a", "", "b"}));
  EXPECT_EQ(SplitLines("\n\n"), (Lines{"", ""}));
  EXPECT_EQ(SplitLines(""), Lines{});
  EXPECT_EQ(SplitLines("x\xff\x01y"), Lines{"x\xff\x01y"});
}

TEST(TextFile, AtomicWriteReplacesWholeOrLeavesTheOldFile) {
  TestFolder folder;
  const fs::path target = folder.Write("record.txt", "old");
  Failures failures;
  EXPECT_TRUE(WriteAtomically(target, "new\r\n", failures));
  EXPECT_EQ(folder.Read("record.txt"), "new\r\n");

  // A folder holding the temporary name makes the write fail even for root.
  folder.Write("record.txt.partial/keep", "");
  EXPECT_FALSE(WriteAtomically(target, "newer", failures));
  EXPECT_EQ(folder.Read("record.txt"), "new\r\n");
  EXPECT_TRUE(folder.Exists("record.txt.partial/keep"));
  ASSERT_EQ(failures.Lines().size(), 1u);
  EXPECT_NE(failures.Lines()[0].find("record.txt"), std::string::npos);
}

TEST(Copy, OnlyANewNameIsWrittenWithoutTheTemporaryFile) {
  TestFolder folder;
  const fs::path source = folder.Write("source.dat", "new");
  // A folder holding a temporary name blocks every copy that needs it.
  for (const char *name : {"free.dat", "kept.dat", "listed.dat"})
    folder.MakeFolder(std::string(name) + ".partial/in the way");
  folder.Write("kept.dat", "old");
  folder.Write("listed.dat", "old");
  Failures failures;
  EXPECT_TRUE(CopyJournaled(source, folder.Path() / "free.dat", failures));
  EXPECT_FALSE(CopyReplacing(source, folder.Path() / "kept.dat", failures));
  EXPECT_FALSE(CopyJournaled(source, folder.Path() / "listed.dat", failures));
  EXPECT_EQ(folder.Read("free.dat"), "new");
  EXPECT_EQ(folder.Read("kept.dat"), "old");
  EXPECT_EQ(folder.Read("listed.dat"), "old");
  EXPECT_EQ(failures.Lines().size(), 2u);
}

TEST(Listing, PatternsMatchLikeWindowsIgnoringCase) {
  EXPECT_TRUE(MatchesPattern("mypic", "*.*"));
  EXPECT_TRUE(MatchesPattern("PLANES.DAT", "*.dat"));
  EXPECT_TRUE(MatchesPattern("pic1.bmp", "P*.BMP"));
  EXPECT_FALSE(MatchesPattern("title.bmp", "P*.bmp"));
  EXPECT_TRUE(MatchesPattern("MyPic", "mypic"));
  EXPECT_FALSE(MatchesPattern("mypic.jpg", "mypic"));
  EXPECT_TRUE(MatchesPattern("a1.txt", "a?.txt"));
  EXPECT_FALSE(MatchesPattern("a12.txt", "a?.txt"));
  EXPECT_TRUE(MatchesPatternList("skin.GIF", "mypic;skinpic;*.jpg;*.bmp;*.gif"));
  EXPECT_FALSE(MatchesPatternList("skin.png", "mypic;;*.jpg"));
  EXPECT_FALSE(MatchesPatternList("anything", ""));
}

TEST(Listing, ALargeFolderComesInTheSameOrder) {
  // Enough names, sharing long beginnings, to be sorted byte by byte rather than compared.
  TestFolder folder;
  Lines names;
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
  const Lines dat =
      IsCaseSensitive(folder.Path()) ? Lines{"A.dat", "a.DAT", "b.dat"} : Lines{"A.dat", "b.dat"};
  EXPECT_EQ(ListFiles(folder.Path(), "*.dat"), dat);
  Lines all = dat;
  all.insert(all.end(), {"c.txt", "mypic"});
  EXPECT_EQ(ListFiles(folder.Path()), all);
  EXPECT_TRUE(ListFiles(folder.Path() / "missing").empty());

  for (const char *name : {"S-b", "s-a", "C x", "F-z"})
    folder.MakeFolder(std::string("lib/") + name);
  folder.Write("lib/file");
  const std::vector<fs::path> folders = ListFolders(folder.Path() / "lib");
  std::vector<std::string> names;
  for (const fs::path &path : folders)
    names.push_back(path.filename().string());
  EXPECT_EQ(names, (Lines{"C x", "F-z", "s-a", "S-b"}));
  EXPECT_EQ(folders[0], folder.Path() / "lib" / "C x");
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
