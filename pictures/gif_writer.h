#pragma once
// GIF encoding through giflib (Qt reads GIF but cannot write it).

#include <QImage>

class QIODevice;

// Writes one GIF image: the picture's own colours when it has at most 256,
// else a median-cut palette of 256 with error diffusion. Pixels less than
// half opaque become the transparent colour. False when the picture is
// larger than GIF allows or giflib fails.
bool WriteGif(const QImage& image, QIODevice& device);
