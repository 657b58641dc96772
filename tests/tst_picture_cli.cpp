// hearthbook-cli exif, thumbnail and picture, end to end.

#include "image_checks.h"

#include <QFileInfo>
#include <QTemporaryDir>
#include <QtTest>

namespace {

struct Run
{
    int exitCode = -1;
    QByteArray out;
    QByteArray err;
};

Run Cli(const QStringList& arguments, const QString& cacheHome)
{
    QProcess process;
    QProcessEnvironment environment = QProcessEnvironment::systemEnvironment();
    environment.insert(QStringLiteral("XDG_CACHE_HOME"), cacheHome);
    process.setProcessEnvironment(environment);
    process.start(QStringLiteral(HB_CLI_PATH), arguments);
    Run run;
    if (!process.waitForFinished(60000))
        return run;
    run.exitCode = process.exitStatus() == QProcess::NormalExit ? process.exitCode() : -1;
    run.out = process.readAllStandardOutput();
    run.err = process.readAllStandardError();
    return run;
}

} // namespace

class TestPictureCli : public QObject
{
    Q_OBJECT

private slots:
    void initTestCase();
    void exifReport();
    void exifWithoutExif_data();
    void exifWithoutExif();
    void exifOfSeveralFiles();
    void thumbnail();
    void pictureOperationsInOrder_data();
    void pictureOperationsInOrder();
    void pictureValues();
    void pictureRefusals_data();
    void pictureRefusals();

private:
    QTemporaryDir m_dir;
    QString m_cache;
    QString m_source; // 6 x 3
};

void TestPictureCli::initTestCase()
{
    QVERIFY(m_dir.isValid());
    m_cache = m_dir.filePath("cache");
    QImage image(6, 3, QImage::Format_RGB32);
    image.fill(qRgb(100, 150, 200));
    image.setPixel(0, 0, qRgb(10, 20, 250));
    m_source = m_dir.filePath("source.png");
    QVERIFY(image.save(m_source));
    if (Identify(m_source) != QLatin1String("PNG 6 3"))
        QSKIP("ImageMagick is needed as the independent decoder");
}

void TestPictureCli::exifReport()
{
    const QString sample = QStringLiteral(HB_SHARED_TESTDATA "/exif-samples/jpg/Canon_40D.jpg");
    if (!QFileInfo::exists(sample))
        QSKIP("camera samples not found");
    const Run run = Cli({"exif", sample}, m_cache);
    QCOMPARE(run.exitCode, 0);
    QVERIFY(run.out.startsWith("Camera Make:\tCanon\r\nCamera Model:\tCanon EOS 40D\r\n"
                               "Date/Time:\t2008:05:30 15:56:01\r\n"));
    QVERIFY(run.out.contains("\r\nExposure time:\t0.006 (1/160)\r\n"));
    QVERIFY(run.out.endsWith("\r\n"));
}

void TestPictureCli::exifWithoutExif_data()
{
    QTest::addColumn<QString>("name");
    QTest::newRow("PNG") << "source.png";
    QTest::newRow("missing file") << "none.jpg";
}

void TestPictureCli::exifWithoutExif()
{
    QFETCH(QString, name);
    const Run run = Cli({"exif", m_dir.filePath(name)}, m_cache);
    QCOMPARE(run.exitCode, 1);
    QCOMPARE(run.out, QByteArray());
    QVERIFY(!run.err.isEmpty());
}

void TestPictureCli::exifOfSeveralFiles()
{
    const QString a = QStringLiteral(HB_SHARED_TESTDATA "/exif-samples/jpg/Canon_40D.jpg");
    const QString b = QStringLiteral(HB_SHARED_TESTDATA "/exif-samples/jpg/Nikon_D70.jpg");
    if (!QFileInfo::exists(a) || !QFileInfo::exists(b))
        QSKIP("camera samples not found");
    Run run = Cli({"exif", a, b}, m_cache);
    QCOMPARE(run.exitCode, 0);
    QVERIFY(run.out.startsWith("==> " + QFile::encodeName(a) + " <==\r\nCamera Make:\tCanon\r\n"));
    const qsizetype second = run.out.indexOf("\r\n\r\n==> " + QFile::encodeName(b) + " <==\r\n");
    QVERIFY(second > 0);
    QVERIFY(run.out.mid(second).contains("\r\nCamera Model:\tNIKON D70\r\n"));
    QCOMPARE(run.out.count("==> "), 2);

    run = Cli({"exif", a, m_source}, m_cache);
    QCOMPARE(run.exitCode, 1);
    QCOMPARE(run.out.count("==> "), 1);
    QVERIFY(run.err.contains("source.png"));
}

