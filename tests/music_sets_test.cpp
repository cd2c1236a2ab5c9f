#include "settings/music_sets.h"
#include "settings/music_switch.h"
#include "tests/selector_fixture.h"

#include <gtest/gtest.h>

namespace {

// Set1 and Set2 have folders of their own; Set3 is the game's "Music".
void MakeThreeSets(const TestFolder &game) {
  game.Write("MUSIC.INI", "Set1\r\nSet2\r\nSet3\r\n");
  game.Write("Set1/a.bgm", "1");
  game.Write("Set2/a.bgm", "2");
  game.Write("Music/a.bgm", "3");
}

std::filesystem::path Journal(const TestFolder &game) { return game.Path() / "ZEP128/journal"; }

void ExpectUntouched(const TestFolder &game) {
  EXPECT_EQ(game.Read("Set1/a.bgm") + game.Read("Set2/a.bgm") + game.Read("Music/a.bgm"), "123");
  EXPECT_FALSE(game.Exists("Set3"));
}

} // namespace

using MusicSets = GameTest;

TEST_F(MusicSets, ListsSetsWithFoldersAndShowsTheLastOneWithoutAsCurrent) {
  EXPECT_TRUE(FillMusicList(game.Path(), failures).entries.empty());
  MakeThreeSets(game);
  EXPECT_EQ(FillMusicList(game.Path(), failures).entries, (Names{"Set1", "Set2"}));
  game.Write("Music.ini", "Set1\n..\n.\n \n\nC:x\na/b\na\\b\nGone\nSet2\nSet3\nset1");
  MusicList list = FillMusicList(game.Path(), failures);
  EXPECT_EQ(list.entries, (Names{"Set1", "Set2", "set1"}));
  EXPECT_EQ(list.current, "Set3");
  game.MakeFolder("Set3");
  EXPECT_EQ(FillMusicList(game.Path(), failures).current, "Gone");
  // "..", ".", "C:x" (another drive on Windows), "a/b" and "a\b", each once.
  ASSERT_EQ(failures.Lines().size(), 5u) << failures.Message("");
  EXPECT_TRUE(Contains(Taken().Lines()[2], "Music.ini: line 6 was ignored: \"C:x\" is a path"));
}

TEST_F(MusicSets, AFailedSwitchChangesNoFolderAndSaysSo) {
  MakeThreeSets(game);
  game.Write("NotAFolder", "file");
  EXPECT_FALSE(SwitchMusic(game.Path(), "Set3", "NotAFolder", Journal(game), failures));
  EXPECT_FALSE(SwitchMusic(game.Path(), "", "Set1", Journal(game), failures));
  EXPECT_FALSE(SwitchMusic(game.Path(), "Set2", "Set1", Journal(game), failures)); // Set2 is taken
  EXPECT_FALSE(SwitchMusic(game.Path(), "Set3", "..", Journal(game), failures));
  EXPECT_EQ(Taken().Lines().size(), 4u);
  ExpectUntouched(game);
  // Where letter case tells folders apart, a second "MUSIC" would leave the game without music.
  if (IsCaseSensitive(game.Path())) {
    game.MakeFolder("MUSIC");
    EXPECT_FALSE(SwitchMusic(game.Path(), "Set3", "Set1", Journal(game), failures));
    EXPECT_TRUE(OneFailure(Taken(), "MUSIC is in the way"));
    ExpectUntouched(game);
  }
  EXPECT_FALSE(game.Exists("ZEP128/journal"));
}
