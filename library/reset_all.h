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
// The plain files directly in the game folder that Reset All deletes besides the copies of the
// loaded folders, in name order: those that match the pattern list, except the names the game
// itself keeps there and the names the loaded folders put there.
std::vector<std::string> CleanUpNames(const LibraryState &state, Failures &failures);
// How many files the loaded folders put into the game (each name once), with the copies an
// unload could not delete: what Reset All takes out before it deletes the CleanUpNames.
int LoadedFileCount(const LibraryState &state, Failures &failures);
// Puts every original in the keeping folder back into the game; a saved game of the same name
// that the game has again stays, and so does its original.
void RestoreOriginals(LibraryState &state, Failures &failures);
// Ends a Reset All noted in `journal`: takes its files out unless that was done (copies that
// cannot be deleted stay in the ledger as leftovers), empties the ledger and the record, puts the
// originals back and closes the journal. Also ends one that was interrupted (`afterCrash`), as
// each entry notes whether its original comes back.
void FinishReset(LibraryState &state, Journal journal, bool afterCrash, Caption &caption,
                 Failures &failures);
// "Reset All" of the files `names` the player agreed to: unloads every loaded folder as an
// unload does (its save files carried home, its copies taken out, the originals back), deletes
// `names`, puts any other kept original back, empties the record and shows every row unloaded.
void ResetAll(LibraryState &state, const std::vector<std::string> &names, Caption &caption,
              Failures &failures);
