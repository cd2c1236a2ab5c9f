#pragma once

#include <filesystem>
#include <string>
#include <utility>
#include <vector>

// A generated game folder for the benchmark: "Savedata", and a library with its category file.
struct BenchGame {
  std::filesystem::path game;
  std::filesystem::path library;
};

// A numbered name, zero-padded so that name order is the order of creation.
std::string Numbered(const char *stem, int number, const char *extension);
// Writes a file of `size` bytes; the benchmark stops with a message when that fails.
void WriteBytes(const std::filesystem::path &path, size_t size);
// A game folder at `root/name` with the category file `categories`, holding `ownFiles` empty
// files of its own that no clean-up pattern matches.
BenchGame MakeGame(const std::filesystem::path &root, const std::string &name,
                   const std::string &categories, int ownFiles);
// The add-on folder `name` in the library with `count` small files, every tenth a mission;
// returns each file with where a load puts it.
std::vector<std::pair<std::filesystem::path, std::filesystem::path>>
MakeAddon(const BenchGame &game, const std::string &name, int count);
