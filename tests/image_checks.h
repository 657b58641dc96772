#pragma once
// Helpers of the picture tests: pictures made pixel by pixel, and pictures
// read back by ImageMagick, a decoder independent of the program's.

#include <QByteArray>
#include <QFile>
#include <QImage>
#include <QProcess>
#include <QString>
#include <QStringList>

#include <cstdlib>

// Writes the bytes to path; the path, or an empty string on failure.
inline QString WriteFile(const QString& path, const QByteArray& bytes)
{
    QFile file(path);
    return file.open(QIODevice::WriteOnly) && file.write(bytes) == bytes.size() ? path : QString();
}

// Runs ImageMagick's tool; the standard output, or an empty array on failure.
inline QByteArray Magick(const QString& tool, const QStringList& arguments)
{
    QProcess process;
    process.start(tool, arguments);
    if (!process.waitForFinished(60000) || process.exitStatus() != QProcess::NormalExit ||
        process.exitCode() != 0)
        return QByteArray();
    return process.readAllStandardOutput();
}

// "FORMAT WIDTH HEIGHT" as ImageMagick identifies the file.
inline QString Identify(const QString& path)
{
    return QString::fromLatin1(Magick("identify", {"-format", "%m %w %h", path + "[0]"}));
}

// The file's pixels as decoded by ImageMagick, as an RGB32 image.
inline QImage MagickPixels(const QString& path)
{
    const QStringList size = Identify(path).split(QLatin1Char(' '));
    if (size.size() != 3)
        return QImage();
    const int w = size.at(1).toInt(), h = size.at(2).toInt();
    const QByteArray rgb = Magick("convert", {path + "[0]", "-depth", "8", "rgb:-"});
    if (rgb.size() != qsizetype(w) * h * 3)
        return QImage();
    QImage image(w, h, QImage::Format_RGB32);
    for (int y = 0; y < h; ++y) {
        for (int x = 0; x < w; ++x) {
            const auto* p = reinterpret_cast<const uchar*>(rgb.constData()) + (y * w + x) * 3;
            image.setPixel(x, y, qRgb(p[0], p[1], p[2]));
        }
    }
    return image;
}

// Mean absolute difference per channel; -1 when the sizes differ.
inline double MeanDifference(const QImage& a, const QImage& b)
{
    if (a.size() != b.size() || a.isNull())
        return -1;
    double sum = 0;
    for (int y = 0; y < a.height(); ++y) {
        for (int x = 0; x < a.width(); ++x) {
            const QRgb p = a.pixel(x, y), q = b.pixel(x, y);
            sum += std::abs(qRed(p) - qRed(q)) + std::abs(qGreen(p) - qGreen(q)) +
                   std::abs(qBlue(p) - qBlue(q));
        }
    }
    return sum / (3.0 * a.width() * a.height());
}

// A smooth picture with many colours: red across, green down, blue mixed.
inline QImage Gradient(int w, int h)
{
    QImage image(w, h, QImage::Format_RGB32);
    for (int y = 0; y < h; ++y) {
        for (int x = 0; x < w; ++x)
            image.setPixel(x, y,
                           qRgb(x * 255 / qMax(1, w - 1), y * 255 / qMax(1, h - 1),
                                (x + y) * 255 / qMax(1, w + h - 2)));
    }
    return image;
}
