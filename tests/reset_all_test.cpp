#include "library/reset_all.h"

#include "app/startup.h"
#include "base/listing.h"
#include "library/record_replay.h"
#include "tests/selector_fixture.h"

#include <gtest/gtest.h>

namespace {

// The game folder of the usual example, a few more names, and a library with one loaded folder.
class ResetAll : public LibraryTest {
protected:
  void SetUp() override {
    for (const char *name : {"planes.dat", "hof.dat", "readme.txt", "chatline.txt", "pic1.bmp",
                             "title.bmp", "dsg.ico", "eaw.exe", "mypic", "Extra.Spt",
                             "Savedata/a.dat", "old.dat/inside.txt", "ZEP128/S-Camo/a.txt"})
      game.Write(name);
    game.WithCategories("Skins: S\r\n");
    game.WithRecord("S-Camo\r\n\r\n");
  }
};

} // namespace

TEST_F(ResetAll, DeletesAddOnFilesEmptiesTheRecordAndUnmarksEveryRow) {
  BuildGrid(state, LibraryCategories(state.LibDir, failures).codes);
  ReplayRecord(state, failures);
  ASSERT_TRUE(state.Unigrid.Row(0).loaded);
  state.Slots.frameVisible = true;
  // One name per default pattern ("P.bmp": a star matching an empty run), and names that only
  // look alike. (".bgm" would do too, but Wine hides names that start with a dot.)
  for (const char *name :
       {"a.bgm", "a.fnt",    "a.wsd",   "a.fsp", "a.pal", "a.bak",     "a.tco", "a.pco", "a.bco",
        "a.hm",  "a.jpg",    "a.pcx",   "a.txt", "a.mnu", "a.mpc",     "a.wsp", "a.pic", "a.str",
        "a.ter", "a.tm",     "a.tpc",   "a.flt", "a.3dz", "a.snd",     "a.bil", "a.bin", "a.cpt",
        "P.bmp", "planepic", "skinpic", "a.smk", "a.spt", "mypicture", "a.tmx"})
    game.Write(name);

  for (int time = 0; time < 2; ++time) {
    ::ResetAll(state, CleanUpNames(state, failures), caption, failures);
    EXPECT_EQ(ListFiles(game.Path()), (Names{"a.tmx", "chatline.txt", "dsg.ico", "eaw.exe",
                                             "Extra.Spt", "hof.dat", "mypicture", "title.bmp"}));
    EXPECT_TRUE(game.All({"Savedata/a.dat", "old.dat/inside.txt", "ZEP128/S-Camo/a.txt",
                          "ZEP128/FoldersLoaded.txt"}));
    EXPECT_EQ(game.Record(), "");
  }
  EXPECT_EQ(caption.shown.front(), "Please wait... cleaning up");
  EXPECT_EQ(caption.text, "Selector");
  EXPECT_FALSE(state.Unigrid.Row(0).loaded);
  EXPECT_FALSE(state.Slots.frameVisible);
}

TEST_F(ResetAll, FirstLineOfCleanUpIniReplacesTheDefaultUnlessBlank) {
  game.Write("ZEP128/cleanup.INI", "*.dat\r\n*.txt\r\n");
  EXPECT_EQ(CleanUpNames(state, failures), (Names{"planes.dat"}));
  for (const char *blank : {"", "  \t\r\n*.dat", "\r\n*.dat"}) {
    game.Write("ZEP128/cleanup.INI", blank);
    EXPECT_EQ(CleanUpNames(state, failures),
              (Names{"mypic", "pic1.bmp", "planes.dat", "readme.txt"}));
  }
}

TEST_F(ResetAll, AFileThatCannotBeDeletedIsSkippedAndNamed) {
  const Names names = CleanUpNames(state, failures);
  // Something took the file's place after the listing: a folder that is not empty stays put.
  fs::remove(game.Path() / "pic1.bmp");
  game.Write("pic1.bmp/keep.txt");
  ::ResetAll(state, names, caption, failures);
  EXPECT_TRUE(game.None({"mypic", "readme.txt"}));
  EXPECT_TRUE(OneFailure(Taken(), "pic1.bmp"));
}
