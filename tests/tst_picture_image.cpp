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

// The pixel at (x, y) of a one-row picture made of the given colours.
QImage Row(const QList<QRgb>& pixels)
{
    QImage image(int(pixels.size()), 1, QImage::Format_RGB32);
    for (int x = 0; x < pixels.size(); ++x)
        image.setPixel(x, 0, pixels.at(x));
    return image;
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
    void brightness();
    void contrast_data();
    void contrast();
    void scaleAveragesAreas();
    void crop_data();
    void crop();
    void editsNeedTheEditableForm();
    void revertAndCommit();
    void saveByExtension_data();
    void saveByExtension();
    void gifPalette();
    void decodeLimit();
    void loadReadsExif();

private:
    QString Png(const QImage& image);
    std::unique_ptr<CPictureItem> Editable(const QImage& image);
    // The working image, saved as PNG and decoded again by ImageMagick.
    QImage Working(CPictureItem& item);

    QTemporaryDir m_dir;
    int m_files = 0;
};

QString TestPictureImage::Png(const QImage& image)
{
    const QString path = m_dir.filePath(QStringLiteral("picture-%1.png").arg(++m_files));
    return image.save(path, "PNG") ? path : QString();
}

std::unique_ptr<CPictureItem> TestPictureImage::Editable(const QImage& image)
{
    auto item = std::make_unique<CPictureItem>();
    item->SetPathname(Png(image).toStdString());
    return item->LoadImage(CPictureItem::kEditableForm) ? std::move(item) : nullptr;
}

QImage TestPictureImage::Working(CPictureItem& item)
{
    const QString path = m_dir.filePath(QStringLiteral("working-%1.png").arg(++m_files));
    return item.SaveImageAs(path.toStdString()) ? MagickPixels(path) : QImage();
}

void TestPictureImage::initTestCase()
{
    QVERIFY(m_dir.isValid());
    if (Identify(Png(Gradient(3, 2))) != QLatin1String("PNG 3 2"))
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
    item.SetPathname(Png(red).toStdString());
    const QRgb blue = qRgb(0, 0, 255), white = qRgb(255, 255, 255);
    for (bool mat : {false, true}) {
        QImage canvas(214, 160, QImage::Format_RGB32);
        canvas.fill(blue);
        item.SetWhiteBorder(mat);
        QPainter painter(&canvas);
        QCOMPARE(item.Draw(painter, QRect(0, 0, 214, 160)), 1);
        painter.end();
        // Fitted to (7, 5)-(207, 155); the mat is the outer 8 pixels of it.
        for (QPoint outside : {QPoint(6, 80), QPoint(207, 80), QPoint(100, 4), QPoint(100, 155)})
            QCOMPARE(canvas.pixel(outside), blue);
        for (QPoint rim : {QPoint(7, 5), QPoint(14, 80), QPoint(199, 146)})
            QCOMPARE(canvas.pixel(rim), mat ? white : qRgb(255, 0, 0));
        QCOMPARE(canvas.pixel(15, 80), qRgb(255, 0, 0));
        QCOMPARE(canvas.pixel(198, 146), qRgb(255, 0, 0));
    }
    QCOMPARE(item.GetImageMode(), int(CPictureItem::kDisplayForm));

    CPictureItem broken;
    broken.SetPathname(
        WriteFile(m_dir.filePath("junk.jpg"), "\xFF\xD8 not a picture").toStdString());
    QImage canvas(50, 50, QImage::Format_RGB32);
    QPainter painter(&canvas);
    QCOMPARE(broken.Draw(painter, QRect(0, 0, 50, 50)), 0);
    QCOMPARE(broken.GetImageWidth(), 0);
    QCOMPARE(broken.LoadImage(CPictureItem::kDisplayForm), 0);
}

