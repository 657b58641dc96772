// The picture forms of a picture item and the operations on them: drawing
// with the fit rule, edits, revert, commit, saving by extension, limits.

#include "catalog/picture_item.h"
#include "image_checks.h"
#include "pictures/exif_info.h"
#include "pictures/picture_fit.h"

#include <QBuffer>
#include <QFileInfo>
#include <QPainter>
#include <QTemporaryDir>
#include <QtTest>

namespace {

QString WritePng(const QTemporaryDir& dir, const QString& name, const QImage& image)
{
    const QString path = dir.filePath(name);
    return image.save(path, "PNG") ? path : QString();
}

std::unique_ptr<CPictureItem> Editable(const QString& path)
{
    auto item = std::make_unique<CPictureItem>();
    item->SetPathname(path.toStdString());
    if (!item->LoadImage(CPictureItem::kEditableForm))
        return nullptr;
    return item;
}

// The working image, as a saved PNG decoded again by ImageMagick.
QImage Working(CPictureItem& item, const QTemporaryDir& dir)
{
    static int n = 0;
    const QString path = dir.filePath(QStringLiteral("working-%1.png").arg(++n));
    if (!item.SaveImageAs(path.toStdString()))
        return QImage();
    return MagickPixels(path);
}

// Six distinct pixels, 3 wide and 2 high: (x, y) has red 10x + 1, green 10y + 2.
QImage SixPixels()
{
    QImage image(3, 2, QImage::Format_RGB32);
    for (int y = 0; y < 2; ++y) {
        for (int x = 0; x < 3; ++x)
            image.setPixel(x, y, qRgb(10 * x + 1, 10 * y + 2, 77));
    }
    return image;
}

quint32 Crc32(const QByteArray& bytes)
{
    quint32 crc = 0xFFFFFFFF;
    for (char c : bytes) {
        crc ^= quint8(c);
        for (int k = 0; k < 8; ++k)
            crc = (crc >> 1) ^ (0xEDB88320 & (0 - (crc & 1)));
    }
    return ~crc;
}

QByteArray PngChunk(const char* type, const QByteArray& data)
{
    QByteArray chunk;
    const auto be32 = [](quint32 v) {
        const char bytes[4] = {char(v >> 24), char(v >> 16), char(v >> 8), char(v)};
        return QByteArray(bytes, 4);
    };
    chunk += be32(quint32(data.size())) + type + data;
    chunk += be32(Crc32(QByteArray(type) + data));
    return chunk;
}

// A PNG whose header claims width x height; its data is one tiny stream.
QByteArray PngClaiming(quint32 width, quint32 height, char bitDepth, char colorType)
{
    QByteArray header;
    for (quint32 v : {width, height}) {
        for (int s = 24; s >= 0; s -= 8)
            header += char(v >> s);
    }
    header += bitDepth;
    header += colorType;
    header += QByteArray(3, '\0');
    return QByteArray("\x89PNG\r\n\x1a\n", 8) + PngChunk("IHDR", header) +
           PngChunk("IDAT", QByteArray("\x78\x9c\x03\x00\x00\x00\x00\x01", 8)) +
           PngChunk("IEND", QByteArray());
}

} // namespace

class TestPictureImage : public QObject
{
    Q_OBJECT

private slots:
    void initTestCase();
    void fitRule_data();
    void fitRule();
    void drawFitsAndMats();
    void rotation();
    void rotateFourTimesIsIdentity();
    void brightness();
    void brightnessStartsFromTheLoadedPicture();
    void contrast_data();
    void contrast();
    void scaleAveragesAreas();
    void crop_data();
    void crop();
    void editsNeedTheEditableForm();
    void revertAndCommit();
    void failedCommitKeepsEdits();
    void saveByExtension_data();
    void saveByExtension();
    void gifOfManyColours();
    void gifKeepsTransparency();
    void unknownExtensionWritesNothing_data();
    void unknownExtensionWritesNothing();
    void decodeLimits_data();
    void decodeLimits();
    void loadReadsExif();
    void copyLeavesTheDecodedPicture();

private:
    QTemporaryDir m_dir;
};

