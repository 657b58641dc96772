#include "pictures/image_edits.h"

#include "pictures/image_decode.h"

#include <QTransform>

#include <algorithm>
#include <array>

namespace {

bool IsEditable(const QImage& image)
{
    return image.format() == QImage::Format_RGB32 || image.format() == QImage::Format_ARGB32;
}

int Clamp255(int value)
{
    return std::clamp(value, 0, 255);
}

QRgb WithChannels(QRgb pixel, int r, int g, int b)
{
    return qRgba(Clamp255(r), Clamp255(g), Clamp255(b), qAlpha(pixel));
}

// Applies f to every pixel, scanline by scanline, into a new image.
template <typename F> QImage MapPixels(const QImage& image, F f)
{
    if (!IsEditable(image))
        return QImage();
    QImage result(image.size(), image.format());
    if (result.isNull())
        return result;
    for (int y = 0; y < image.height(); ++y) {
        const auto* in = reinterpret_cast<const QRgb*>(image.constScanLine(y));
        auto* out = reinterpret_cast<QRgb*>(result.scanLine(y));
        for (int x = 0; x < image.width(); ++x)
            out[x] = f(in[x]);
    }
    return result;
}

} // namespace

QImage ToEditableFormat(const QImage& image)
{
    if (image.isNull())
        return image;
    return image.convertToFormat(image.hasAlphaChannel() ? QImage::Format_ARGB32
                                                         : QImage::Format_RGB32);
}

QImage RotateQuarterClockwise(const QImage& image)
{
    if (!IsEditable(image))
        return QImage();
    return image.transformed(QTransform().rotate(90)).convertToFormat(image.format());
}

QImage AdjustBrightness(const QImage& image, bool darken, int amount)
{
    std::array<uint8_t, 256> table;
    for (int i = 0; i < 256; ++i)
        table[i] = uint8_t(Clamp255(darken ? i - amount : i + amount));
    return MapPixels(image, [&table](QRgb p) {
        return qRgba(table[qRed(p)], table[qGreen(p)], table[qBlue(p)], qAlpha(p));
    });
}

QImage AdjustContrast(const QImage& image, bool more, int amount)
{
    return MapPixels(image, [more, amount](QRgb p) {
        const int r = qRed(p), g = qGreen(p), b = qBlue(p);
        const bool dark = (r + g + b) / 3 < kContrastThreshold;
        const int delta = dark == more ? -amount : amount;
        return WithChannels(p, r + delta, g + delta, b + delta);
    });
}

QImage ScaleSmooth(const QImage& image, int width, int height)
{
    if (!IsEditable(image) || !FitsDecodeLimits(QSize(width, height)))
        return QImage();
    return image.scaled(width, height, Qt::IgnoreAspectRatio, Qt::SmoothTransformation)
        .convertToFormat(image.format());
}

QImage CropBlock(const QImage& image, int width, int height, int x, int y)
{
    if (!IsEditable(image) || width <= 0 || height <= 0 || x < 0 || y < 0 ||
        x > image.width() - width || y > image.height() - height)
        return QImage();
    return image.copy(x, y, width, height);
}
