#pragma once

#include <QRect>

// Twips per pixel, the fixed conversion the window's layout uses.
inline constexpr int kTwipsPerPixel = 15;

// A rectangle given in twips (left, top, width, height), in pixels.
QRect Twips(int left, int top, int width, int height);
// Twips in pixels.
int TwipsToPixels(int twips);