void TestPictureCli::thumbnail()
{
    const QString picture = m_dir.filePath("wide.jpg");
    QVERIFY(Gradient(1000, 500).save(picture, "JPEG"));
    const QString out = m_dir.filePath("thumb.png");
    const Run run = Cli({"thumbnail", picture, "--size", "50", "--out", out}, m_cache);
    QCOMPARE(run.exitCode, 0);
    QCOMPARE(Identify(out), QStringLiteral("PNG 50 25"));
    QCOMPARE(QDir(m_cache + "/thumbnails/normal").entryList(QDir::Files).size(), 1);

    QCOMPARE(Cli({"thumbnail", picture, "--out", out}, m_cache).exitCode, 1);
    QCOMPARE(Cli({"thumbnail", picture, "--size", "0", "--out", out}, m_cache).exitCode, 1);
    QCOMPARE(Cli({"thumbnail", m_dir.filePath("none.jpg"), "--size", "9", "--out", out}, m_cache)
                 .exitCode,
             3);
    QFile junk(m_dir.filePath("junk.jpg"));
    QVERIFY(junk.open(QIODevice::WriteOnly));
    junk.write("junk");
    junk.close();
    QCOMPARE(Cli({"thumbnail", junk.fileName(), "--size", "9", "--out", out}, m_cache).exitCode, 3);
}

void TestPictureCli::pictureOperationsInOrder_data()
{
    QTest::addColumn<QStringList>("operations");
    QTest::addColumn<QString>("identified");
    QTest::newRow("rotate then scale") << QStringList{"--rotate", "--scale", "4x2"} << "4 2";
    QTest::newRow("scale then rotate") << QStringList{"--scale", "4x2", "--rotate"} << "2 4";
    QTest::newRow("rotate twice") << QStringList{"--rotate", "--rotate"} << "6 3";
    QTest::newRow("crop after rotate") << QStringList{"--rotate", "--crop", "3x5+0+1"} << "3 5";
    QTest::newRow("brightness drops the rotation")
        << QStringList{"--rotate", "--brighten", "5"} << "6 3";
}

void TestPictureCli::pictureOperationsInOrder()
{
    QFETCH(QStringList, operations);
    QFETCH(QString, identified);
    const QString out = m_dir.filePath("ordered.bmp");
    const Run run = Cli(QStringList{"picture", m_source, "--out", out} + operations, m_cache);
    QCOMPARE(run.exitCode, 0);
    QCOMPARE(Identify(out).section(' ', 1), identified);
}

void TestPictureCli::pictureValues()
{
    const QString out = m_dir.filePath("values.png");
    const Run run = Cli({"picture", m_source, "--out", out, "--darken", "20", "--contrast", "10",
                         "--crop", "2x1+0+0"},
                        m_cache);
    QCOMPARE(run.exitCode, 0);
    const QImage image = MagickPixels(out);
    QCOMPARE(image.size(), QSize(2, 1));
    // (10,20,250) darkens to (0,0,230), mean 76: dark, so 10 darker.
    QCOMPARE(image.pixel(0, 0), qRgb(0, 0, 220));
    // (100,150,200) darkens to (80,130,180), mean 130: light, so 10 lighter.
    QCOMPARE(image.pixel(1, 0), qRgb(90, 140, 190));
}

void TestPictureCli::pictureRefusals_data()
{
    QTest::addColumn<QStringList>("arguments");
    QTest::addColumn<int>("exitCode");
    QTest::newRow("crop outside the picture") << QStringList{"--crop", "4x4+0+0"} << 3;
    QTest::newRow("malformed crop") << QStringList{"--crop", "4x4"} << 3;
    QTest::newRow("amount out of range") << QStringList{"--brighten", "300"} << 3;
    QTest::newRow("no out") << QStringList{} << 1;
}

void TestPictureCli::pictureRefusals()
{
    QFETCH(QStringList, arguments);
    QFETCH(int, exitCode);
    const QString out = m_dir.filePath("refused.png");
    QStringList all{"picture", m_source};
    if (!arguments.isEmpty())
        all << "--out" << out;
    const Run run = Cli(all + arguments, m_cache);
    QCOMPARE(run.exitCode, exitCode);
    QVERIFY(!QFileInfo::exists(out));
    const QString unknown = m_dir.filePath("refused.xyz");
    QCOMPARE(Cli({"picture", m_source, "--out", unknown, "--rotate"}, m_cache).exitCode, 1);
    QVERIFY(!QFileInfo::exists(unknown));
}

QTEST_GUILESS_MAIN(TestPictureCli)
#include "tst_picture_cli.moc"
