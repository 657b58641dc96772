#pragma once
// The pixel operations of picture editing, on 32-bit images (RGB32, or ARGB32
// when the picture has alpha). Each returns a new image, or a null image when
// the result cannot be made; the alpha channel is kept as it is.

#include <QImage>

// The form the editable picture is held in.
QImage ToEditableFormat(const QImage& image);

// A quarter turn clockwise: the pixel (x, y) moves to (H - 1 - y, x).
QImage RotateQuarterClockwise(const QImage& image);
// Every channel plus (or, darkening, minus) the amount, held within 0..255.
QImage AdjustBrightness(const QImage& image, bool darken, int amount);
// Pixels whose channel mean is below kContrastThreshold are dark: more
// contrast darkens them and lightens the others; less contrast does the opposite.
QImage AdjustContrast(const QImage& image, bool more, int amount);
inline constexpr int kContrastThreshold = 128;
// The whole image stretched to width x height, area-averaged when shrinking.
QImage ScaleSmooth(const QImage& image, int width, int height);
// The width x height block at (x, y); null unless the block lies inside the image.
QImage CropBlock(const QImage& image, int width, int height, int x, int y);
