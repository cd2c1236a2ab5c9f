#include "tests/test_folder.h"

#include "base/names.h"

#include <atomic>
#include <fstream>
#include <iterator>
#include <unistd.h>

namespace fs = std::filesystem;

TestFolder::TestFolder() {
  static std::atomic<int> counter{0};
  path_ = fs::temp_directory_path() /
          ("selector-test-" + std::to_string(::getpid()) + "-" + std::to_string(counter++));
  fs::remove_all(path_);
  fs::create_directories(path_);
}

TestFolder::~TestFolder() {
  std::error_code error;
  for (auto it = fs::recursive_directory_iterator(path_, error);
       !error && it != fs::recursive_directory_iterator(); it.increment(error))
    fs::permissions(it->path(), fs::perms::owner_all, fs::perm_options::add, error);
  fs::permissions(path_, fs::perms::owner_all, fs::perm_options::add, error);
  fs::remove_all(path_, error);
}

fs::path TestFolder::Write(const std::string &relative, const std::string &bytes) const {
  const fs::path target = Child(path_, relative);
  fs::create_directories(target.parent_path());
  std::ofstream(target, std::ios::binary) << bytes;
  return target;
}

fs::path TestFolder::MakeFolder(const std::string &relative) const {
  const fs::path folder = Child(path_, relative);
  fs::create_directories(folder);
  return folder;
}

bool TestFolder::Exists(const std::string &relative) const {
  return fs::exists(Child(path_, relative));
}

std::string TestFolder::Read(const std::string &relative) const {
  std::ifstream in(Child(path_, relative), std::ios::binary);
  return std::string((std::istreambuf_iterator<char>(in)), std::istreambuf_iterator<char>());
}

bool IsWritable(const fs::path &path) {
  return (fs::status(path).permissions() & fs::perms::owner_write) != fs::perms::none;
}

void SetReadOnly(const fs::path &path, bool readOnly) {
  const fs::perms write = fs::perms::owner_write | fs::perms::group_write | fs::perms::others_write;
  fs::permissions(path, write, readOnly ? fs::perm_options::remove : fs::perm_options::add);
}

bool IsCaseSensitive(const fs::path &folder) {
  const fs::path probe = folder / "case-probe";
  std::ofstream(probe) << "x";
  const bool sensitive = !fs::exists(folder / "CASE-PROBE");
  fs::remove(probe);
  return sensitive;
}
