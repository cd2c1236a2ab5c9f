#include "base/listing.h"
#include "base/names.h"
#include "library/ledger_check.h"
#include "library/save_files.h"
#include "tests/selector_fixture.h"

#include <gtest/gtest.h>

namespace {

// Unloads a folder recorded loaded before the ledger was kept, as after the first start.
class Unloading : public LibraryTest {
protected:
  void UnloadRecorded(const std::string &folder) {
    game.WithRecord(folder + "\r\n");
    Failures notice;
    MendRecordFromLedger(state, caption, notice);
    Unload(folder);
  }
};

} // namespace

using Loading = LibraryTest;

TEST_F(Loading, PutsEachFileWhereTheGameLooksForIt) {
  game.MakeFolder("SAVEDATA");
  game.Write("TITLE.BMP", "old");
  for (const char *name :
       {"A.MSN", "b.sve", "C.BGM", "readme.txt", "title.bmp", "mypic", "Contents.TXT",
        "eca_note.dat", "model.ldr", "pic.jpg", "skin.PCX", "anim.gif"})
    game.Write(std::string("ZEP128/S-All/") + name, name);
  SetReadOnly(game.Path() / "ZEP128/S-All/readme.txt", true);
  Load("S-All");

  EXPECT_EQ(game.Read("SAVEDATA/A.MSN"), "A.MSN");
  EXPECT_EQ(game.Read("SAVEDATA/b.sve"), "b.sve");
  EXPECT_EQ(game.Read("Music/C.BGM"), "C.BGM");
  EXPECT_EQ(game.Read("readme.txt"), "readme.txt");
  // A read-only file would stop its own unload: the copy and the folder's file become writable.
  EXPECT_TRUE(IsWritable(game.Path() / "readme.txt"));
  EXPECT_TRUE(IsWritable(game.Path() / "ZEP128/S-All/readme.txt"));
  // The game's own file of that name in another case is replaced, not doubled.
  EXPECT_EQ(game.Read("TITLE.BMP"), "title.bmp");
  EXPECT_EQ(ListFiles(game.Path(), "title.bmp"), Names{"TITLE.BMP"});
  EXPECT_EQ(ListFolders(game.Path()).size(), 3u); // Music, SAVEDATA, ZEP128
  EXPECT_TRUE(game.None(
      {"mypic", "Contents.TXT", "eca_note.dat", "model.ldr", "pic.jpg", "skin.PCX", "anim.gif"}));
  EXPECT_TRUE(caption.Showed("Please wait- copying: :readme.txt"));
  ASSERT_EQ(caption.progress.size(), 5u);
  EXPECT_EQ(caption.progress.back(), std::make_pair(5, 5));
  EXPECT_EQ(caption.text, "Selector");
}

TEST_F(Loading, FileThatCannotBeCopiedIsSkippedAndReported) {
  for (const char *name : {"a.dat", "b.dat", "d.dat", "e.msn"})
    game.Write(std::string("ZEP128/S-Mix/") + name, "new");
  game.MakeFolder("b.dat"); // the destination is a folder
  game.Write("savedata");   // "Savedata" cannot be created
  Load("S-Mix");

  EXPECT_EQ(game.Read("a.dat"), "new");
  EXPECT_EQ(game.Read("d.dat"), "new");
  EXPECT_TRUE(fs::is_directory(game.Path() / "b.dat"));
  EXPECT_FALSE(game.Exists("b.dat.partial"));
  // Where letter case makes no difference, the file "savedata" is the folder "Savedata".
  const std::string message = Upper(Taken().Message(""));
  for (const char *failed : {"b.dat", "e.msn", "savedata"})
    EXPECT_NE(message.find(Upper(failed)), std::string::npos) << failed;
}

TEST_F(Loading, AFolderThatCannotBeListedIsNotLoadedAndSaysWhy) {
  game.Write("ZEP128/S-File"); // a file where the folder was: it cannot be listed
  EXPECT_FALSE(Load("S-File"));
  EXPECT_TRUE(OneFailure(Taken(), "cannot be listed"));
  EXPECT_FALSE(game.Exists("ZEP128/#Selector/journal.txt"));
}

TEST_F(Unloading, DeletesOnlyTheCopiesLoadingMade) {
  for (const char *name : {"a.msn", "c.bgm", "planes.dat", "gone.dat", "dup.dat", "contents.txt",
                           "mypic", "pic.jpg", "keep.sve", "ärmel.dat", "Öl.msn"})
    game.Write(std::string("ZEP128/S-Out/") + name);
  for (const char *name :
       {"Savedata/A.MSN", "Music/c.bgm", "PLANES.DAT", "dup.dat", "DUP.DAT", "contents.txt",
        "MYPIC", "pic.jpg", "Savedata/keep.sve", "ÄRMEL.DAT", "Savedata/öL.MSN"})
    game.Write(name);
  UnloadRecorded("S-Out");

  // Copies are found whatever their letter case, beyond ASCII too.
  EXPECT_TRUE(
      game.None({"Savedata/A.MSN", "Music/c.bgm", "PLANES.DAT", "ÄRMEL.DAT", "Savedata/öL.MSN"}));
  // Two files matching one name is no copy of ours; the game's own files and saves stay. Where
  // letter case makes no difference, "dup.dat" is one file, the copy.
  EXPECT_EQ(game.Exists("DUP.DAT"), IsCaseSensitive(game.Path()));
  EXPECT_TRUE(game.All({"contents.txt", "MYPIC", "pic.jpg", "Savedata/keep.sve"}));
  // gone.dat, deleted by hand, is no failure.
  EXPECT_TRUE(caption.Showed("Deleting PLANES.DAT"));
  EXPECT_EQ(caption.text, "Selector");
  EXPECT_EQ(game.Record(), "\r\n");
}

TEST(CampaignFolder, IsNamedByCAndABlankOrHyphenInItsOwnName) {
  EXPECT_TRUE(IsCampaignFolder("/games/ZEP128/C-War"));
  EXPECT_TRUE(IsCampaignFolder("/games/ZEP128/C War"));
  // A game installed below a folder named like a campaign keeps its saved games on unload.
  EXPECT_FALSE(IsCampaignFolder("/C-games/eaw/ZEP128/S-Sky"));
  EXPECT_FALSE(IsCampaignFolder("/games/ZEP128/Cwar"));
  EXPECT_FALSE(IsCampaignFolder("/games/ZEP128/c-war"));
}
