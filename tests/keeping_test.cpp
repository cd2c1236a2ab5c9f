#include "base/names.h"
#include "base/step_seam.h"
#include "library/keeping.h"
#include "tests/selector_fixture.h"

#include <gtest/gtest.h>

namespace {

// A game whose library has three sound folders (several may be loaded) that share "sky.spt",
// and the game's own "bases.dat" that two of them replace.
class Keeping : public SelectorTest {
protected:
  void SetUp() override {
    game.WithGameFolders().WithCategories("Sounds: N\r\nSkins: S\r\n");
    for (const char *folder : {"N-A", "N-B", "N-C"})
      game.Write(std::string("ZEP128/") + folder + "/sky.spt", folder);
    game.Write("ZEP128/N-A/bases.dat", "bases of A");
    game.Write("ZEP128/N-B/BASES.DAT", "bases of B");
    game.Write("ZEP128/N-A/a.msn", "mission of A");
    game.Write("bases.dat", kOriginal);
    game.Write("Savedata/a.msn", "the player's mission");
    Restart();
  }
  static inline const std::string kOriginal = std::string("the game's own\0\xff bases", 23);
};

} // namespace

TEST_F(Keeping, AnUnloadPutsBackTheFileOfTheFolderLoadedLast) {
  EXPECT_EQ(Click("N-A").notice, "");
  EXPECT_EQ(Click("N-B").notice, "\"N-B\" replaced files of \"N-A\", which stay loaded. Unloading "
                                 "\"N-B\" puts their files back.\nbases.dat, \"N-A\"'s copy\n"
                                 "sky.spt, \"N-A\"'s copy");
  EXPECT_TRUE(Contains(Click("N-C").notice, "replaced files of \"N-B\", which"));
  EXPECT_EQ(game.Read("sky.spt"), "N-C");
  Click("N-C");
  EXPECT_EQ(game.Read("sky.spt"), "N-B");
  Restart();
  Click("N-A");
  EXPECT_EQ(game.Read("sky.spt"), "N-B");
  Click("N-B");
  EXPECT_FALSE(game.Exists("sky.spt"));
  EXPECT_EQ(game.Read("bases.dat"), kOriginal);
}

TEST_F(Keeping, TheGamesOwnFilesComeBackWhenTheLastFolderGoesAndAfterAReset) {
  EXPECT_EQ(Click("N-A").summary, "Loaded \"N-A\": 3 files copied.");
  EXPECT_EQ(game.Read("bases.dat"), "bases of A");
  EXPECT_EQ(game.Read("Savedata/a.msn"), "mission of A");
  Restart(); // the kept originals outlast the program
  Click("N-B");
  Click("N-A");
  EXPECT_EQ(game.Read("bases.dat"), "bases of B");
  EXPECT_EQ(game.Read("Savedata/a.msn"), "the player's mission");
  EXPECT_EQ(Click("N-B").summary, "Unloaded \"N-B\": 1 file deleted, 1 put back.");
  EXPECT_EQ(game.Read("bases.dat"), kOriginal);

  Click("N-A");
  Click("N-B");
  // The loaded folders' files are counted, not listed among the other matches.
  EXPECT_EQ(selector->ResetAllFiles(failures), Names{});
  EXPECT_EQ(selector->ResetAllLoadedFiles(failures), 3);
  // Gone while the player was asked: neither a failure nor a deletion.
  fs::remove(game.Path() / "sky.spt");
  EXPECT_EQ(Gather(selector->ResetAll({})).summary, "Reset All: 2 files put back.");
  EXPECT_EQ(game.Read("bases.dat"), kOriginal);
  EXPECT_EQ(game.Read("Savedata/a.msn"), "the player's mission");
  EXPECT_FALSE(game.Exists("sky.spt"));
  EXPECT_EQ(Mark("N-A") + Mark("N-B"), "");
}

