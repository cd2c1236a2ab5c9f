#include "base/listing.h"
#include "base/name_index.h"
#include "base/names.h"
#include "base/text_encoding.h"
#include "library/ledger_check.h"
#include "library/move_out.h"
#include "library/reset_all.h"
#include "tests/selector_fixture.h"

#include <gtest/gtest.h>

using Names = std::vector<std::string>;

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

TEST(NameCase, LettersBeyondAsciiMatchInAnyCase) {
  // clang-format off
  const std::pair<const char *, const char *> same[] = {
      {"ärmel.dat", "ÄRMEL.DAT"}, {"Été", "éTÉ"}, {"άλφα", "ΆΛΦΑ"}, {"жук", "ЖУК"},
      {"mypic", "MyPic"}};
  // clang-format on
  for (const auto &[a, b] : same)
    EXPECT_EQ(FoldName(a), FoldName(b)) << a;
  EXPECT_NE(FoldName("ärmel"), FoldName("armel"));
  EXPECT_TRUE(MatchesPattern("ÄRMEL.DAT", "ä*.dat"));
  EXPECT_TRUE(MatchesPattern("ä.txt", "?.TXT"));
  EXPECT_FALSE(MatchesPattern("ä.txt", "??.txt"));
  EXPECT_FALSE(MatchesPattern("ö.txt", "ä.txt"));
}

TEST(NameCase, AFolderIndexFindsEachFileThatFoldsLikeAWantedName) {
  // The Kelvin sign and the long s fold to ASCII letters of fewer bytes where Unicode folding
  // applies, so their names are no guide to their folded length or first letter.
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

TEST(NameCase, UnloadFindsACopyWhoseNameDiffersBeyondAscii) {
  GameFolder game;
  game.Addon("S-Cloth", {"ärmel.dat", "Öl.msn"});
  game.Write("ÄRMEL.DAT");
  game.Write("Savedata/öL.MSN");
  LibraryState state = LibraryFor(game.Path());
  RecordingCaption caption;
  Failures failures, notice;
  game.WithRecord("S-Cloth\r\n");
  MendRecordFromLedger(state, caption, notice);
  MoveOut(state, game.Library() / "S-Cloth", caption, failures);
  EXPECT_FALSE(game.Exists("ÄRMEL.DAT"));
  EXPECT_FALSE(game.Exists("Savedata/öL.MSN"));
  EXPECT_TRUE(failures.Empty());
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
  Gather(selector.StartUp());
  const SelectorState &state = selector.State();
  EXPECT_EQ(state.List3.back(), "Skins f\xC3\xBCr alle");
  EXPECT_EQ(RowNames(state.Unigrid, true), Names{"S-J\xC3\xA4ger [S]"});
  EXPECT_EQ(selector.HoverRow(0)->description,
            "\xE2\x80\x9CGr\xC3\xBCn\xE2\x80\x9D \xE2\x82\xAC\r\n");
  EXPECT_EQ(selector.MusicSets(failures).entries, Names{"Kl\xC3\xA4nge"});
  EXPECT_EQ(CleanUpNames(state, failures), Names{"alt.d\xC3\xA4t"});
  // Only the notice that the record from before the ledger gave the ledger.
  EXPECT_EQ(failures.Lines().size(), 1u) << failures.Message("");
}
