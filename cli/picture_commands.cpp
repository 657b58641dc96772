// exif, thumbnail and picture: a picture's camera data, its thumbnail, and
// the picture edits, on the same core as the desktop program.

#include "catalog/picture_item.h"
#include "cli/cli_command.h"
#include "pictures/exif_info.h"
#include "pictures/exif_report.h"
#include "pictures/image_writer.h"
#include "pictures/thumbnail_service.h"

#include <QFile>
#include <QFileInfo>
#include <QImageWriter>
#include <QRegularExpression>
#include <QSaveFile>

#include <cstdio>

namespace {

// exif's answer when the file holds no camera data.
constexpr int kExitNoExif = 1;

std::string NativePath(const QString& path)
{
    return QFile::encodeName(path).toStdString();
}

QString Option(const char* name)
{
    return QString::fromLatin1(name);
}

// With several files each report is headed by "==> FILE <==" and followed
// by an empty line; a file without camera data prints nothing.
int RunExif(CliContext& c)
{
    if (c.arguments.isEmpty())
        return c.Usage(QStringLiteral("exif takes one or more picture files"));
    const bool headed = c.arguments.size() > 1;
    int result = kExitOk;
    for (const QString& path : c.arguments) {
        CExifInfo info;
        if (!info.ReadExif(NativePath(path)) && !QFileInfo(path).isReadable()) {
            c.Failure(QStringLiteral("cannot read %1").arg(path));
            result = kExitNoExif;
            continue;
        }
        if (!info.exifRead) {
            c.Failure(QStringLiteral("%1 holds no EXIF data").arg(path));
            result = kExitNoExif;
            continue;
        }
        std::string text = BuildExifReport(info);
        if (headed)
            text = "==> " + NativePath(path) + " <==\r\n" + text + "\r\n";
        std::fwrite(text.data(), 1, text.size(), stdout);
    }
    if (std::fflush(stdout) != 0)
        return kExitFailure;
    return result;
}

void AddThumbnailOptions(QCommandLineParser& parser)
{
    parser.addOption({Option("size"), QStringLiteral("Longer side of the thumbnail, at most."),
                      QStringLiteral("N")});
    parser.addOption(
        {Option("out"), QStringLiteral("The PNG file to write."), QStringLiteral("PNG")});
}

bool WritePng(const QImage& image, const QString& path)
{
    QSaveFile file(path);
    if (!file.open(QIODevice::WriteOnly))
        return false;
    QImageWriter writer(&file, "png");
    if (!writer.write(image)) {
        file.cancelWriting();
        return false;
    }
    return file.commit();
}

int RunThumbnail(CliContext& c)
{
    if (c.arguments.size() != 1)
        return c.Usage(QStringLiteral("thumbnail takes one picture file"));
    bool ok = false;
    const int size = c.parser.value(Option("size")).toInt(&ok);
    if (!ok || size < 1 || size > 10000)
        return c.Usage(QStringLiteral("--size takes a number of pixels from 1 to 10000"));
    const QString out = c.parser.value(Option("out"));
    if (out.isEmpty())
        return c.Usage(QStringLiteral("--out names the PNG file to write"));
    const QString path = c.arguments.at(0);
    CThumbnailService service;
    const CThumbnail thumbnail = service.Make(path, size);
    if (thumbnail.status == CThumbnail::Missing)
        return c.Failure(QStringLiteral("cannot read %1").arg(path));
    if (thumbnail.status == CThumbnail::Failed)
        return c.Failure(QStringLiteral("%1 cannot be decoded").arg(path));
    const QImage image = ThumbnailForBox(thumbnail, size);
    if (!WritePng(image, out))
        return c.Failure(QStringLiteral("cannot write %1").arg(out));
    std::printf("Wrote %s (%d x %d)\n", qPrintable(out), image.width(), image.height());
    return kExitOk;
}

void AddPictureOptions(QCommandLineParser& parser)
{
    parser.addOption({Option("out"),
                      QStringLiteral("The file to write; its extension (jpg, png, bmp, gif) "
                                     "chooses the format."),
                      QStringLiteral("OUT")});
    parser.addOption({Option("rotate"), QStringLiteral("A quarter turn clockwise.")});
    parser.addOption({Option("brighten"),
                      QStringLiteral("Add N (0-255) to every channel of the loaded picture."),
                      QStringLiteral("N")});
    parser.addOption({Option("darken"),
                      QStringLiteral("Take N (0-255) from every channel of the loaded picture."),
                      QStringLiteral("N")});
    parser.addOption({Option("contrast"),
                      QStringLiteral("Move dark pixels N darker and light ones N lighter."),
                      QStringLiteral("N")});
    parser.addOption({Option("less-contrast"),
                      QStringLiteral("Move dark pixels N lighter and light ones N darker."),
                      QStringLiteral("N")});
    parser.addOption(
        {Option("scale"), QStringLiteral("Stretch to W x H pixels."), QStringLiteral("WxH")});
    parser.addOption({Option("crop"),
                      QStringLiteral("Keep the W x H block whose top-left corner is (X, Y)."),
                      QStringLiteral("WxH+X+Y")});
}

// Runs one operation; an empty text when it was done, else why not.
QString ApplyOperation(CPictureItem& picture, const QString& name, const QString& value)
{
    if (name == QLatin1String("rotate"))
        return picture.RotateImage() ? QString() : QStringLiteral("cannot rotate the picture");
    if (name == QLatin1String("scale") || name == QLatin1String("crop")) {
        static const QRegularExpression scaleSyntax(QStringLiteral("^(\\d{1,6})x(\\d{1,6})$"));
        static const QRegularExpression cropSyntax(
            QStringLiteral("^(\\d{1,6})x(\\d{1,6})\\+(\\d{1,6})\\+(\\d{1,6})$"));
        const bool scale = name == QLatin1String("scale");
        const QRegularExpressionMatch m = (scale ? scaleSyntax : cropSyntax).match(value);
        if (!m.hasMatch())
            return QStringLiteral("--%1 takes %2").arg(name, scale ? "WxH" : "WxH+X+Y");
        const int w = m.captured(1).toInt(), h = m.captured(2).toInt();
        const int done =
            scale ? picture.ScaleImage(w, h)
                  : picture.CropImage(w, h, m.captured(3).toInt(), m.captured(4).toInt());
        if (done)
            return QString();
        return QStringLiteral("--%1 %2 cannot be done on the %3 x %4 picture")
            .arg(name, value)
            .arg(picture.GetImageWidth())
            .arg(picture.GetImageHeight());
    }
    bool ok = false;
    const int amount = value.toInt(&ok);
    if (!ok || amount < 0 || amount > 255)
        return QStringLiteral("--%1 takes a number from 0 to 255").arg(name);
    int done = 0;
    if (name == QLatin1String("brighten") || name == QLatin1String("darken"))
        done = picture.AdjustBrightness(name == QLatin1String("darken"), amount);
    else
        done = picture.AdjustContrast(name == QLatin1String("contrast"), amount);
    return done ? QString() : QStringLiteral("cannot change the picture's %1").arg(name);
}

int RunPicture(CliContext& c)
{
    if (c.arguments.size() != 1)
        return c.Usage(QStringLiteral("picture takes one picture file"));
    const QString out = c.parser.value(Option("out"));
    if (out.isEmpty())
        return c.Usage(QStringLiteral("--out names the file to write"));
    if (EncoderForPath(out).isEmpty())
        return c.Usage(QStringLiteral("%1: no picture format has that extension (use jpg, png, "
                                      "bmp or gif)")
                           .arg(out));
    const QString path = c.arguments.at(0);
    CPictureItem picture;
    picture.SetPathname(NativePath(path));
    if (!picture.LoadImage(CPictureItem::kEditableForm))
        return c.Failure(QStringLiteral("%1 cannot be read or decoded").arg(path));

    // The operations run in the order they were given.
    QHash<QString, int> used;
    for (const QString& name : c.parser.optionNames()) {
        if (name == QLatin1String("out") || name == QLatin1String("home") ||
            name == QLatin1String("catalog"))
            continue;
        const QStringList values = c.parser.values(name);
        const QString value =
            name == QLatin1String("rotate") ? QString() : values.value(used[name]++);
        const QString error = ApplyOperation(picture, name, value);
        if (!error.isEmpty())
            return c.Failure(error);
    }
    if (!picture.SaveImageAs(NativePath(out)))
        return c.Failure(QStringLiteral("cannot write %1").arg(out));
    std::printf("Wrote %s (%d x %d)\n", qPrintable(out), picture.GetImageWidth(),
                picture.GetImageHeight());
    return kExitOk;
}

const CliRegistration kExif{{QStringLiteral("exif"), QStringLiteral("FILE..."),
                             QStringLiteral("The camera information (EXIF) of JPEG pictures; "
                                            "exit 1 when one has none."),
                             nullptr, RunExif}};
const CliRegistration kThumbnail{{QStringLiteral("thumbnail"),
                                  QStringLiteral("FILE --size N --out PNG"),
                                  QStringLiteral("Write the picture's thumbnail, through the "
                                                 "desktop thumbnail cache."),
                                  AddThumbnailOptions, RunThumbnail}};
const CliRegistration kPicture{{QStringLiteral("picture"),
                                QStringLiteral("FILE --out OUT [--rotate] [--brighten N|--darken "
                                               "N] [--contrast N|--less-contrast N] [--scale WxH] "
                                               "[--crop WxH+X+Y]"),
                                QStringLiteral("Edit a picture (operations in the order given) "
                                               "and save it as OUT."),
                                AddPictureOptions, RunPicture}};

} // namespace
