#pragma once

#include "base/failures.h"
#include "library/file_rules.h"
#include "library/library_state.h"

#include <string>
#include <utility>
#include <vector>

// Where a file of an add-on folder stands in the game now.
enum class FileState {
  NotLoaded,        // the folder is not loaded, or this file was not copied
  Loaded,           // this folder's copy is in the game
  ReplacesOriginal, // this folder's copy is in the game, the game's original is kept
  ReplacedBy,       // a folder loaded later put its copy in its place
  Missing,          // the folder is loaded, but the game has no file of that name
};

// One file of an add-on folder that a load copies into the game.
struct FolderFile {
  std::string name;
  Place place = Place::Game;
  FileState state = FileState::NotLoaded;
  // ReplacedBy: the folder whose copy is in the game. NotLoaded: the loaded folder whose copy a
  // load would replace, "" for none.
  std::string other;
  bool gameHasOne = false;         // the game has a file of this name and place
  std::vector<std::string> alsoIn; // the other folders of the library with a file of this name
};

// What a folder's load changes: its files and the other folders that provide the same names.
struct FolderFileList {
  std::string folder;
  bool loaded = false;
  std::vector<FolderFile> files; // in name order
  // Each other folder of the library that provides some of the same names, with how many.
  std::vector<std::pair<std::string, int>> conflicts;
};

// The files of the folder of grid row `row`, each with its state, from one listing of the folder,
// of each place of the game and of each other folder, and the ledger. Nothing for a row that is
// no folder.
FolderFileList ListFolderFiles(const LibraryState &state, int row, Failures &failures);
// The state of `file` in words, for the player.
std::string FileStateText(const FolderFile &file);
// "Savedata", "Music", or "game folder".
std::string PlaceText(Place place);
// For the loaded folder `folder`, a line for each file whose copy replaced that of another loaded
// folder: the name, its place and whose copy it was. Reads the ledger.
std::vector<std::string> ReplacedFileLines(const LibraryState &state, const std::string &folder,
                                           Failures &failures);
