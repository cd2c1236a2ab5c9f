#include "tests/selector_fixture.h"

#include <gtest/gtest.h>

namespace {

// A library of skins (one loaded at a time), sounds (any number) and campaigns; "n.wav" is in
// both sounds, "shared.dat" in a skin and a sound.
class Setups : public SelectorTest {
protected:
  void SetUp() override {
    game.WithGameFolders().WithCategories("Skins: S\r\nSounds: N\r\nCampaigns: C\r\n");
    game.Addon("S-a", {"a.dat", "orig.dat", "gone.dat", "m.msn", "contents.txt"});
    game.Addon("S-b", {"b.dat", "shared.dat"});
    game.Addon("N-x", {"x.wav"});
    game.Addon("N-y", {"y.wav"});
    game.Addon("C-one", {"one.msn"});
    game.Write("ZEP128/N-x/n.wav", "x");
    game.Write("ZEP128/N-y/n.wav", "y");
    game.Write("ZEP128/N-x/shared.dat", "x");
    game.Write("orig.dat", "the game's");
    Gather(selector->StartUp());
  }
  Names Loaded() { return selector->LoadedFolderNames(failures); }
  std::string Setup(const std::string &name) {
    return game.Read("ZEP128/#Selector/setups/" + name + ".txt");
  }
};

} // namespace

TEST_F(Setups, SaveKeepsLoadOrderAndSwitchingKeepsTheRulesAndGoesBack) {
  Click("N-y");
  Click("S-a");
  Click("N-x");
  EXPECT_EQ(Gather(selector->SaveSetup("Mine")).summary, "Saved 3 loaded folders as \"Mine\".");
  EXPECT_EQ(Setup("Mine"), "N-y\r\nS-a\r\nN-x\r\n");
  // Written by hand: a byte-order mark, trailing blanks, a blank line, two skins, a campaign, a
  // folder that is gone.
  game.Write("ZEP128/#Selector/setups/hand.TXT",
             "\xEF\xBB\xBFS-a\r\nN-x  \r\n\r\nN-Gone\nS-b\r\nC-one\r\nN-y");
  EXPECT_EQ(selector->Setups(), (Names{"hand", "Mine"}));
  const Outcome switched = Gather(selector->SwitchToSetup("hand"));
  EXPECT_EQ(switched.notice, "Only one folder of letter \"S\" can be loaded: \"S-b\" was "
                             "loaded, not \"S-a\".");
  ASSERT_EQ(Taken().Lines(), Names{"\"N-Gone\" is not in the library, so it was not loaded"});
  // N-y was loaded before N-x, against the setup's order: it goes and comes back after it.
  EXPECT_EQ(Loaded(), (Names{"N-x", "S-b", "C-one", "N-y"}));
  EXPECT_EQ(game.Read("n.wav"), "y");
  EXPECT_EQ(game.Read("shared.dat"), "shared.dat");
  EXPECT_FALSE(game.Exists("a.dat"));
  EXPECT_EQ(game.Read("orig.dat"), "the game's");
  EXPECT_EQ(switched.summary,
            "Switched to \"hand\": 3 folders unloaded, 4 loaded; 8 files copied, 7 deleted, "
            "2 put back.");

  Gather(selector->SwitchToSetup("Mine"));
  EXPECT_EQ(Loaded(), (Names{"N-y", "S-a", "N-x"}));
  EXPECT_EQ(game.Read("n.wav"), "x");
  EXPECT_EQ(game.Read("shared.dat"), "x");
  EXPECT_EQ(game.Read("orig.dat"), "orig.dat");
  EXPECT_FALSE(game.Exists("Savedata/one.msn"));
  EXPECT_EQ(game.Record(), "S-a\r\nN-x\r\nN-y\r\n\r\n");
}

