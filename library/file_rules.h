#pragma once

#include <cstddef>
#include <string_view>

// Where loading puts a file of an add-on folder.
enum class Place { Game, Savedata, Music };
// How many places there are.
inline constexpr size_t kPlaceCount = static_cast<size_t>(Place::Music) + 1;

// Whether a file stays in the library when its folder is loaded: descriptions, pictures, and
// the temporary copies an interrupted copy left.
bool StaysInLibrary(std::string_view name);
// Whether a file is a saved game (".SVE", any case).
bool IsSaveFile(std::string_view name);
// The place a file goes to: ".MSN" and ".SVE" to "Savedata", ".BGM" to "Music", else the game.
Place PlaceOf(std::string_view name);