void TestPictureImage::initTestCase()
{
    QVERIFY(m_dir.isValid());
    if (Identify(WritePng(m_dir, "probe.png", SixPixels())) != QLatin1String("PNG 3 2"))
        QSKIP("ImageMagick (identify, convert) is needed as the independent decoder");
}

void TestPictureImage::fitRule_data()
{
    QTest::addColumn<QSize>("picture");
    QTest::addColumn<QRect>("target");
    QTest::addColumn<bool>("fit");
    QTest::addColumn<QRect>("expected");
    const QRect cell(0, 0, 214, 160);
    QTest::newRow("400x300 shrinks to 200x150")
        << QSize(400, 300) << cell << true << QRect(7, 5, 200, 150);
    QTest::newRow("50x20 grows to 200x80")
        << QSize(50, 20) << cell << true << QRect(7, 40, 200, 80);
    QTest::newRow("1x1000: width 0 becomes 2")
        << QSize(1, 1000) << QRect(0, 0, 100, 100) << true << QRect(49, 5, 2, 90);
    QTest::newRow("offset target, odd height")
        << QSize(300, 100) << QRect(100, 50, 114, 60) << true << QRect(107, 64, 100, 32);
    QTest::newRow("target smaller than the frame loss")
        << QSize(40, 30) << QRect(0, 0, 10, 8) << true << QRect(4, 3, 2, 2);
    QTest::newRow("natural size, centred")
        << QSize(400, 300) << cell << false << QRect(-93, -70, 400, 300);
    QTest::newRow("natural size, odd sides lose a pixel")
        << QSize(5, 3) << QRect(10, 20, 100, 50) << false << QRect(58, 44, 4, 2);
}

void TestPictureImage::fitRule()
{
    QFETCH(QSize, picture);
    QFETCH(QRect, target);
    QFETCH(bool, fit);
    QFETCH(QRect, expected);
    QCOMPARE(FitPictureRect(picture, target, fit), expected);
}

void TestPictureImage::drawFitsAndMats()
{
    QImage red(400, 300, QImage::Format_RGB32);
    red.fill(qRgb(255, 0, 0));
    CPictureItem item;
    item.SetPathname(WritePng(m_dir, "red.png", red).toStdString());
    for (bool mat : {false, true}) {
        QImage canvas(214, 160, QImage::Format_RGB32);
        canvas.fill(qRgb(0, 0, 255));
        item.SetWhiteBorder(mat);
        {
            QPainter painter(&canvas);
            QCOMPARE(item.Draw(painter, QRect(0, 0, 214, 160)), 1);
        }
        // The fitted rectangle is (7, 5) to (207, 155); the mat is 8 pixels wide.
        QCOMPARE(canvas.pixel(6, 80), qRgb(0, 0, 255));
        QCOMPARE(canvas.pixel(207, 80), qRgb(0, 0, 255));
        QCOMPARE(canvas.pixel(100, 4), qRgb(0, 0, 255));
        QCOMPARE(canvas.pixel(100, 155), qRgb(0, 0, 255));
        QCOMPARE(canvas.pixel(7, 5), mat ? qRgb(255, 255, 255) : qRgb(255, 0, 0));
        QCOMPARE(canvas.pixel(14, 80), mat ? qRgb(255, 255, 255) : qRgb(255, 0, 0));
        QCOMPARE(canvas.pixel(15, 80), qRgb(255, 0, 0));
        QCOMPARE(canvas.pixel(198, 146), qRgb(255, 0, 0));
        QCOMPARE(canvas.pixel(199, 146), mat ? qRgb(255, 255, 255) : qRgb(255, 0, 0));
        QCOMPARE(item.GetImageMode(), int(CPictureItem::kDisplayForm));
    }
    QCOMPARE(item.GetImageWidth(), 400);

    CPictureItem broken;
    QFile junk(m_dir.filePath("junk.jpg"));
    QVERIFY(junk.open(QIODevice::WriteOnly));
    junk.write("\xFF\xD8 not really a picture");
    junk.close();
    broken.SetPathname(junk.fileName().toStdString());
    QImage canvas(50, 50, QImage::Format_RGB32);
    canvas.fill(Qt::black);
    QPainter painter(&canvas);
    QCOMPARE(broken.Draw(painter, QRect(0, 0, 50, 50)), 0);
    QCOMPARE(broken.GetImageWidth(), 0);
    QCOMPARE(broken.LoadImage(CPictureItem::kDisplayForm), 0);
    painter.end();
    QCOMPARE(canvas.pixel(25, 25), qRgb(0, 0, 0));
}

