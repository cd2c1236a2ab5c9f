#pragma once

#include <filesystem>
#include <functional>
#include <string>
#include <string_view>
#include <system_error>
#include <vector>

// Whether `name` matches the wildcard `pattern` ("*" any run, "?" one character), ignoring case;
// "*.*" matches every name, also one without a dot.
bool MatchesPattern(std::string_view name, std::string_view pattern);
// Whether `name` matches any pattern of a ";"-separated list.
bool MatchesPatternList(std::string_view name, std::string_view patterns);
// Which files a listing gives: on Windows, hidden and system files are no files to the game, but
// they are to the program when it keeps and puts back the game's own files.
enum class FileKinds { Shown, WithHidden };
// Calls `visit` with the name of each plain file directly in `folder` (on Windows, the hidden and
// system ones only `WithHidden`), in the order the file system gives them. A folder that cannot
// be listed gives no names; the reason is returned.
std::error_code ForEachFile(const std::filesystem::path &folder,
                            const std::function<void(std::string &&name)> &visit,
                            FileKinds kinds = FileKinds::Shown);
// Plain file names (no path) directly in `folder` that match the pattern list, in name order.
// A folder that cannot be listed gives no names.
std::vector<std::string> ListFiles(const std::filesystem::path &folder,
                                   std::string_view patterns = "*.*",
                                   FileKinds kinds = FileKinds::Shown);
// The files of a folder, or why it could not be listed.
struct FileListing {
  std::vector<std::string> names;
  std::error_code error;
};
// As ListFiles, but a folder that cannot be listed says why instead of looking empty.
FileListing ListFilesOrReason(const std::filesystem::path &folder,
                              std::string_view patterns = "*.*",
                              FileKinds kinds = FileKinds::Shown);
// The names of the immediate subfolders of `folder`, in name order.
std::vector<std::string> ListFolderNames(const std::filesystem::path &folder);
// Full paths of the immediate subfolders of `folder`, in name order.
std::vector<std::filesystem::path> ListFolders(const std::filesystem::path &folder);
