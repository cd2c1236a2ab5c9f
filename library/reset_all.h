#pragma once

#include "base/caption.h"
#include "base/failures.h"
#include "library/keeping.h"
#include "library/library_state.h"

#include <filesystem>
#include <string>
#include <vector>

// The add-on file patterns Reset All deletes when the library has no usable "CleanUp.ini".
inline constexpr char kDefaultCleanUpPatterns[] =
    "P*.bmp;*.bgm;*.smk;*.fnt;*.wsd;*.fsp;*.pal;*.bak;*.tco;*.pco;*.bco;*.hm;*.jpg;*.pcx;*.txt;"
    "mypic;planepic;skinpic;*.mnu;*.dat;*.mpc;*.wsp;*.pic;*.spt;*.str;*.ter;*.tm;*.tpc;*.flt;"
    "*.3dz;*.snd;*.bil;*.bin;*.cpt";

// The pattern list: the first line of the library's "CleanUp.ini" (any letter case), or the
// default when the file is missing, unreadable or its first line is blank.
std::string CleanUpPatterns(const std::filesystem::path &libDir, Failures &failures);
// The plain files directly in the game folder that Reset All deletes, in name order: those that
// match the pattern list, except the names the game itself keeps there.
std::vector<std::string> CleanUpNames(const LibraryState &state, Failures &failures);
// Deletes each named file of `folder`, showing how far it is; one that cannot be deleted is
// skipped and recorded. Returns how many were deleted.
int DeleteFiles(const std::filesystem::path &folder, const std::vector<std::string> &names,
                Caption &caption, Failures &failures);
// Deletes the named add-on files (found by CleanUpNames) that are still in the game folder.
void CleanUp(LibraryState &state, const std::vector<std::string> &names, Caption &caption,
             Failures &failures);
// Puts every original in the keeping folder back into the game; a saved game of the same name
// that the game has again stays, and so does its original.
void RestoreOriginals(LibraryState &state, Failures &failures);
// Ends a Reset All noted in `journal`: deletes its files unless that was done, puts the originals
// back, empties the ledger and the record and closes the journal. Also ends one that was
// interrupted.
void FinishReset(LibraryState &state, Journal journal, Caption &caption, Failures &failures);
// "Reset All" of the files `names` the player agreed to: cleans up the game folder, puts the
// kept originals back, empties the record and shows every row unloaded.
void ResetAll(LibraryState &state, const std::vector<std::string> &names, Caption &caption,
              Failures &failures);