void TestPictureImage::rotation()
{
    auto item = Editable(WritePng(m_dir, "six.png", SixPixels()));
    QVERIFY(item);
    QCOMPARE(item->RotateImage(), 1);
    QCOMPARE(item->GetImageWidth(), 2);
    QCOMPARE(item->GetImageHeight(), 3);
    const QImage turned = Working(*item, m_dir);
    QCOMPARE(turned.size(), QSize(2, 3));
    // A quarter turn clockwise: source (x, y) lands on (H - 1 - y, x), with H = 2.
    for (int y = 0; y < 2; ++y) {
        for (int x = 0; x < 3; ++x)
            QCOMPARE(turned.pixel(1 - y, x), qRgb(10 * x + 1, 10 * y + 2, 77));
    }
}

void TestPictureImage::rotateFourTimesIsIdentity()
{
    const QImage original = Gradient(37, 23);
    auto item = Editable(WritePng(m_dir, "turn.png", original));
    QVERIFY(item);
    for (int k = 0; k < 4; ++k)
        QCOMPARE(item->RotateImage(), 1);
    QCOMPARE(MeanDifference(Working(*item, m_dir), original), 0.0);
}

void TestPictureImage::brightness()
{
    QImage image(2, 1, QImage::Format_RGB32);
    image.setPixel(0, 0, qRgb(10, 250, 128));
    image.setPixel(1, 0, qRgb(0, 40, 255));
    auto item = Editable(WritePng(m_dir, "bright.png", image));
    QVERIFY(item);
    QCOMPARE(item->AdjustBrightness(false, 40), 1);
    QImage once = Working(*item, m_dir);
    QCOMPARE(once.pixel(0, 0), qRgb(50, 255, 168));
    QCOMPARE(once.pixel(1, 0), qRgb(40, 80, 255));
    QCOMPARE(item->AdjustBrightness(false, 40), 1);
    QCOMPARE(MeanDifference(Working(*item, m_dir), once), 0.0);
    QCOMPARE(item->AdjustBrightness(true, 40), 1);
    const QImage darker = Working(*item, m_dir);
    QCOMPARE(darker.pixel(0, 0), qRgb(0, 210, 88));
    QCOMPARE(darker.pixel(1, 0), qRgb(0, 0, 215));
}

void TestPictureImage::brightnessStartsFromTheLoadedPicture()
{
    auto item = Editable(WritePng(m_dir, "wide.png", Gradient(30, 10)));
    QVERIFY(item);
    QCOMPARE(item->RotateImage(), 1);
    QCOMPARE(item->GetImageWidth(), 10);
    // The rotation is dropped: brightness works on the picture as loaded.
    QCOMPARE(item->AdjustBrightness(false, 0), 1);
    QCOMPARE(item->GetImageWidth(), 30);
    // Contrast works on the current working image and keeps the rotation.
    QCOMPARE(item->RotateImage(), 1);
    QCOMPARE(item->AdjustContrast(true, 5), 1);
    QCOMPARE(item->GetImageWidth(), 10);
}

void TestPictureImage::contrast_data()
{
    QTest::addColumn<bool>("more");
    QTest::addColumn<int>("amount");
    QTest::addColumn<QList<QRgb>>("before");
    QTest::addColumn<QList<QRgb>>("after");
    // Means: 127 dark, 128 light, (200 + 10 + 170) / 3 = 126 dark, (0,0,255) = 85 dark.
    const QList<QRgb> pixels = {qRgb(127, 127, 127), qRgb(128, 128, 128), qRgb(200, 10, 170),
                                qRgb(0, 0, 255),     qRgb(255, 255, 255), qRgb(0, 0, 0)};
    QTest::newRow("more contrast")
        << true << 20 << pixels
        << QList<QRgb>{qRgb(107, 107, 107), qRgb(148, 148, 148), qRgb(180, 0, 150),
                       qRgb(0, 0, 235),     qRgb(255, 255, 255), qRgb(0, 0, 0)};
    QTest::newRow("less contrast")
        << false << 20 << pixels
        << QList<QRgb>{qRgb(147, 147, 147), qRgb(108, 108, 108), qRgb(220, 30, 190),
                       qRgb(20, 20, 255),   qRgb(235, 235, 235), qRgb(20, 20, 20)};
}

