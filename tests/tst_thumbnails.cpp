// Thumbnails: the freedesktop cache on disk, reduced-size decoding with the
// EXIF orientation, failure records, the asynchronous service and the
// picture cell drawn from thumbnails.

#include "catalog/picture_item.h"
#include "image_checks.h"
#include "pictures/picture_cell.h"
#include "pictures/thumbnail_service.h"

#include <QDir>
#include <QPainter>
#include <QSignalSpy>
#include <QTemporaryDir>
#include <QtTest>

#include <sys/stat.h>
#include <utime.h>

namespace {

int Mode(const QString& path)
{
    struct stat st;
    return ::stat(QFile::encodeName(path).constData(), &st) == 0 ? int(st.st_mode & 0777) : -1;
}

qint64 MTime(const QString& path)
{
    struct stat st;
    return ::stat(QFile::encodeName(path).constData(), &st) == 0 ? qint64(st.st_mtime) : -1;
}

void SetMTime(const QString& path, qint64 seconds)
{
    struct utimbuf times = {time_t(seconds), time_t(seconds)};
    ::utime(QFile::encodeName(path).constData(), &times);
}

QString WriteJpeg(const QString& path, const QImage& image)
{
    return image.save(path, "JPEG", 90) ? path : QString();
}

} // namespace

class TestThumbnails : public QObject
{
    Q_OBJECT

private slots:
    void init();
    void fileUri_data();
    void fileUri();
    void writesFreedesktopThumbnail();
    void validOnlyForTheSameFile();
    void failureRecord();
    void orientationAndReducedDecode_data();
    void orientationAndReducedDecode();
    void serviceAnswersLater();
    void invalidateForgetsEverything();
    void pictureCellFromThumbnails();
    void pictureCellArea_data();
    void pictureCellArea();

private:
    std::unique_ptr<QTemporaryDir> m_dir;
    QString m_root;
};

void TestThumbnails::init()
{
    m_dir = std::make_unique<QTemporaryDir>();
    QVERIFY(m_dir->isValid());
    m_root = m_dir->filePath("cache/thumbnails");
}

void TestThumbnails::fileUri_data()
{
    QTest::addColumn<QString>("path");
    QTest::addColumn<QByteArray>("uri");
    QTest::addColumn<QString>("hash");
    // The example in the freedesktop.org thumbnail standard itself.
    QTest::newRow("plain") << "/home/jens/photos/me.png"
                           << QByteArray("file:///home/jens/photos/me.png")
                           << "c6ee772d9e49320e97ec29a7eb5b1697.png";
    QTest::newRow("blank and umlaut")
        << "/tmp/a b/\u00fc.jpg" << QByteArray("file:///tmp/a%20b/%C3%BC.jpg") << "";
    QTest::newRow("reserved characters")
        << "/x/#1?%[]^;.jpg" << QByteArray("file:///x/%231%3F%25%5B%5D%5E%3B.jpg") << "";
    QTest::newRow("characters left alone")
        << "/x/a!$&'()*+,-.:=@_~.jpg" << QByteArray("file:///x/a!$&'()*+,-.:=@_~.jpg") << "";
}

void TestThumbnails::fileUri()
{
    QFETCH(QString, path);
    QFETCH(QByteArray, uri);
    QFETCH(QString, hash);
    QCOMPARE(CThumbnailCache::FileUri(path), uri);
    if (!hash.isEmpty())
        QCOMPARE(CThumbnailCache::HashName(uri), hash);
}