void TestPictureImage::rotation()
{
    // (x, y) of a 3 x 2 picture has red 10x + 1, green 10y + 2.
    QImage six(3, 2, QImage::Format_RGB32);
    for (int y = 0; y < 2; ++y) {
        for (int x = 0; x < 3; ++x)
            six.setPixel(x, y, qRgb(10 * x + 1, 10 * y + 2, 77));
    }
    auto item = Editable(six);
    QVERIFY(item);
    QCOMPARE(item->RotateImage(), 1);
    QCOMPARE(item->GetImageWidth(), 2);
    const QImage turned = Working(*item);
    QCOMPARE(turned.size(), QSize(2, 3));
    // A quarter turn clockwise: (x, y) lands on (H - 1 - y, x), with H = 2.
    for (int y = 0; y < 2; ++y) {
        for (int x = 0; x < 3; ++x)
            QCOMPARE(turned.pixel(1 - y, x), six.pixel(x, y));
    }
    const QImage odd = Gradient(37, 23);
    auto four = Editable(odd);
    for (int k = 0; k < 4; ++k)
        QCOMPARE(four->RotateImage(), 1);
    QCOMPARE(MeanDifference(Working(*four), odd), 0.0);
}

void TestPictureImage::brightness()
{
    auto item = Editable(Row({qRgb(10, 250, 128), qRgb(0, 40, 255)}));
    QVERIFY(item);
    QCOMPARE(item->AdjustBrightness(false, 40), 1);
    const QImage once = Working(*item);
    QCOMPARE(once.pixel(0, 0), qRgb(50, 255, 168));
    QCOMPARE(once.pixel(1, 0), qRgb(40, 80, 255));
    // Each step starts from the picture as loaded, a rotation included.
    QCOMPARE(item->RotateImage(), 1);
    QCOMPARE(item->AdjustBrightness(false, 40), 1);
    QCOMPARE(MeanDifference(Working(*item), once), 0.0);
    QCOMPARE(item->AdjustBrightness(true, 40), 1);
    const QImage darker = Working(*item);
    QCOMPARE(darker.pixel(0, 0), qRgb(0, 210, 88));
    QCOMPARE(darker.pixel(1, 0), qRgb(0, 0, 215));
}

void TestPictureImage::contrast_data()
{
    QTest::addColumn<bool>("more");
    QTest::addColumn<QList<QRgb>>("after");
    // Means: 127 dark, 128 light, 126 dark, 85 dark, 255, 0.
    QTest::newRow("more contrast")
        << true << QList<QRgb>{qRgb(107, 107, 107), qRgb(148, 148, 148), qRgb(180, 0, 150),
                               qRgb(0, 0, 235),     qRgb(255, 255, 255), qRgb(0, 0, 0)};
    QTest::newRow("less contrast")
        << false << QList<QRgb>{qRgb(147, 147, 147), qRgb(108, 108, 108), qRgb(220, 30, 190),
                                qRgb(20, 20, 255),   qRgb(235, 235, 235), qRgb(20, 20, 20)};
}

void TestPictureImage::contrast()
{
    QFETCH(bool, more);
    QFETCH(QList<QRgb>, after);
    auto item = Editable(Row({qRgb(127, 127, 127), qRgb(128, 128, 128), qRgb(200, 10, 170),
                              qRgb(0, 0, 255), qRgb(255, 255, 255), qRgb(0, 0, 0)}));
    QVERIFY(item);
    QCOMPARE(item->AdjustContrast(more, 20), 1);
    const QImage result = Working(*item);
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
    auto item = Editable(image);
    QVERIFY(item);
    QCOMPARE(item->ScaleImage(2, 1), 1);
    const QImage small = Working(*item);
    QCOMPARE(small.size(), QSize(2, 1));
    QVERIFY(qAbs(qRed(small.pixel(0, 0)) - 100) <= 2);
    QVERIFY(qAbs(qRed(small.pixel(1, 0)) - 155) <= 2);
    QCOMPARE(item->ScaleImage(0, 5), 0);
    QCOMPARE(item->ScaleImage(20000, 20000), 0); // 400 megapixels
    QCOMPARE(item->GetImageWidth(), 2);
}

void TestPictureImage::crop_data()
{
    QTest::addColumn<QRect>("block");
    QTest::addColumn<int>("result");
    QTest::newRow("right bottom of 640x480") << QRect(540, 380, 100, 100) << 1;
    QTest::newRow("whole picture") << QRect(0, 0, 640, 480) << 1;
    QTest::newRow("one pixel past the right") << QRect(541, 380, 100, 100) << 0;
    QTest::newRow("one pixel past the bottom") << QRect(540, 381, 100, 100) << 0;
    QTest::newRow("negative offset") << QRect(-1, 0, 100, 100) << 0;
    QTest::newRow("empty") << QRect(10, 10, 0, 100) << 0;
}

