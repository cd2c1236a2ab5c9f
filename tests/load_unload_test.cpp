#include "base/listing.h"
#include "base/names.h"
#include "library/ledger_check.h"
#include "library/move_in.h"
#include "library/move_out.h"
#include "library/save_files.h"
#include "tests/game_folder.h"

#include <gtest/gtest.h>

namespace {

// A game folder and a library state that loads and unloads its add-on folders.
struct Game {
  GameFolder folder;
  LibraryState state = LibraryFor(folder.Path());
  RecordingCaption caption;
  Failures failures;

  void Load(const std::string &name) { MoveIn(state, folder.Addon(name), caption, failures); }
  void Unload(const std::string &name) { MoveOut(state, folder.Addon(name), caption, failures); }
  // Unloads a folder recorded loaded before the ledger was kept, as after the first start.
  void UnloadRecorded(const std::string &name) {
    folder.WithRecord(name + "\r\n");
    Failures notice;
    MendRecordFromLedger(state, caption, notice);
    Unload(name);
  }
  bool Shown(const std::string &text) const { return caption.Showed(text); }
};

} // namespace

TEST(MoveIn, PutsEachFileWhereTheGameLooksForIt) {
  Game game;
  game.folder.MakeFolder("SAVEDATA");
  game.folder.Write("TITLE.BMP", "old");
  for (const char *name :
       {"A.MSN", "b.sve", "C.BGM", "readme.txt", "title.bmp", "mypic", "Contents.TXT",
        "eca_note.dat", "model.ldr", "pic.jpg", "skin.PCX", "anim.gif"})
    game.folder.Write(std::string("ZEP128/S-All/") + name, name);
  SetReadOnly(game.folder.Path() / "ZEP128/S-All/readme.txt", true);
  game.Load("S-All");

  EXPECT_EQ(game.folder.Read("SAVEDATA/A.MSN"), "A.MSN");
  EXPECT_EQ(game.folder.Read("SAVEDATA/b.sve"), "b.sve");
  EXPECT_EQ(game.folder.Read("Music/C.BGM"), "C.BGM");
  EXPECT_EQ(game.folder.Read("readme.txt"), "readme.txt");
  // A read-only file would stop its own unload: the copy and the folder's file become writable.
  EXPECT_TRUE(IsWritable(game.folder.Path() / "readme.txt"));
  EXPECT_TRUE(IsWritable(game.folder.Path() / "ZEP128/S-All/readme.txt"));
  // The game's own file of that name in another case is replaced, not doubled.
  EXPECT_EQ(game.folder.Read("TITLE.BMP"), "title.bmp");
  EXPECT_EQ(ListFiles(game.folder.Path(), "title.bmp"), Names{"TITLE.BMP"});
  EXPECT_EQ(ListFolders(game.folder.Path()).size(), 3u); // Music, SAVEDATA, ZEP128
  EXPECT_TRUE(game.folder.None(
      {"mypic", "Contents.TXT", "eca_note.dat", "model.ldr", "pic.jpg", "skin.PCX", "anim.gif"}));
  EXPECT_TRUE(game.Shown("Please wait- copying: :readme.txt"));
  ASSERT_EQ(game.caption.progress.size(), 5u);
  EXPECT_EQ(game.caption.progress.back(), std::make_pair(5, 5));
  EXPECT_EQ(game.caption.text, "Selector");
  EXPECT_TRUE(game.failures.Empty());
}

TEST(MoveIn, FileThatCannotBeCopiedIsSkippedAndReported) {
  Game game;
  for (const char *name : {"a.dat", "b.dat", "d.dat", "e.msn"})
    game.folder.Write(std::string("ZEP128/S-Mix/") + name, "new");
  game.folder.MakeFolder("b.dat"); // the destination is a folder
  game.folder.Write("savedata");   // "Savedata" cannot be created
  game.Load("S-Mix");

  EXPECT_EQ(game.folder.Read("a.dat"), "new");
  EXPECT_EQ(game.folder.Read("d.dat"), "new");
  EXPECT_TRUE(fs::is_directory(game.folder.Path() / "b.dat"));
  EXPECT_FALSE(game.folder.Exists("b.dat.partial"));
  // Where letter case makes no difference, the file "savedata" is the folder "Savedata".
  const std::string message = Upper(game.failures.Message(""));
  for (const char *failed : {"b.dat", "e.msn", "savedata"})
    EXPECT_NE(message.find(Upper(failed)), std::string::npos) << failed;
}

TEST(MoveIn, AFolderThatCannotBeListedIsNotLoadedAndSaysWhy) {
  Game game;
  game.folder.Write("ZEP128/S-File"); // a file where the folder was: it cannot be listed
  EXPECT_FALSE(MoveIn(game.state, game.folder.Library() / "S-File", game.caption, game.failures));
  EXPECT_TRUE(OneFailure(game.failures, "cannot be listed"));
  EXPECT_FALSE(game.folder.Exists("ZEP128/#Selector/journal.txt"));
}

TEST(MoveOut, DeletesOnlyTheCopiesLoadingMade) {
  Game game;
  for (const char *name : {"a.msn", "c.bgm", "planes.dat", "gone.dat", "dup.dat", "contents.txt",
                           "mypic", "pic.jpg", "keep.sve", "ärmel.dat", "Öl.msn"})
    game.folder.Write(std::string("ZEP128/S-Out/") + name);
  for (const char *name :
       {"Savedata/A.MSN", "Music/c.bgm", "PLANES.DAT", "dup.dat", "DUP.DAT", "contents.txt",
        "MYPIC", "pic.jpg", "Savedata/keep.sve", "ÄRMEL.DAT", "Savedata/öL.MSN"})
    game.folder.Write(name);
  game.UnloadRecorded("S-Out");

  // Copies are found whatever their letter case, beyond ASCII too.
  EXPECT_TRUE(game.folder.None(
      {"Savedata/A.MSN", "Music/c.bgm", "PLANES.DAT", "ÄRMEL.DAT", "Savedata/öL.MSN"}));
  // Two files matching one name is no copy of ours; the game's own files and saves stay. Where
  // letter case makes no difference, "dup.dat" is one file, the copy.
  EXPECT_EQ(game.folder.Exists("DUP.DAT"), IsCaseSensitive(game.folder.Path()));
  EXPECT_TRUE(game.folder.All({"contents.txt", "MYPIC", "pic.jpg", "Savedata/keep.sve"}));
  EXPECT_TRUE(game.failures.Empty()); // gone.dat was deleted by hand
  EXPECT_TRUE(game.Shown("Deleting PLANES.DAT"));
  EXPECT_EQ(game.caption.text, "Selector");
  EXPECT_EQ(game.folder.Record(), "\r\n");
}

TEST(MoveOut, CampaignIsNamedByCAndABlankOrHyphenInItsOwnName) {
  EXPECT_TRUE(IsCampaignFolder("/games/ZEP128/C-War"));
  EXPECT_TRUE(IsCampaignFolder("/games/ZEP128/C War"));
  // A game installed below a folder named like a campaign keeps its saved games on unload.
  EXPECT_FALSE(IsCampaignFolder("/C-games/eaw/ZEP128/S-Sky"));
  EXPECT_FALSE(IsCampaignFolder("/games/ZEP128/Cwar"));
  EXPECT_FALSE(IsCampaignFolder("/games/ZEP128/c-war"));
}