void TestThumbnails::writesFreedesktopThumbnail()
{
    const QString picture = WriteJpeg(m_dir->filePath("wide.jpg"), Gradient(1000, 500));
    CThumbnailService service(m_root);
    const CThumbnail made = service.Make(picture, 100);
    QCOMPARE(made.status, CThumbnail::Ready);
    QCOMPARE(made.image.size(), QSize(128, 64));
    QCOMPARE(made.pictureSize, QSize(1000, 500));

    const QByteArray uri = "file://" + QFile::encodeName(picture);
    const QString stored = m_root + "/normal/" +
                           QCryptographicHash::hash(uri, QCryptographicHash::Md5).toHex() + ".png";
    QCOMPARE(QDir(m_root + "/normal").entryList(QDir::Files | QDir::Hidden),
             QStringList{QFileInfo(stored).fileName()});
    QCOMPARE(Mode(stored), 0600);
    QCOMPARE(Mode(m_root), 0700);
    QCOMPARE(Mode(m_root + "/normal"), 0700);
    const QByteArray keys = Magick(
        "identify", {"-format", "%[Thumb::URI] %[Thumb::MTime] %[Thumb::Size] %w %h", stored});
    QCOMPARE(QString::fromUtf8(keys), QStringLiteral("%1 %2 %3 128 64")
                                          .arg(QString::fromUtf8(uri))
                                          .arg(MTime(picture))
                                          .arg(QFileInfo(picture).size()));
    // A picture smaller than the flavor is never enlarged.
    const QString small = WriteJpeg(m_dir->filePath("small.jpg"), Gradient(40, 30));
    QCOMPARE(service.Make(small, 128).image.size(), QSize(40, 30));
}

void TestThumbnails::validOnlyForTheSameFile()
{
    const QString picture = WriteJpeg(m_dir->filePath("p.jpg"), Gradient(300, 200));
    const qint64 mtime = MTime(picture);
    CThumbnailCache cache(m_root);
    QCOMPARE(MakeThumbnail(picture, 128, &cache).status, CThumbnail::Ready);
    // Replace the stored thumbnail by a green one under the same keys: it is
    // what a later request must get while the picture is unchanged.
    CThumbnailKey key;
    QVERIFY(CThumbnailCache::KeyFor(picture, key));
    QImage green(128, 85, QImage::Format_RGB32);
    green.fill(Qt::green);
    QVERIFY(cache.Write(CThumbnailCache::Flavor::Normal, key, green, QSize(300, 200)));
    CThumbnail again = MakeThumbnail(picture, 128, &cache);
    QCOMPARE(again.image.pixel(60, 40), qRgb(0, 255, 0));
    QCOMPARE(again.pictureSize, QSize(300, 200));

    SetMTime(picture, mtime - 100);
    again = MakeThumbnail(picture, 128, &cache);
    QCOMPARE(again.status, CThumbnail::Ready);
    QVERIFY(again.image.pixel(60, 40) != qRgb(0, 255, 0));
    const QString stored = cache.ThumbnailPath(CThumbnailCache::Flavor::Normal, key.uri);
    QCOMPARE(Magick("identify", {"-format", "%[Thumb::MTime]", stored}).toLongLong(), mtime - 100);
}

void TestThumbnails::failureRecord()
{
    const QString junk = WriteFile(m_dir->filePath("junk.jpg"), "not a picture at all");
    CThumbnailCache cache(m_root);
    QCOMPARE(MakeThumbnail(junk, 128, &cache).status, CThumbnail::Failed);
    const QString record = cache.FailurePath(CThumbnailCache::FileUri(junk));
    QVERIFY(record.startsWith(m_root + "/fail/hearthbook-"));
    QCOMPARE(Magick("identify", {"-format", "%[Thumb::MTime]", record}).toLongLong(), MTime(junk));
    QCOMPARE(Mode(record), 0600);
    QCOMPARE(MakeThumbnail(junk, 128, &cache).status, CThumbnail::Failed);

    // The file becomes a picture: the record no longer matches it.
    WriteJpeg(junk, Gradient(64, 64));
    SetMTime(junk, MTime(junk) + 5);
    QCOMPARE(MakeThumbnail(junk, 128, &cache).status, CThumbnail::Ready);
    QCOMPARE(MakeThumbnail(m_dir->filePath("none.jpg"), 128, &cache).status, CThumbnail::Missing);
}