void TestPictureImage::crop()
{
    QFETCH(QRect, block);
    QFETCH(int, result);
    const QImage source = Gradient(640, 480);
    auto item = Editable(source);
    QVERIFY(item);
    QCOMPARE(item->CropImage(block.width(), block.height(), block.x(), block.y()), result);
    QCOMPARE(item->IsImageEdited(), result == 1);
    if (result)
        QCOMPARE(MeanDifference(Working(*item), source.copy(block)), 0.0);
    else
        QCOMPARE(item->GetImageWidth(), 640);
}

void TestPictureImage::editsNeedTheEditableForm()
{
    CPictureItem item;
    item.SetPathname(Png(Gradient(8, 8)).toStdString());
    QCOMPARE(item.EnsureLoaded(), 1);
    const int done = item.RotateImage() + item.AdjustBrightness(false, 10) +
                     item.AdjustContrast(true, 10) + item.ScaleImage(4, 4) +
                     item.CropImage(4, 4, 0, 0) + item.RevertImage() + item.CommitImage() +
                     item.SaveImageAs(m_dir.filePath("never.png").toStdString());
    QCOMPARE(done, 0);
    QVERIFY(!QFileInfo::exists(m_dir.filePath("never.png")));
    // Once editable, a later load keeps the edits.
    QCOMPARE(item.LoadImage(CPictureItem::kEditableForm), 1);
    QCOMPARE(item.RotateImage(), 1);
    QCOMPARE(item.LoadImage(CPictureItem::kDisplayForm), 1);
    QCOMPARE(item.IsImageEdited(), true);
    // A copy has the entry, not the decoded picture.
    CPictureItem copy(item);
    QCOMPARE(copy.GetImageMode(), int(CPictureItem::kDisplayForm));
    QCOMPARE(copy.IsImageEdited(), false);
}

void TestPictureImage::revertAndCommit()
{
    const QString path = Png(Gradient(40, 20));
    QFile file(path);
    QVERIFY(file.open(QIODevice::ReadOnly));
    const QByteArray before = file.readAll();
    file.close();
    auto item = std::make_unique<CPictureItem>();
    item->SetPathname(path.toStdString());
    QCOMPARE(item->LoadImage(CPictureItem::kEditableForm), 1);
    QCOMPARE(item->RotateImage(), 1);
    QCOMPARE(item->RevertImage(), 1);
    QCOMPARE(item->CommitImage(), 1);
    QVERIFY(file.open(QIODevice::ReadOnly));
    QCOMPARE(file.readAll(), before);
    file.close();

    QCOMPARE(item->RotateImage(), 1);
    QCOMPARE(item->CommitImage(), 1);
    QCOMPARE(Identify(path), QStringLiteral("PNG 20 40"));
    QCOMPARE(item->GetImageWidth(), 20); // released, then read from the saved file

    // Under a name no encoder lists the picture loads, but cannot be written back.
    const QString odd = m_dir.filePath("named.xyz");
    QVERIFY(QFile::copy(path, odd));
    item->SetPathname(odd.toStdString());
    item->ReleaseImage();
    QCOMPARE(item->RotateImage(), 1);
    QCOMPARE(item->CommitImage(), 0);
    QCOMPARE(item->IsImageEdited(), true);
    QCOMPARE(Identify(odd), QStringLiteral("PNG 20 40"));
}

void TestPictureImage::saveByExtension_data()
{
    QTest::addColumn<QString>("name");
    QTest::addColumn<QString>("format"); // empty: nothing may be written
    QTest::addColumn<double>("tolerance");
    const auto row = [](const char* name, const char* file, const char* format, double tolerance) {
        QTest::newRow(name) << file << format << tolerance;
    };
    // Sharp colour edges cost JPEG a few levels (its colour is halved).
    row("jpg", "out.jpg", "JPEG", 6.0);
    row("JPG upper case", "OUT2.JPG", "JPEG", 6.0);
    row("jpeg", "out.jpeg", "JPEG", 6.0);
    row("png", "out.png", "PNG", 0.0);
    row("Png mixed case", "out2.Png", "PNG", 0.0);
    row("bmp", "out.bmp", "BMP", 0.0);
    row("gif", "out.gif", "GIF", 0.0);
    row("unknown extension", "out.xyz", "", 0.0);
    row("no extension", "out", "", 0.0);
    row("trailing dot", "out.", "", 0.0);
    row("wmf has no encoder", "out.wmf", "", 0.0);
    row("dot in the folder only", "a.b/out", "", 0.0);
}