void TestPictureImage::contrast()
{
    QFETCH(bool, more);
    QFETCH(int, amount);
    QFETCH(QList<QRgb>, before);
    QFETCH(QList<QRgb>, after);
    QImage image(int(before.size()), 1, QImage::Format_RGB32);
    for (int x = 0; x < before.size(); ++x)
        image.setPixel(x, 0, before.at(x));
    auto item = Editable(WritePng(m_dir, "contrast.png", image));
    QVERIFY(item);
    QCOMPARE(item->AdjustContrast(more, amount), 1);
    const QImage result = Working(*item, m_dir);
    for (int x = 0; x < after.size(); ++x)
        QCOMPARE(QColor(result.pixel(x, 0)), QColor(after.at(x)));
}

void TestPictureImage::scaleAveragesAreas()
{
    // Two 2x2 blocks: 0/100/200/100 averages 100; 255/255/55/55 averages 155.
    QImage image(4, 2, QImage::Format_RGB32);
    const int values[2][4] = {{0, 100, 255, 255}, {200, 100, 55, 55}};
    for (int y = 0; y < 2; ++y) {
        for (int x = 0; x < 4; ++x)
            image.setPixel(x, y, qRgb(values[y][x], values[y][x], values[y][x]));
    }
    auto item = Editable(WritePng(m_dir, "blocks.png", image));
    QVERIFY(item);
    QCOMPARE(item->ScaleImage(2, 1), 1);
    const QImage small = Working(*item, m_dir);
    QCOMPARE(small.size(), QSize(2, 1));
    QVERIFY2(qAbs(qRed(small.pixel(0, 0)) - 100) <= 2,
             qPrintable(QString::number(small.pixel(0, 0), 16)));
    QVERIFY2(qAbs(qRed(small.pixel(1, 0)) - 155) <= 2,
             qPrintable(QString::number(small.pixel(1, 0), 16)));
    QCOMPARE(item->ScaleImage(0, 5), 0);
    QCOMPARE(item->ScaleImage(20000, 20000), 0); // 400 megapixels
    QCOMPARE(item->GetImageWidth(), 2);
    QCOMPARE(item->ScaleImage(9, 3), 1);
    QCOMPARE(item->GetImageWidth(), 9);
    QCOMPARE(item->GetImageHeight(), 3);
}

void TestPictureImage::crop_data()
{
    QTest::addColumn<QRect>("block");
    QTest::addColumn<int>("result");
    QTest::newRow("right bottom of 640x480") << QRect(540, 380, 100, 100) << 1;
    QTest::newRow("left top") << QRect(0, 0, 100, 100) << 1;
    QTest::newRow("whole picture") << QRect(0, 0, 640, 480) << 1;
    QTest::newRow("one pixel past the right") << QRect(541, 380, 100, 100) << 0;
    QTest::newRow("one pixel past the bottom") << QRect(540, 381, 100, 100) << 0;
    QTest::newRow("negative offset") << QRect(-1, 0, 100, 100) << 0;
    QTest::newRow("empty") << QRect(10, 10, 0, 100) << 0;
    QTest::newRow("larger than the picture") << QRect(0, 0, 641, 480) << 0;
}

void TestPictureImage::crop()
{
    QFETCH(QRect, block);
    QFETCH(int, result);
    static const QString path = WritePng(m_dir, "crop.png", Gradient(640, 480));
    const QImage source = MagickPixels(path);
    auto item = Editable(path);
    QVERIFY(item);
    QCOMPARE(item->CropImage(block.width(), block.height(), block.x(), block.y()), result);
    if (!result) {
        QCOMPARE(item->IsImageEdited(), false);
        QCOMPARE(item->GetImageWidth(), 640);
        return;
    }
    const QImage cropped = Working(*item, m_dir);
    QCOMPARE(cropped.size(), block.size());
    QCOMPARE(cropped.pixel(0, 0), source.pixel(block.x(), block.y()));
    QCOMPARE(cropped.pixel(block.width() - 1, block.height() - 1),
             source.pixel(block.right(), block.bottom()));
    QCOMPARE(MeanDifference(cropped, source.copy(block)), 0.0);
}

