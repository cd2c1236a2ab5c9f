#include "base/new_file.h"
#include "library/grid_click.h"
#include "tests/selector_fixture.h"

#include <gtest/gtest.h>

using Refusals = SelectorTest;

TEST_F(Refusals, AFileTooLargeToBeSettingsIsNamedAndLeftAlone) {
  const std::string empties((1 << 20) + 1, '\n');
  game.Write("eaw.ini", empties);
  EXPECT_FALSE(selector->ReadSettings(failures)[0]);
  Gather(selector->SaveSettings({"1024"}));
  EXPECT_EQ(game.Read("eaw.ini"), empties);
  EXPECT_TRUE(OneFailure(Taken(), "eaw.ini: was not read: it is 1024 KB"));
}

TEST_F(Refusals, FoldersTheGameNeedsAreNoMusicSets) {
  game.Write("Music.ini", "zep128\r\nSAVEDATA\r\nmusic\r\nSet1\r\nSet2\r\n");
  game.Write("ZEP128/zep.ini", "Skins: S\r\n");
  game.Write("Savedata/a.sve");
  game.Write("Set1/a.bgm");
  game.Write("Music/b.bgm");
  const MusicList music = selector->MusicSets(failures);
  EXPECT_EQ(music.entries, Names{"Set1"});
  EXPECT_EQ(music.current, "Set2");
  EXPECT_FALSE(Gather(selector->SwitchMusic("Set2", "zep128")).done);
  EXPECT_FALSE(Gather(selector->SwitchMusic("Savedata", "Set1")).done);
  EXPECT_TRUE(game.All({"ZEP128/zep.ini", "Savedata/a.sve", "Music/b.bgm"}));
  const std::string refused = Taken().Message("");
  EXPECT_TRUE(Contains(refused, "\"zep128\" is a folder the game or this program needs"));
  EXPECT_TRUE(Contains(refused, "\"Savedata\" is a folder"));
}

TEST(Reasons, AFullDiskAHeldFileAndNamesWindowsCannotKeepAreCalledSo) {
  EXPECT_EQ(ReasonOf(std::make_error_code(std::errc::no_space_on_device)), "the disk is full");
#ifdef _WIN32
  EXPECT_EQ(ReasonOf(std::make_error_code(std::errc::permission_denied)),
            "in use by another program (is the game running?)");
#else
  EXPECT_EQ(ReasonOf(std::make_error_code(std::errc::permission_denied)),
            std::make_error_code(std::errc::permission_denied).message());
#endif
  const std::string device = "a name Windows reserves for a device";
  const std::string dotted = "a name Windows cannot keep (it ends in a dot or blank)";
  const std::pair<const char *, std::string> names[] = {
      {"CON", device},      {"nul.txt", device},  {"Com1.dat", device}, {"lpt9 .x", device},
      {"aux", device},      {"CONSOLE", ""},      {"COM10", ""},        {"COM0", ""},
      {"mission.", dotted}, {"mission ", dotted}, {"plain.dat", ""},    {".hidden", ""}};
  for (const auto &[name, problem] : names)
    EXPECT_EQ(WindowsNameProblem(name), problem) << name;

  // A folder Windows lists but cannot find by such a name says why it is not loaded.
  GameFolder game;
  game.WithCategories("Skins: S\r\n");
  LibraryState state = LibraryFor(game.Path());
  state.Unigrid.library = state.LibDir;
  state.Unigrid.rows.push_back(GridRow{"S-odd."});
  RecordingCaption caption;
  Failures failures;
  library::ClickRow(state, 0, caption, failures);
  EXPECT_TRUE(OneFailure(failures, "cannot be loaded: it has " + dotted));
}

TEST_F(Refusals, AFolderThatCouldNotBeLoadedAtAllIsNotMarkedLoaded) {
  game.WithCategories("Skins: S\r\n");
  game.Addon("S-a", {"a.dat"});
  Gather(selector->StartUp());
  game.MakeFolder("ZEP128/#Selector/journal.txt.partial"); // the journal cannot be written
  Click("S-a");
  EXPECT_EQ(Mark("S-a"), "");
  EXPECT_FALSE(game.Exists("a.dat"));
  EXPECT_EQ(game.Record(), "");
  EXPECT_TRUE(Contains(Taken().Message(""), "was not loaded"));
}
