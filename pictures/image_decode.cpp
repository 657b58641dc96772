#include "pictures/image_decode.h"

#include <QImageReader>

namespace {

void RaiseReaderAllocationLimit()
{
    // The reader's own default (256 MiB) would refuse pictures the program accepts.
    static const bool once = [] {
        QImageReader::setAllocationLimit(int(kMaxDecodeBytes >> 20));
        return true;
    }();
    (void)once;
}

int BitsPerPixel(QImage::Format format)
{
    const int depth = QImage::toPixelFormat(format).bitsPerPixel();
    return depth > 32 ? depth : 32; // decoders hand back at least 32 bits per pixel
}

} // namespace

bool FitsDecodeLimits(const QSize& size, int bitsPerPixel)
{
    if (size.width() <= 0 || size.height() <= 0)
        return false;
    const qint64 pixels = qint64(size.width()) * size.height();
    return pixels <= kMaxDecodePixels && pixels * bitsPerPixel / 8 <= kMaxDecodeBytes;
}

CDecodedPicture DecodePicture(const QString& path, const QSize& box)
{
    RaiseReaderAllocationLimit();
    CDecodedPicture result;
    QImageReader reader(path);
    reader.setAutoTransform(true);
    const QSize stored = reader.size();
    if (stored.isValid() && !FitsDecodeLimits(stored, BitsPerPixel(reader.imageFormat())))
        return result;

    const bool turned = reader.transformation() & QImageIOHandler::TransformationRotate90;
    if (stored.isValid())
        result.pictureSize = turned ? stored.transposed() : stored;
    if (box.isValid() && stored.isValid()) {
        const QSize storedBox = turned ? box.transposed() : box;
        if (stored.width() > storedBox.width() || stored.height() > storedBox.height()) {
            QSize target = stored.scaled(storedBox, Qt::KeepAspectRatio);
            target = target.expandedTo(QSize(1, 1));
            reader.setScaledSize(target);
        }
    }
    QImage image = reader.read();
    if (image.isNull())
        return result;
    if (!stored.isValid()) {
        // A format that cannot tell its size before decoding.
        if (!FitsDecodeLimits(image.size(), image.depth()))
            return result;
        result.pictureSize = image.size();
        if (box.isValid() && (image.width() > box.width() || image.height() > box.height()))
            image = image.scaled(box, Qt::KeepAspectRatio, Qt::SmoothTransformation);
    }
    result.image = image;
    return result;
}
