#pragma once

#include <QIcon>

// The window's own icon: a small aircraft over a folder, in 32 and 16 pixel sizes.
QIcon WindowIcon();
