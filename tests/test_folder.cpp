#include "tests/test_folder.h"

#include "base/names.h"

#include <atomic>
#include <chrono>
#include <fstream>
#include <iterator>
#include <thread>
#include <unistd.h>

#ifdef _WIN32
#include <windows.h>
#endif

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

::testing::AssertionResult TestFolder::All(std::initializer_list<std::string> relatives,
                                           bool exist) const {
  std::string wrong;
  for (const std::string &relative : relatives)
    if (Exists(relative) != exist)
      wrong += " \"" + relative + "\"";
  if (wrong.empty())
    return ::testing::AssertionSuccess();
  return ::testing::AssertionFailure() << (exist ? "missing:" : "still there:") << wrong;
}

std::string TestFolder::Read(const std::string &relative) const {
  std::ifstream in(Child(path_, relative), std::ios::binary);
  return std::string((std::istreambuf_iterator<char>(in)), std::istreambuf_iterator<char>());
}

::testing::AssertionResult Contains(const std::string &text, const std::string &part) {
  if (text.find(part) != std::string::npos)
    return ::testing::AssertionSuccess();
  return ::testing::AssertionFailure() << "\"" << part << "\" is not in:\n" << text;
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

std::map<std::string, std::string> Snapshot(const fs::path &folder, const std::string &skipped) {
  std::map<std::string, std::string> entries;
  std::error_code error;
  for (auto it = fs::recursive_directory_iterator(folder, error);
       !error && it != fs::recursive_directory_iterator(); it.increment(error)) {
    const std::string relative = it->path().lexically_relative(folder).generic_string();
    if (!skipped.empty() && it.depth() == 0 && relative == skipped) {
      it.disable_recursion_pending();
      continue;
    }
    std::string &entry = entries[relative];
    if (it->is_symlink(error)) {
      entry = "link";
      continue;
    }
    entry = it->is_directory() ? "folder" : "file";
    entry += IsWritable(it->path()) ? " writable " : " read-only ";
    if (it->is_regular_file()) {
      std::ifstream in(it->path(), std::ios::binary);
      entry.append(std::istreambuf_iterator<char>(in), std::istreambuf_iterator<char>());
    }
  }
  return entries;
}

#ifdef _WIN32
// The Unix path of `path` when the program runs under Wine, else empty.
static std::wstring UnixPath(const fs::path &path) {
  using Converter = char *(CDECL *)(LPCWSTR);
  const auto convert = reinterpret_cast<Converter>(reinterpret_cast<void *>(
      GetProcAddress(GetModuleHandleW(L"kernel32"), "wine_get_unix_file_name")));
  char *unix = convert ? convert(path.c_str()) : nullptr;
  if (!unix)
    return {};
  const std::wstring text = fs::path(unix).wstring();
  HeapFree(GetProcessHeap(), 0, unix);
  return text;
}

// Told apart from the program's own check, so that a fault there cannot pass for a missing link.
static bool IsReparsePoint(const fs::path &path) {
  const DWORD attributes = GetFileAttributesW(path.c_str());
  return attributes != INVALID_FILE_ATTRIBUTES && (attributes & FILE_ATTRIBUTE_REPARSE_POINT);
}

bool MakeFolderLink(const fs::path &target, const fs::path &link) {
  // Windows lets a program make links only with developer mode or as administrator.
  if (CreateSymbolicLinkW(link.c_str(), target.c_str(), SYMBOLIC_LINK_FLAG_DIRECTORY | 0x2) &&
      IsReparsePoint(link))
    return true;
  // Wine 8 answers that call with success and makes nothing, but shows a folder link of the Unix
  // file system as a folder with a reparse point: its own "ln" makes one. (A link to a file it
  // shows as a plain file, so file links cannot be tested under Wine.)
  const std::wstring from = UnixPath(target), to = UnixPath(link);
  std::wstring command = L"ln -s \"" + from + L"\" \"" + to + L"\"";
  STARTUPINFOW startup{};
  startup.cb = sizeof startup;
  PROCESS_INFORMATION process{};
  if (from.empty() || !CreateProcessW(L"Z:\\bin\\ln", command.data(), nullptr, nullptr, FALSE, 0,
                                      nullptr, nullptr, &startup, &process))
    return false;
  CloseHandle(process.hThread);
  CloseHandle(process.hProcess);
  // Wine does not wait for a Unix process: the link is awaited instead.
  for (int wait = 0; wait < 100 && !IsReparsePoint(link); ++wait)
    std::this_thread::sleep_for(std::chrono::milliseconds(50));
  return IsReparsePoint(link);
}
#else
bool MakeFolderLink(const fs::path &target, const fs::path &link) {
  std::error_code error;
  fs::create_directory_symlink(target, link, error);
  return !error;
}
#endif