void TestPictureImage::editsNeedTheEditableForm()
{
    CPictureItem item;
    item.SetPathname(WritePng(m_dir, "display.png", Gradient(8, 8)).toStdString());
    QCOMPARE(item.EnsureLoaded(), 1);
    QCOMPARE(item.RotateImage(), 0);
    QCOMPARE(item.AdjustBrightness(false, 10), 0);
    QCOMPARE(item.AdjustContrast(true, 10), 0);
    QCOMPARE(item.ScaleImage(4, 4), 0);
    QCOMPARE(item.CropImage(4, 4, 0, 0), 0);
    QCOMPARE(item.RevertImage(), 0);
    QCOMPARE(item.SaveImageAs(m_dir.filePath("never.png").toStdString()), 0);
    QCOMPARE(item.CommitImage(), 0);
    QVERIFY(!QFileInfo::exists(m_dir.filePath("never.png")));
    // Once editable, a later load keeps the edits.
    QCOMPARE(item.LoadImage(CPictureItem::kEditableForm), 1);
    QCOMPARE(item.RotateImage(), 1);
    QCOMPARE(item.LoadImage(CPictureItem::kDisplayForm), 1);
    QCOMPARE(item.GetImageMode(), int(CPictureItem::kEditableForm));
    QCOMPARE(item.IsImageEdited(), true);
}

void TestPictureImage::revertAndCommit()
{
    const QString path = WritePng(m_dir, "commit.png", Gradient(40, 20));
    QFile file(path);
    QVERIFY(file.open(QIODevice::ReadOnly));
    const QByteArray before = file.readAll();
    file.close();
    auto item = Editable(path);
    QVERIFY(item);
    QCOMPARE(item->RotateImage(), 1);
    QCOMPARE(item->RevertImage(), 1);
    QCOMPARE(item->IsImageEdited(), false);
    QCOMPARE(item->CommitImage(), 1);
    QVERIFY(file.open(QIODevice::ReadOnly));
    QCOMPARE(file.readAll(), before);
    file.close();

    QCOMPARE(item->RotateImage(), 1);
    QCOMPARE(item->CommitImage(), 1);
    QCOMPARE(Identify(path), QStringLiteral("PNG 20 40"));
    // The images were released; the next use reads the saved file.
    QCOMPARE(item->IsImageEdited(), false);
    QCOMPARE(item->GetImageWidth(), 20);
    QCOMPARE(item->GetLoadedWidth(), 20);
}

void TestPictureImage::failedCommitKeepsEdits()
{
    // A PNG under a name no encoder lists: it loads, but cannot be written back.
    QFile::copy(WritePng(m_dir, "named.png", Gradient(12, 6)), m_dir.filePath("named.xyz"));
    const QString path = m_dir.filePath("named.xyz");
    auto item = Editable(path);
    QVERIFY(item);
    QCOMPARE(item->RotateImage(), 1);
    QCOMPARE(item->CommitImage(), 0);
    QCOMPARE(item->IsImageEdited(), true);
    QCOMPARE(item->GetImageWidth(), 6);
    QCOMPARE(Identify(path), QStringLiteral("PNG 12 6"));
}

void TestPictureImage::saveByExtension_data()
{
    QTest::addColumn<QString>("name");
    QTest::addColumn<QString>("format");
    QTest::addColumn<double>("tolerance");
    // Sharp colour edges cost JPEG a few levels (chroma is halved).
    QTest::newRow("jpg") << "out.jpg"
                         << "JPEG" << 6.0;
    QTest::newRow("JPG upper case") << "OUT2.JPG"
                                    << "JPEG" << 6.0;
    QTest::newRow("jpeg") << "out.jpeg"
                          << "JPEG" << 6.0;
    QTest::newRow("png") << "out.png"
                         << "PNG" << 0.0;
    QTest::newRow("Png mixed case") << "out2.Png"
                                    << "PNG" << 0.0;
    QTest::newRow("bmp") << "out.bmp"
                         << "BMP" << 0.0;
    QTest::newRow("gif") << "out.gif"
                         << "GIF" << 0.0;
    QTest::newRow("GIF upper case") << "out2.GIF"
                                    << "GIF" << 0.0;
    QTest::newRow("dots in the folder name") << "a.b/out"
                                             << "" << 0.0;
}