TEST_F(Keeping, TheNextStartRollsAnInterruptedLoadBack) {
  // Killed after keeping the original and half way through the copies.
  game.Write("ZEP128/#Selector/journal.txt",
             "load\r\nN-A\r\n\tG+bases.dat\r\n\tG-sky.spt\r\n\tS+a.msn\r\n");
  game.MakeFolder("ZEP128/#Selector/originals/G");
  fs::rename(game.Path() / "bases.dat", game.Path() / "ZEP128/#Selector/originals/G/bases.dat");
  game.Write("sky.spt", "N-A");
  game.Write("bases.dat.partial", "bases o");
  game.Write("ZEP128/FoldersLoaded.txt.partial", "N-A\r\n");
  game.WithRecord("N-A\r\n\r\n");
  Restart();
  EXPECT_EQ(game.Read("bases.dat"), kOriginal);
  EXPECT_EQ(game.Read("Savedata/a.msn"), "the player's mission");
  EXPECT_TRUE(
      game.None({"sky.spt", "bases.dat.partial", "ZEP128/FoldersLoaded.txt.partial",
                 "ZEP128/#Selector/journal.txt", "ZEP128/#Selector/originals/G/bases.dat"}));
  EXPECT_EQ(Mark("N-A"), "");
  EXPECT_EQ(game.Record(), "\r\n");
}

// Kills inside loads, unloads and Reset All are swept step by step in crash_steps_test.cpp.
TEST_F(Keeping, TheNextStartFinishesAnInterruptedMusicSwitch) {
  game.Write("Music/a.bgm", "active");
  game.Write("Set1/b.bgm", "chosen");
  game.Write("ZEP128/#Selector/music.txt", "Music\r\nSet0\r\nSet1\r\n");
  fs::rename(game.Path() / "Music", game.Path() / "Set0");
  Restart();
  EXPECT_EQ(game.Read("Music/b.bgm"), "chosen");
  EXPECT_EQ(game.Read("Set0/a.bgm"), "active");
  EXPECT_FALSE(game.Exists("ZEP128/#Selector/music.txt"));
}

TEST_F(Keeping, AFolderGoneFromTheLibraryOrPartlyLoadedIsSaidSo) {
  fs::remove_all(game.Path() / "ZEP128/N-C");
  Click("N-C");
  EXPECT_EQ(Mark("N-C"), "");
  EXPECT_TRUE(OneFailure(Taken(), "is no longer in the library"));

  game.MakeFolder("sky.spt.partial/in the way");
  game.MakeFolder("sky.spt/in the way");
  const Failures partly = Click("N-B").failures;
  EXPECT_EQ(Mark("N-B"), "S");
  EXPECT_EQ(partly.Lines().size(), 1u);
  EXPECT_EQ(partly.HeadingOr("").find("\"N-B\" is only partly loaded"), 0u);
  Taken();
}

TEST_F(Keeping, ACopyThatFailsAfterItsOriginalWasKeptPutsTheOriginalBackAtOnce) {
  // The source goes (held by another program, a failing disk) just after the original was kept.
  SetStepHook([&] {
    if (game.Exists("ZEP128/#Selector/originals/G/bases.dat"))
      fs::remove(game.Path() / "ZEP128/N-A/bases.dat");
  });
  Click("N-A");
  SetStepHook({});
  EXPECT_EQ(game.Read("bases.dat"), kOriginal);
  EXPECT_TRUE(Contains(Taken().Message(""), "bases.dat: is the game's own file again"));
  Click("N-A");
  EXPECT_EQ(game.Read("bases.dat"), kOriginal);
}

TEST_F(Keeping, ACopyThatCannotBeDeletedStaysListedIsTriedAgainAndIsNoOriginal) {
#ifdef _WIN32
  GTEST_SKIP() << "a folder in a file's way behaves otherwise under Wine; the Windows tests hold "
                  "the copy open instead";
#endif
  for (int time = 0; time < 2; ++time) {
    Click("N-C");
    // The game holds sky.spt open; here something that cannot be deleted takes its place.
    fs::remove(game.Path() / "sky.spt");
    game.Write("sky.spt/held");
    Click("N-C");
    EXPECT_TRUE(OneFailure(Taken(), "sky.spt"));
    fs::remove_all(game.Path() / "sky.spt");
    game.Write("sky.spt", "N-C"); // released
    if (time == 0) {
      Click("N-B"); // a load over it must not keep it as the game's own file
      Restart();    // nor may a start take the loaded copy for the leftover
      EXPECT_EQ(game.Read("sky.spt"), "N-B");
      Click("N-B");
    } else {
      Restart();
    }
    EXPECT_FALSE(game.Exists("sky.spt")) << time;
  }
}

