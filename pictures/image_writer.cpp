#include "pictures/image_writer.h"

#include "pictures/gif_writer.h"

#include <QFileInfo>
#include <QImageWriter>
#include <QPainter>
#include <QSaveFile>

namespace {

struct Encoder
{
    const char* name;
    const char* extensions[4];
};

constexpr Encoder kEncoders[] = {
    {"bmp", {"bmp", "dib", "rle", nullptr}},     {"jpeg", {"jpg", "jpeg", "jpe", "jfif"}},
    {"gif", {"gif", nullptr, nullptr, nullptr}}, {"tiff", {"tif", "tiff", nullptr, nullptr}},
    {"png", {"png", nullptr, nullptr, nullptr}},
};

// JPEG has no alpha: transparent parts are shown on white, as a viewer would.
QImage OnWhite(const QImage& image)
{
    if (!image.hasAlphaChannel())
        return image;
    QImage flat(image.size(), QImage::Format_RGB32);
    flat.fill(Qt::white);
    QPainter painter(&flat);
    painter.drawImage(0, 0, image);
    return flat;
}

} // namespace

QByteArray EncoderForPath(const QString& path)
{
    const QString suffix = QFileInfo(path).suffix().toLower();
    if (suffix.isEmpty())
        return QByteArray();
    for (const Encoder& encoder : kEncoders) {
        for (const char* extension : encoder.extensions) {
            if (extension && suffix == QLatin1String(extension)) {
                const QByteArray name(encoder.name);
                if (name == "gif" || QImageWriter::supportedImageFormats().contains(name))
                    return name;
                return QByteArray();
            }
        }
    }
    return QByteArray();
}

bool EncodeImage(const QImage& image, const QByteArray& encoder, QIODevice& device)
{
    if (image.isNull() || encoder.isEmpty())
        return false;
    if (encoder == "gif")
        return WriteGif(image, device);
    QImageWriter writer(&device, encoder);
    if (encoder == "jpeg") {
        writer.setQuality(kJpegQuality);
        return writer.write(OnWhite(image));
    }
    return writer.write(image);
}

bool SaveImageByExtension(const QImage& image, const QString& path)
{
    const QByteArray encoder = EncoderForPath(path);
    if (encoder.isEmpty() || image.isNull())
        return false;
    QSaveFile file(path);
    if (!file.open(QIODevice::WriteOnly))
        return false;
    if (!EncodeImage(image, encoder, file)) {
        file.cancelWriting();
        return false;
    }
    return file.commit();
}