void TestThumbnails::orientationAndReducedDecode_data()
{
    QTest::addColumn<QString>("name");
    for (const char* kind : {"landscape", "portrait"}) {
        for (int n = 1; n <= 8; ++n)
            QTest::addRow("%s_%d", kind, n) << QStringLiteral("%1_%2.jpg").arg(kind).arg(n);
    }
}

void TestThumbnails::orientationAndReducedDecode()
{
    QFETCH(QString, name);
    const QString path = QStringLiteral(HB_SHARED_TESTDATA "/exif-samples/jpg/orientation/") + name;
    if (!QFileInfo::exists(path))
        QSKIP("camera samples not found");
    // ImageMagick turns the picture upright and shrinks it the same way.
    const QString expectedPath = m_dir->filePath("expected.png");
    Magick("convert", {path, "-auto-orient", "-resize", "128x128", expectedPath});
    const QImage expected = MagickPixels(expectedPath);
    QVERIFY(!expected.isNull());
    const CThumbnail made = MakeThumbnail(path, 128, nullptr);
    QCOMPARE(made.status, CThumbnail::Ready);
    QCOMPARE(made.image.size(), expected.size());
    QCOMPARE(made.pictureSize, name.startsWith("landscape") ? QSize(600, 450) : QSize(450, 600));
    const double difference =
        MeanDifference(made.image.convertToFormat(QImage::Format_RGB32), expected);
    // Resampling differs (about 5 levels); a wrong turn or mirror differs by 40 or more.
    QVERIFY2(difference >= 0 && difference < 10.0, qPrintable(QString::number(difference)));
}

void TestThumbnails::serviceAnswersLater()
{
    const QString picture = WriteJpeg(m_dir->filePath("later.jpg"), Gradient(800, 600));
    CThumbnailService service(m_root);
    QSignalSpy ready(&service, &CThumbnailService::ThumbnailReady);
    QCOMPARE(service.Request(picture, 100).status, CThumbnail::Missing);
    QCOMPARE(service.Request(picture, 120).status, CThumbnail::Missing);
    QCOMPARE(service.PendingCount(), 1); // both sizes share the normal flavor
    QVERIFY(ready.wait(10000));
    QCOMPARE(ready.count(), 1);
    QCOMPARE(ready.at(0).at(0).toString(), QFileInfo(picture).absoluteFilePath());
    const CThumbnail known = service.Request(picture, 128);
    QCOMPARE(known.status, CThumbnail::Ready);
    QCOMPARE(known.image.size(), QSize(128, 96));
    QCOMPARE(service.PendingCount(), 0);

    const QString junk = WriteFile(m_dir->filePath("junk.png"), "junk");
    QCOMPARE(service.Request(junk, 64).status, CThumbnail::Missing);
    QVERIFY(ready.wait(10000));
    QCOMPARE(service.Request(junk, 64).status, CThumbnail::Failed);
    QCOMPARE(service.PendingCount(), 0);
}

void TestThumbnails::invalidateForgetsEverything()
{
    const QString picture = WriteJpeg(m_dir->filePath("edit.jpg"), Gradient(400, 300));
    CThumbnailService service(m_root);
    QCOMPARE(service.Make(picture, 128).image.size(), QSize(128, 96));
    const QString stored = service.GetDiskCache().ThumbnailPath(CThumbnailCache::Flavor::Normal,
                                                                CThumbnailCache::FileUri(picture));
    QVERIFY(QFileInfo::exists(stored));
    // The picture is rewritten within the same second: only Invalidate can tell.
    const qint64 mtime = MTime(picture);
    WriteJpeg(picture, Gradient(300, 400));
    SetMTime(picture, mtime);
    service.Invalidate(picture);
    QVERIFY(!QFileInfo::exists(stored));
    QCOMPARE(service.Request(picture, 128).status, CThumbnail::Missing);
    service.WaitForDone();
    QCOMPARE(service.Request(picture, 128).image.size(), QSize(96, 128));

    // A request invalidated before it is made is dropped when it arrives.
    QCOMPARE(service.Request(picture, 256).status, CThumbnail::Missing);
    service.Invalidate(picture);
    service.WaitForDone();
    QCOMPARE(service.PendingCount(), 0);
    QCOMPARE(service.Request(picture, 256).status, CThumbnail::Missing);
    service.CancelPending();
    service.WaitForDone();
}

