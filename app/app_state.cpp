#include "app/app_state.h"

#include "app/names.h"

AppState StateFor(const std::filesystem::path &eawDir) {
  AppState state;
  state.EAWDir = eawDir;
  state.LibDir = FindAnyCase(eawDir, "ZEP128");
  return state;
}