TEST_F(Keeping, AnOldRecordGivesTheLedgerOnceAndTheLedgerWinsAtEveryStart) {
  game.Addon("S-X", {"x.dat"});
  game.Addon("S-Y", {"y.dat"});
  game.Write("x.dat");
  game.Write("y.dat");
  game.Write("sky.spt", "N-A");
  game.WithRecord("N-A\r\nS-X\r\nS-Y\r\n\r\n");
  Restart();
  EXPECT_TRUE(OneFailure(Taken(), "earlier version"));
  // Two folders of a one-per-category letter have copies in the game: both show loaded.
  EXPECT_EQ(Mark("N-A") + Mark("S-X") + Mark("S-Y"), "SSS");
  Restart(); // the ledger now says so, without a word
  Click("S-X");
  Click("S-Y");
  EXPECT_FALSE(game.Exists("x.dat") || game.Exists("y.dat"));

  game.WithRecord("N-B\r\n\r\n");
  Restart();
  EXPECT_EQ(Mark("N-A") + "|" + Mark("N-B"), "S|");
  EXPECT_TRUE(OneFailure(Taken(), "\"N-A\" is loaded. \"N-B\" is not loaded."));
  game.WithRecord("\r\n");
  Restart();
  EXPECT_EQ(Mark("N-A"), "S");
  EXPECT_TRUE(OneFailure(Taken(), "\"N-A\" is loaded."));
  Click("N-A");
  EXPECT_FALSE(game.Exists("sky.spt"));
}

TEST_F(Keeping, ResetAllUnloadsEveryFolderInEveryPlaceThenDeletesTheOtherMatches) {
  game.Write("ZEP128/N-A/notes.xyz", "matches no pattern");
  game.Write("ZEP128/N-A/tune.bgm", "A tune");
  Click("N-A");
  Click("N-B");
  game.Write("readme.txt", "another match");
  EXPECT_EQ(selector->ResetAllFiles(failures), Names{"readme.txt"});
  EXPECT_EQ(selector->ResetAllLoadedFiles(failures), 5);
  Gather(selector->ResetAll({"readme.txt"}));
  EXPECT_TRUE(game.None({"notes.xyz", "Music/tune.bgm", "sky.spt", "readme.txt"}));
  EXPECT_EQ(game.Read("bases.dat"), kOriginal);
  EXPECT_EQ(game.Read("Savedata/a.msn"), "the player's mission");
  Click("N-A"); // a load and an unload after a Reset All
  Click("N-A");
  EXPECT_EQ(game.Read("bases.dat"), kOriginal);
}

TEST_F(Keeping, AKeptOriginalIsNeverOverwrittenAndAFolderThatLeftTheLibraryStillUnloads) {
  game.Write("ZEP128/#Selector/originals/G/bases.dat", "kept before");
  Click("N-A");
  EXPECT_EQ(game.Read("bases.dat"), kOriginal);
  EXPECT_EQ(game.Read("ZEP128/#Selector/originals/G/bases.dat"), "kept before");
  EXPECT_TRUE(OneFailure(Taken(), "bases.dat: not copied"));
  fs::remove_all(game.Path() / "ZEP128/N-A");
  Click("N-A");
  EXPECT_FALSE(game.Exists("sky.spt"));
  EXPECT_EQ(game.Read("Savedata/a.msn"), "the player's mission");
}

TEST_F(Keeping, WhatCouldNotBeTakenOutStaysListedThroughCrashes) {
#ifdef _WIN32
  GTEST_SKIP() << "a folder in a file's way behaves otherwise under Wine";
#endif
  game.Write("ZEP128/N-C/c.dat", "C");
  Click("N-A");
  Click("N-C");
  for (const std::string name : {"bases.dat", "c.dat"}) { // the game holds them open
    fs::remove(game.Path() / name);
    game.Write(name + "/held");
  }
  SetStepHook([] { throw 0; });
  EXPECT_ANY_THROW(Click("N-C")); // killed once its journal is written
  SetStepHook({});
  Restart();                             // nor can the recovery delete c.dat
  Click("N-A");                          // nor put back the original of bases.dat
  EXPECT_EQ(Taken().Lines().size(), 2u); // each named once
  for (const std::string name : {"bases.dat", "c.dat"}) {
    fs::remove_all(game.Path() / name);
    game.Write(name, "a copy, released");
  }
  int steps = 0;
  SetStepHook([&steps] {
    if (++steps == 2)
      throw 0;
  });
  EXPECT_ANY_THROW(Restart()); // killed once the original is back, before the ledger says so
  SetStepHook({});
  Restart();
  EXPECT_EQ(game.Read("bases.dat"), kOriginal);
  EXPECT_FALSE(game.Exists("c.dat"));
}
