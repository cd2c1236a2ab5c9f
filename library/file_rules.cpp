#include "library/file_rules.h"

#include "base/names.h"

#include <string>

bool StaysInLibrary(std::string_view name) {
  const std::string upper = Upper(name);
  return upper.starts_with("ECA") || upper.ends_with(".LDR") || upper.ends_with(".JPG") ||
         upper.ends_with(".PCX") || upper.ends_with(".GIF") || upper == "MYPIC" ||
         upper == "CONTENTS.TXT" || upper.ends_with(".PARTIAL");
}

bool IsSaveFile(std::string_view name) { return Upper(name).ends_with(".SVE"); }

Place PlaceOf(std::string_view name) {
  const std::string upper = Upper(name);
  if (upper.ends_with(".MSN") || upper.ends_with(".SVE"))
    return Place::Savedata;
  if (upper.ends_with(".BGM"))
    return Place::Music;
  return Place::Game;
}
