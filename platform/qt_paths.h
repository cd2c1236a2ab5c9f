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
// The bytes of a text file for display: UTF-8 when they are valid UTF-8, else the system's ANSI
// code page (then `ansi` is set), so that ToText gives the same bytes back.
QString FromText(const std::string &bytes, bool *ansi = nullptr);
// Text of a text box as the bytes to write, in the encoding FromText found.
std::string ToText(const QString &text, bool ansi);
// Text typed into a widget as the logic keeps names and captions.
std::string ToName(const QString &text);
