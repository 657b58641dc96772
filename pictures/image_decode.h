#pragma once
// Decoding picture files within the memory limits: full size for the picture
// forms, reduced size (scaled in the codec where it can) for thumbnails.

#include <QImage>
#include <QSize>
#include <QString>

// Larger pictures count as pictures that cannot be decoded.
inline constexpr qint64 kMaxDecodePixels = 250'000'000;
inline constexpr qint64 kMaxDecodeBytes = qint64(1) << 30;

// Whether an image of this size and depth stays within the limits.
bool FitsDecodeLimits(const QSize& size, int bitsPerPixel = 32);

struct CDecodedPicture
{
    QImage image;      // null when the file cannot be decoded
    QSize pictureSize; // the whole picture's size, upright
};

// Decodes the file upright (EXIF orientation applied). With a valid box the
// picture is decoded to fit inside it, keeping its shape and never enlarged.
CDecodedPicture DecodePicture(const QString& path, const QSize& box = QSize());