TEST_F(Setups, ResetAllSavesTheWayBackAndSwitchingUndoesIt) {
  Click("S-a");
  Click("N-x");
  game.Write("ZEP128/#Selector/setups/Before Reset All.txt", "N-y\r\n");
  Gather(selector->ResetAll(selector->ResetAllFiles(failures)));
  EXPECT_EQ(Loaded(), Names{});
  EXPECT_EQ(game.Read("orig.dat"), "the game's");
  EXPECT_EQ(Setup("Before Reset All"), "S-a\r\nN-x\r\n");
  Gather(selector->SwitchToSetup("Before Reset All"));
  EXPECT_EQ(Loaded(), (Names{"S-a", "N-x"}));
  EXPECT_EQ(game.Read("orig.dat"), "orig.dat");
  EXPECT_EQ(game.Read("shared.dat"), "x");
  EXPECT_EQ(Gather(selector->SwitchToSetup("Before Reset All")).summary,
            "Switched to \"Before Reset All\": 0 folders unloaded, 0 loaded; no file changed.");
  EXPECT_TRUE(Gather(selector->DeleteSetup("before reset all")).done);
  EXPECT_EQ(selector->Setups(), Names{});
  EXPECT_FALSE(selector->DeleteSetup("Before Reset All").done);
  // A setup whose writing a crash cut short leaves its temporary file; the next start removes it.
  game.Write("ZEP128/#Selector/setups/Before Reset All.txt.partial", "S-a\r\n");
  Restart();
  EXPECT_FALSE(game.Exists("ZEP128/#Selector/setups/Before Reset All.txt.partial"));
}

TEST_F(Setups, HostileSetupsAndNamesAreRefusedWhole) {
  Click("S-a");
  std::string many;
  for (int i = 0; i <= 10000; ++i)
    many += "N-x\r\n";
  for (const std::string &bytes :
       {std::string("N-x\r\n..\r\n"), std::string("N-x\r\nS-b/../S-a"), std::string("..\\S-b"),
        std::string("N-x\r\nC:S-b"), std::string("N-x\r\nnul.txt"), many,
        "N-x\r\n" + std::string(1 << 20, ' ')}) {
    game.Write("ZEP128/#Selector/setups/bad.txt", bytes);
    const Outcome refused = selector->SwitchToSetup("bad");
    EXPECT_EQ(refused.notice, "");
    EXPECT_TRUE(Contains(refused.failures.HeadingOr(""), "The setup \"bad\" was not used"));
    EXPECT_EQ(Loaded(), Names{"S-a"});
  }
  for (const char *name : {"", "..", "a/b", "a\\b", "CON", "lpt1.x", "x?", "a*", "<b>", "dot."})
    EXPECT_FALSE(selector->SaveSetup(name).done) << name;
  EXPECT_EQ(selector->Setups(), Names{"bad"});
}

TEST_F(Setups, FilesOfAFolderSayWhereEachStandsAndWhoElseHasIt) {
  const auto files = [&](const std::string &folder) {
    return selector->FolderFiles(RowOf(selector->State().Unigrid, folder), failures);
  };
  const auto states = [&](const std::string &folder) {
    Names lines;
    for (const FolderFile &file : files(folder).files)
      lines.push_back(file.name + " " + PlaceText(file.place) + ": " + FileStateText(file));
    return lines;
  };
  EXPECT_EQ(files("S-b").files[1].alsoIn, Names{"N-x"});
  EXPECT_EQ(files("S-b").conflicts, (std::vector<std::pair<std::string, int>>{{"N-x", 1}}));
  Click("N-x");
  EXPECT_EQ(states("S-b"),
            (Names{"b.dat game folder: not loaded",
                   "shared.dat game folder: not loaded; a load replaces \"N-x\"'s copy"}));
  EXPECT_EQ(Click("S-b").notice, "\"S-b\" replaced files of \"N-x\", which stay loaded. Unloading "
                                 "\"S-b\" puts their files back.\nshared.dat, \"N-x\"'s copy");
  Click("N-x");
  Click("N-x");
  EXPECT_EQ(states("S-b"), (Names{"b.dat game folder: loaded",
                                  "shared.dat game folder: replaced by \"N-x\", loaded later"}));
  EXPECT_EQ(states("S-a")[3], "orig.dat game folder: not loaded; a load replaces the game's file "
                              "(and keeps it)");
  Click("S-a");
  std::filesystem::remove(game.Path() / "gone.dat");
  EXPECT_EQ(states("S-a"),
            (Names{"a.dat game folder: loaded", "gone.dat game folder: missing from the game",
                   "m.msn Savedata: loaded",
                   "orig.dat game folder: loaded, replaces the game's original "
                   "(kept in the keeping folder)"}));
}
