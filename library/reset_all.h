#pragma once

#include "base/caption.h"
#include "base/failures.h"
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
// Deletes each named file of `folder`; one that cannot be deleted is skipped and recorded.
void DeleteFiles(const std::filesystem::path &folder, const std::vector<std::string> &names,
                 Failures &failures);
// Deletes the add-on files from the game folder.
void CleanUp(const LibraryState &state, Failures &failures);
// "Reset All": cleans up the game folder, empties the record and shows every row unloaded.
void ResetAll(LibraryState &state, Caption &caption, Failures &failures);