void TestThumbnails::pictureCellFromThumbnails()
{
    QImage red(400, 300, QImage::Format_RGB32);
    red.fill(qRgb(255, 0, 0));
    CPictureItem item;
    item.SetPathname(WriteJpeg(m_dir->filePath("cell.jpg"), red).toStdString());
    item.SetLabel("cell");
    item.SetSequenceNumber(12);
    QCOMPARE(PictureCellCaption(item, true), QStringLiteral("#12 cell"));
    QCOMPARE(PictureCellCaption(item, false), QStringLiteral("cell"));
    item.SetSequenceNumber(0);
    QCOMPARE(PictureCellCaption(item, true), QStringLiteral("cell"));
    item.SetDisplayCaption(0);
    QCOMPARE(PictureCellCaption(item, true), QString());
    CThumbnailService service(m_root);
    CPictureCellOptions options;
    options.thumbnails = &service;
    QImage canvas(214, 160, QImage::Format_RGB32);
    canvas.fill(qRgb(0, 0, 255));
    {
        QPainter painter(&canvas);
        QCOMPARE(DrawPictureCell(painter, QRect(0, 0, 214, 160), item, options), 0);
    }
    QCOMPARE(canvas.pixel(107, 80), qRgb(0, 0, 255)); // nothing decoded while painting
    QCOMPARE(item.GetImageMode(), int(CPictureItem::kDisplayForm));
    service.WaitForDone();
    {
        QPainter painter(&canvas);
        QCOMPARE(DrawPictureCell(painter, QRect(0, 0, 214, 160), item, options), 1);
    }
    // Area (7, 5, 200, 150) less the frame loss: the picture is 186 x 138 at (14, 11).
    const QRgb centre = canvas.pixel(107, 80);
    QVERIFY2(qRed(centre) > 240 && qBlue(centre) < 15, qPrintable(QString::number(centre, 16)));
    QCOMPARE(canvas.pixel(12, 80), qRgb(0, 0, 255));
    QCOMPARE(canvas.pixel(107, 8), qRgb(0, 0, 255));
    QVERIFY(qRed(canvas.pixel(15, 11)) > 240);

    QFile::remove(QString::fromStdString(item.GetPathname()));
    canvas.fill(qRgb(0, 0, 255));
    QPainter painter(&canvas);
    QCOMPARE(DrawPictureCell(painter, QRect(0, 0, 214, 160), item, options), 0);
    painter.end();
    QCOMPARE(canvas.pixel(107, 80), qRgb(0, 0, 255));
}

void TestThumbnails::pictureCellArea_data()
{
    QTest::addColumn<int>("caption");
    QTest::addColumn<bool>("fit");
    QTest::addColumn<QRect>("area");
    QTest::newRow("caption, fit") << 15 << true << QRect(7, 10, 119, 65);
    QTest::newRow("caption, natural size") << 15 << false << QRect(0, 0, 133, 80);
    QTest::newRow("no caption, fit") << 0 << true << QRect(7, 5, 119, 90);
    QTest::newRow("no caption, natural size") << 0 << false << QRect(0, 0, 133, 100);
}

void TestThumbnails::pictureCellArea()
{
    QFETCH(int, caption);
    QFETCH(bool, fit);
    QFETCH(QRect, area);
    QCOMPARE(PictureCellArea(QRect(0, 0, 133, 100), caption, fit), area);
}

QTEST_MAIN(TestThumbnails)
#include "tst_thumbnails.moc"