void TestPictureImage::saveByExtension()
{
    QFETCH(QString, name);
    QFETCH(QString, format);
    QFETCH(double, tolerance);
    // 200 colours: every format, GIF included, can hold them exactly.
    QImage image(40, 30, QImage::Format_RGB32);
    for (int y = 0; y < 30; ++y) {
        for (int x = 0; x < 40; ++x)
            image.setPixel(x, y, qRgb((x / 4) * 25, (y / 3) * 25, 90));
    }
    QDir(m_dir.path()).mkpath(QStringLiteral("a.b"));
    auto item = Editable(WritePng(m_dir, "source.png", image));
    QVERIFY(item);
    const QString target = m_dir.filePath(name);
    QCOMPARE(item->SaveImageAs(target.toStdString()), format.isEmpty() ? 0 : 1);
    if (format.isEmpty()) {
        QVERIFY(!QFileInfo::exists(target));
        return;
    }
    // ImageMagick names BMP files by version (BMP3).
    const QStringList identified = Identify(target).split(QLatin1Char(' '));
    QCOMPARE(identified.size(), 3);
    QVERIFY2(identified.at(0).startsWith(format), qPrintable(identified.at(0)));
    QCOMPARE(identified.at(1) + "x" + identified.at(2), QStringLiteral("40x30"));
    const double difference = MeanDifference(MagickPixels(target), image);
    QVERIFY2(difference >= 0 && difference <= tolerance, qPrintable(QString::number(difference)));
}

void TestPictureImage::gifOfManyColours()
{
    // 96 x 96 smooth colours (thousands of them) through a 256-colour palette.
    const QImage image = Gradient(96, 96);
    auto item = Editable(WritePng(m_dir, "many.png", image));
    QVERIFY(item);
    const QString target = m_dir.filePath("many.gif");
    QCOMPARE(item->SaveImageAs(target.toStdString()), 1);
    QCOMPARE(Identify(target), QStringLiteral("GIF 96 96"));
    // Dithering trades per-pixel error for the right colour over an area: judge
    // both, the second on 4 x 4 averages (ImageMagick's own GIF: 5.2 and 0.8).
    const QImage decoded = MagickPixels(target);
    const double difference = MeanDifference(decoded, image);
    QVERIFY2(difference >= 0 && difference < 6.0, qPrintable(QString::number(difference)));
    const auto areas = [](const QImage& i) {
        return i.scaled(24, 24, Qt::IgnoreAspectRatio, Qt::SmoothTransformation);
    };
    const double areaDifference = MeanDifference(areas(decoded), areas(image));
    QVERIFY2(areaDifference < 1.6, qPrintable(QString::number(areaDifference)));
}

void TestPictureImage::gifKeepsTransparency()
{
    QImage image(4, 1, QImage::Format_ARGB32);
    image.setPixel(0, 0, qRgba(0, 0, 0, 0));
    image.setPixel(1, 0, qRgba(255, 0, 0, 255));
    image.setPixel(2, 0, qRgba(0, 255, 0, 200));
    image.setPixel(3, 0, qRgba(0, 0, 255, 100));
    auto item = Editable(WritePng(m_dir, "alpha.png", image));
    QVERIFY(item);
    const QString target = m_dir.filePath("alpha.gif");
    QCOMPARE(item->SaveImageAs(target.toStdString()), 1);
    const QByteArray rgba = Magick("convert", {target, "-depth", "8", "rgba:-"});
    QCOMPARE(rgba.size(), 16);
    const auto at = [&rgba](int i) { return int(uchar(rgba.at(i))); };
    QCOMPARE(at(3), 0);
    QCOMPARE(QList<int>({at(4), at(5), at(6), at(7)}), QList<int>({255, 0, 0, 255}));
    QCOMPARE(QList<int>({at(8), at(9), at(10), at(11)}), QList<int>({0, 255, 0, 255}));
    QCOMPARE(at(15), 0); // less than half opaque
}

