#include "app/selector.h"
#include "base/names.h"
#include "tests/game_folder.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <random>
#include <sstream>

using namespace std::string_literals;

namespace {

// A game folder "game" inside a larger temporary folder, beside the "outside" files that hostile
// names in the program's own files aim at.
class OuterGame : public ::testing::Test {
protected:
  void SetUp() override {
    for (const char *file : {"ZEP128/N-One/planes.dat", "ZEP128/N-Two/sky.spt", "Savedata/a.msn",
                             "Music/a.bgm", "Set1/b.bgm"})
      outer.Write(std::string("game/") + file);
    outer.Write("game/ZEP128/zep.ini", "Sounds: N\r\n");
    outer.Write("game/Music.ini", "Set1\r\nSet2\r\n");
    for (const char *file : {"outside/victim.dat", "outside/left.partial", "outside/victim/in.dat"})
      outer.Write(file, "outside");
    before = Snapshot(outer.Path(), "game");
  }
  // Writes the program's own file `name`; with both folders recorded loaded.
  void WriteState(const std::string &name, const std::string &bytes) const {
    outer.Write("game/ZEP128/FoldersLoaded.txt", "N-One\r\nN-Two\r\n");
    outer.Write("game/ZEP128/#Selector/" + name, bytes);
  }
  // Starts the program, unloads every loaded folder and resets all.
  void StartAndUnloadAll() {
    Selector selector(game, caption, starter);
    failures.Append(selector.StartUp().failures);
    for (int row = 0; row < selector.State().Unigrid.RowCount(); ++row)
      if (IsLoaded(selector.State().Unigrid.Row(row)))
        failures.Append(selector.ClickRow(row).failures);
    failures.Append(selector.ResetAll(selector.ResetAllFiles(failures)).failures);
  }
  std::string Absolute(const std::string &relative) const {
    return DisplayPath(outer.Path() / relative);
  }

  TestFolder outer;
  fs::path game = outer.Path() / "game";
  std::map<std::string, std::string> before;
  RecordingCaption caption;
  NotingStarter starter;
  Failures failures;
};

// A line of one of the program's files that takes a name, and the name that aims outside from
// where it is taken.
struct StateLine {
  const char *file;
  const char *before; // the file up to the name
  std::string aim;
};

class HostileName : public OuterGame, public ::testing::WithParamInterface<StateLine> {};

} // namespace

TEST_P(HostileName, IsRefusedWithItsFileAndLineAndTouchesNothingOutside) {
  const StateLine &state = GetParam();
  const std::string line = std::to_string(1 + std::ranges::count(std::string(state.before), '\n'));
  for (const std::string &name :
       {state.aim, Absolute(state.aim.substr(state.aim.find_first_not_of("./"))), "nul.txt"s}) {
    // A music journal acts only when the game has no music folder.
    fs::remove_all(game / "Music");
    WriteState(state.file, state.before + name + "\r\n");
    StartAndUnloadAll();
    EXPECT_EQ(Snapshot(outer.Path(), "game"), before) << name;
    EXPECT_TRUE(Contains(failures.Message(""), DisplayPath(game / "ZEP128/#Selector" / state.file) +
                                                   ": line " + line + " was ignored"));
    failures = {};
  }
}

INSTANTIATE_TEST_SUITE_P(
    StateFiles, HostileName,
    ::testing::Values(StateLine{"journal.txt", "unload\r\nN-One\r\n\tG-", "../outside/victim.dat"},
                      StateLine{"journal.txt", "load\r\n", "../../outside"},
                      StateLine{"loaded.txt", "N-One\r\n\tG ", "../outside/victim.dat"},
                      StateLine{"loaded.txt", "", "../../outside"},
                      StateLine{"music.txt", "Music\r\nSet1\r\n", "../outside/victim"}));

TEST_F(OuterGame, RandomStateFilesTouchNothingOutsideTheGameFolder) {
  // Pieces of names, between "|": the first seven aim outside the game folder; the others are
  // drives, devices, control bytes, long names and names of the game.
  std::vector<std::string> pieces = {Absolute("outside"), Absolute("outside/victim.dat")};
  std::istringstream list(
      "../outside/victim.dat|..\\outside\\victim.dat|../../outside|"
      "../outside/victim|../../outside/victim.dat|..|C:victim.dat|/|\\|NUL|"
      "con.txt|COM1|\t|victim.dat|planes.dat|N-One|Music|Set1|.| |left.partial");
  for (std::string piece; std::getline(list, piece, '|');)
    pieces.push_back(piece);
  pieces.insert(pieces.end(), {std::string(1, '\0'), std::string(300, 'x')});
  std::mt19937 random(18);
  const auto pick = [&](size_t count) { return random() % count; };
  // A name and its line end: half aim outside whole; the others join one to three pieces.
  const auto nameLine = [&] {
    std::string text = pick(2) ? pieces[pick(7)] : "";
    for (size_t count = text.empty() ? 1 + pick(3) : 0; count > 0; --count)
      text += pieces[pick(pieces.size())];
    return text + "\r\n";
  };
  const auto fileLines = [&](size_t count) {
    std::string text;
    for (; count > 0; --count)
      text += std::string("\t") + "GGSMX"[pick(5)] + "+- "[pick(3)] + nameLine();
    return text;
  };
  const std::string steps[] = {"load\r\n", "loaded\r\n", "unload\r\n", "reset\r\n", "restore\r\n"};
  for (int round = 0; round < 40; ++round) {
    if (pick(2) == 0)
      fs::remove_all(game / "Music");
    WriteState("journal.txt", steps[pick(5)] + nameLine() + fileLines(pick(6)));
    WriteState("loaded.txt", "N-One\r\n" + fileLines(pick(4)) + nameLine() + fileLines(pick(4)) +
                                 "N-Two\r\n" + fileLines(pick(4)));
    WriteState("music.txt", (pick(2) ? "Music\r\n" : nameLine()) + nameLine() + nameLine());
    StartAndUnloadAll();
    ASSERT_EQ(Snapshot(outer.Path(), "game"), before) << "round " << round;
  }
}
