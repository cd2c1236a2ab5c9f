#include "app/app_state.h"

AppState StateFor(const std::filesystem::path &eawDir) {
  AppState state;
  state.EAWDir = eawDir;
  state.LibDir = eawDir / "ZEP128";
  return state;
}
