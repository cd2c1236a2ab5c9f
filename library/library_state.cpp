#include "library/library_state.h"

#include "base/names.h"

LibraryState LibraryFor(const std::filesystem::path &eawDir) {
  LibraryState state;
  state.EAWDir = eawDir;
  state.LibDir = FindAnyCase(eawDir, "ZEP128");
  return state;
}
