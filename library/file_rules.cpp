#include "library/file_rules.h"

#include "base/names.h"

#include <string>

bool StaysInLibrary(std::string_view name) {
  const std::string upper = Upper(name);
  return StartsWith(upper, "ECA") || EndsWith(upper, ".LDR") || EndsWith(upper, ".JPG") ||
         EndsWith(upper, ".PCX") || EndsWith(upper, ".GIF") || upper == "MYPIC" ||
         upper == "CONTENTS.TXT" || EndsWith(upper, ".PARTIAL");
}

bool IsSaveFile(std::string_view name) { return EndsWith(Upper(name), ".SVE"); }

Place PlaceOf(std::string_view name) {
  const std::string upper = Upper(name);
  if (EndsWith(upper, ".MSN") || EndsWith(upper, ".SVE"))
    return Place::Savedata;
  if (EndsWith(upper, ".BGM"))
    return Place::Music;
  return Place::Game;
}
