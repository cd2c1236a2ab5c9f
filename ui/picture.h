#pragma once

#include <QPixmap>
#include <QSize>
#include <filesystem>

// The picture in `file` (BMP, JPEG, GIF, also without extension, recognised by its content),
// decoded at no more than `fit` and scaled into it; an empty pixmap when it cannot be decoded.
QPixmap LoadPicture(const std::filesystem::path &file, QSize fit);
