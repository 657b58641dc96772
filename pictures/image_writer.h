#pragma once
// Writing a picture file in the format its extension names.

#include <QByteArray>
#include <QImage>
#include <QString>

class QIODevice;

// The encoder the file name's extension selects, ignoring case: "jpeg",
// "png", "bmp", "gif" or "tiff"; empty when no encoder lists the extension.
QByteArray EncoderForPath(const QString& path);

// Encodes the image into the device in the encoder's format.
bool EncodeImage(const QImage& image, const QByteArray& encoder, QIODevice& device);

// Encodes by extension into a new file beside the target, then renames it
// over the target, so a failed save leaves the old file whole. An extension
// without an encoder writes nothing and fails.
bool SaveImageByExtension(const QImage& image, const QString& path);

inline constexpr int kJpegQuality = 90;