void TestPictureImage::unknownExtensionWritesNothing_data()
{
    QTest::addColumn<QString>("name");
    QTest::newRow("unknown extension") << "out.xyz";
    QTest::newRow("no extension") << "out";
    QTest::newRow("trailing dot") << "out.";
    QTest::newRow("wmf has no encoder") << "out.wmf";
}

void TestPictureImage::unknownExtensionWritesNothing()
{
    QFETCH(QString, name);
    auto item = Editable(WritePng(m_dir, "unknown.png", Gradient(5, 5)));
    QVERIFY(item);
    const QString target = m_dir.filePath(name);
    QCOMPARE(item->SaveImageAs(target.toStdString()), 0);
    QVERIFY(!QFileInfo::exists(target));
}

void TestPictureImage::decodeLimits_data()
{
    QTest::addColumn<QByteArray>("bytes");
    QTest::addColumn<QString>("name");
    QTest::newRow("PNG claiming 20000 x 20000") << PngClaiming(20000, 20000, 8, 2) << "big.png";
    QTest::newRow("16-bit RGBA PNG needing 1.15 GB")
        << PngClaiming(12000, 12000, 16, 6) << "deep.png";
    // A real JPEG whose frame header is changed to claim 60000 x 60000.
    QByteArray jpeg;
    QBuffer buffer(&jpeg);
    buffer.open(QIODevice::WriteOnly);
    Gradient(16, 16).save(&buffer, "JPEG");
    const int sof = int(jpeg.indexOf("\xFF\xC0"));
    for (int k : {5, 7}) {
        jpeg[sof + k] = char(0xEA);
        jpeg[sof + k + 1] = char(0x60);
    }
    QTest::newRow("JPEG claiming 60000 x 60000") << jpeg << "big.jpg";
}

void TestPictureImage::decodeLimits()
{
    QFETCH(QByteArray, bytes);
    QFETCH(QString, name);
    const QString path = m_dir.filePath(name);
    QFile file(path);
    QVERIFY(file.open(QIODevice::WriteOnly));
    file.write(bytes);
    file.close();
    CPictureItem item;
    item.SetPathname(path.toStdString());
    QCOMPARE(item.LoadImage(CPictureItem::kEditableForm), 0);
    QCOMPARE(item.GetImageMode(), int(CPictureItem::kDisplayForm));
    QCOMPARE(item.LoadImage(CPictureItem::kDisplayForm), 0);
    QCOMPARE(item.GetImageWidth(), 0);
}

void TestPictureImage::loadReadsExif()
{
    const QString sample = QStringLiteral(HB_SHARED_TESTDATA "/exif-samples/jpg/Canon_40D.jpg");
    if (!QFileInfo::exists(sample))
        QSKIP("camera samples not found");
    CPictureItem drawn;
    drawn.SetPathname(sample.toStdString());
    QCOMPARE(drawn.EnsureLoaded(), 1);
    QCOMPARE(drawn.GetExifRead(), 0);
    CPictureItem loaded;
    loaded.SetPathname(sample.toStdString());
    QCOMPARE(loaded.LoadImage(CPictureItem::kDisplayForm), 1);
    QCOMPARE(loaded.GetExifRead(), 1);
    QCOMPARE(loaded.GetExifInfo().cameraModel, std::string("Canon EOS 40D"));
}

void TestPictureImage::copyLeavesTheDecodedPicture()
{
    auto item = Editable(WritePng(m_dir, "copied.png", Gradient(8, 4)));
    QVERIFY(item);
    item->SetLabel("copied");
    item->SetWhiteBorder(1);
    QCOMPARE(item->RotateImage(), 1);
    CPictureItem copy(*item);
    QCOMPARE(copy.GetLabel(), std::string("copied"));
    QCOMPARE(copy.GetWhiteBorder(), 1);
    QCOMPARE(copy.GetImageMode(), int(CPictureItem::kDisplayForm));
    QCOMPARE(copy.IsImageEdited(), false);
    QCOMPARE(copy.GetImageWidth(), 8); // its own decoding of the file
    QCOMPARE(item->GetImageWidth(), 4);
}

QTEST_MAIN(TestPictureImage)
#include "tst_picture_image.moc"