void TestPictureImage::saveByExtension()
{
    QFETCH(QString, name);
    QFETCH(QString, format);
    QFETCH(double, tolerance);
    // 100 colours: every format, GIF included, can hold them exactly.
    QImage image(40, 30, QImage::Format_RGB32);
    for (int y = 0; y < 30; ++y) {
        for (int x = 0; x < 40; ++x)
            image.setPixel(x, y, qRgb((x / 4) * 25, (y / 3) * 25, 90));
    }
    QDir(m_dir.path()).mkpath(QStringLiteral("a.b"));
    auto item = Editable(image);
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
    const double difference = MeanDifference(MagickPixels(target), image);
    QVERIFY2(difference >= 0 && difference <= tolerance, qPrintable(QString::number(difference)));
}

void TestPictureImage::gifPalette()
{
    // Thousands of smooth colours through 256. Dithering trades per-pixel error
    // for the right colour over an area: both are judged, the second on 4 x 4
    // averages (ImageMagick's own GIF of it: 5.2 and 0.8).
    const QImage image = Gradient(96, 96);
    auto item = Editable(image);
    QVERIFY(item);
    const QString target = m_dir.filePath("many.gif");
    QCOMPARE(item->SaveImageAs(target.toStdString()), 1);
    const QImage decoded = MagickPixels(target);
    QVERIFY(MeanDifference(decoded, image) >= 0 && MeanDifference(decoded, image) < 6.0);
    const auto areas = [](const QImage& i) {
        return i.scaled(24, 24, Qt::IgnoreAspectRatio, Qt::SmoothTransformation);
    };
    QVERIFY(MeanDifference(areas(decoded), areas(image)) < 1.6);

    // Pixels less than half opaque become the transparent colour.
    QImage alpha(3, 1, QImage::Format_ARGB32);
    alpha.setPixel(0, 0, qRgba(0, 0, 0, 0));
    alpha.setPixel(1, 0, qRgba(255, 0, 0, 200));
    alpha.setPixel(2, 0, qRgba(0, 0, 255, 100));
    QCOMPARE(Editable(alpha)->SaveImageAs(target.toStdString()), 1);
    const QByteArray rgba = Magick("convert", {target, "-depth", "8", "rgba:-"});
    QCOMPARE(rgba.size(), 12);
    QCOMPARE(rgba.at(3), '\0');
    QCOMPARE(rgba.mid(4, 4).toHex(), QByteArray("ff0000ff"));
    QCOMPARE(rgba.at(11), '\0');
}

void TestPictureImage::decodeLimit()
{
    // A real JPEG whose frame header is changed to claim 60000 x 60000.
    QByteArray jpeg;
    QBuffer buffer(&jpeg);
    buffer.open(QIODevice::WriteOnly);
    Gradient(16, 16).save(&buffer, "JPEG");
    const int sof = int(jpeg.indexOf("\xFF\xC0"));
    jpeg.replace(sof + 5, 4, QByteArray("\xEA\x60\xEA\x60", 4));
    CPictureItem item;
    item.SetPathname(WriteFile(m_dir.filePath("huge.jpg"), jpeg).toStdString());
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
    QCOMPARE(drawn.GetExifRead(), 0); // only LoadImage reads the camera data
    CPictureItem loaded;
    loaded.SetPathname(sample.toStdString());
    QCOMPARE(loaded.LoadImage(CPictureItem::kDisplayForm), 1);
    QCOMPARE(loaded.GetExifInfo().cameraModel, std::string("Canon EOS 40D"));
}

QTEST_MAIN(TestPictureImage)
#include "tst_picture_image.moc"
