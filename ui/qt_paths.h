#pragma once

#include <QString>
#include <filesystem>
#include <string>

// A Qt path string as a file-system path, keeping the platform's own bytes.
std::filesystem::path ToPath(const QString &text);
// A file-system path for display in a widget.
QString FromPath(const std::filesystem::path &path);
// A name kept by the logic (see NameText) for display in a widget.
QString FromName(const std::string &name);
// Text typed into a widget as the logic keeps names and captions.
std::string ToName(const QString &text);
