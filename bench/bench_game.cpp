#include "bench/bench_game.h"

#include <algorithm>
#include <cstdio>
#include <cstdlib>
#include <fstream>

namespace fs = std::filesystem;

std::string Numbered(const char *stem, int number, const char *extension) {
  char text[64];
  std::snprintf(text, sizeof text, "%s%06d%s", stem, number, extension);
  return text;
}

void WriteBytes(const fs::path &path, size_t size) {
  static const std::string block(64 * 1024, 'z');
  std::ofstream out(path, std::ios::binary);
  for (size_t left = size; left > 0; left -= std::min(left, block.size()))
    out.write(block.data(), static_cast<std::streamsize>(std::min(left, block.size())));
  if (!out) {
    std::fprintf(stderr, "cannot write %s\n", path.string().c_str());
    std::exit(1);
  }
}

BenchGame MakeGame(const fs::path &root, const std::string &name, const std::string &categories,
                   int ownFiles) {
  BenchGame made{root / name, root / name / "ZEP128"};
  // As in every installed game: without them, each click would look for them in another letter
  // case, listing the game folder.
  fs::create_directories(made.game / "Savedata");
  fs::create_directories(made.game / "Music");
  fs::create_directories(made.library);
  std::ofstream(made.library / "zep.ini", std::ios::binary) << categories;
  for (int i = 0; i < ownFiles; ++i)
    WriteBytes(made.game / Numbered("own", i, ".own"), 0);
  return made;
}

std::vector<std::pair<fs::path, fs::path>> MakeAddon(const BenchGame &game, const std::string &name,
                                                     int count) {
  constexpr size_t kSmallSize = 2 * 1024;
  const fs::path folder = game.library / name;
  fs::create_directories(folder);
  std::vector<std::pair<fs::path, fs::path>> copies;
  for (int i = 0; i < count; ++i) {
    const bool mission = i % 10 == 0;
    const std::string file = Numbered("small", i, mission ? ".msn" : ".dat");
    WriteBytes(folder / file, kSmallSize);
    copies.emplace_back(folder / file, (mission ? game.game / "Savedata" : game.game) / file);
  }
  return copies;
}
