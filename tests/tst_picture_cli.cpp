// hearthbook-cli exif, thumbnail and picture, end to end.

#include "image_checks.h"
#include "tests/support/cli_runner.h"

#include <QFileInfo>
#include <QTemporaryDir>
#include <QtTest>

namespace {

const QString kCanon = QStringLiteral(HB_SHARED_TESTDATA "/exif-samples/jpg/Canon_40D.jpg");
const QString kNikon = QStringLiteral(HB_SHARED_TESTDATA "/exif-samples/jpg/Nikon_D70.jpg");

} // namespace

class TestPictureCli : public QObject
{
    Q_OBJECT

private slots:
    void initTestCase();
    void exif();
    void thumbnail();
    void picture_data();
    void picture();

private:
    QTemporaryDir m_dir;
    QString m_source; // 6 x 3, without camera data
};

void TestPictureCli::initTestCase()
{
    QVERIFY(m_dir.isValid());
    qputenv("XDG_CACHE_HOME", QFile::encodeName(m_dir.filePath("cache")));
    m_source = m_dir.filePath("source.png");
    QVERIFY(Gradient(6, 3).save(m_source));
    if (Identify(m_source) != QLatin1String("PNG 6 3"))
        QSKIP("ImageMagick is needed as the independent decoder");
    if (!QFileInfo::exists(kCanon) || !QFileInfo::exists(kNikon))
        QSKIP("camera samples not found");
}

void TestPictureCli::exif()
{
    CliResult run = RunCli({"exif", kCanon});
    QCOMPARE(run.exitCode, 0);
    QVERIFY(run.out.startsWith("Camera Make:\tCanon\r\nCamera Model:\tCanon EOS 40D\r\n"
                               "Date/Time:\t2008:05:30 15:56:01\r\n"));
    QVERIFY(run.out.contains("\r\nExposure time:\t0.006 (1/160)\r\n"));
    for (const QString& none : {m_source, m_dir.filePath("none.jpg")}) {
        run = RunCli({"exif", none});
        QCOMPARE(run.exitCode, 1);
        QCOMPARE(run.out, QByteArray());
        QVERIFY(run.err.contains(QFileInfo(none).fileName().toUtf8()));
    }
    // Several files: each report headed by its name; one without data makes exit 1.
    run = RunCli({"exif", kCanon, m_source, kNikon});
    QCOMPARE(run.exitCode, 1);
    QVERIFY(run.out.startsWith("==> " + QFile::encodeName(kCanon) + " <==\r\nCamera Make:\tCanon"));
    const qsizetype second =
        run.out.indexOf("\r\n\r\n==> " + QFile::encodeName(kNikon) + " <==\r\n");
    QVERIFY(second > 0);
    QVERIFY(run.out.mid(second).contains("\r\nCamera Model:\tNIKON D70\r\n"));
    QCOMPARE(run.out.count("==> "), 2);
}

void TestPictureCli::thumbnail()
{
    const QString picture = m_dir.filePath("wide.jpg");
    QVERIFY(Gradient(1000, 500).save(picture, "JPEG"));
    const QString out = m_dir.filePath("thumb.png");
    QCOMPARE(RunCli({"thumbnail", picture, "--size", "50", "--out", out}).exitCode, 0);
    QCOMPARE(Identify(out), QStringLiteral("PNG 50 25"));
    QCOMPARE(QDir(m_dir.filePath("cache/thumbnails/normal")).entryList(QDir::Files).size(), 1);

    QCOMPARE(RunCli({"thumbnail", picture, "--out", out}).exitCode, 1);
    QCOMPARE(RunCli({"thumbnail", picture, "--size", "0", "--out", out}).exitCode, 1);
    const QString none = m_dir.filePath("none.jpg");
    QCOMPARE(RunCli({"thumbnail", none, "--size", "9", "--out", out}).exitCode, 3);
    QCOMPARE(RunCli({"thumbnail", m_dir.filePath("cache"), "--size", "9", "--out", out}).exitCode,
             3);
}

void TestPictureCli::picture_data()
{
    QTest::addColumn<QStringList>("operations");
    QTest::addColumn<QString>("extension");
    QTest::addColumn<int>("exitCode");
    QTest::addColumn<QString>("identified"); // width and height of what was written
    const QStringList rotate{"--rotate"};
    QTest::newRow("rotate then scale")
        << rotate + QStringList{"--scale", "4x2"} << "bmp" << 0 << "4 2";
    QTest::newRow("scale then rotate")
        << QStringList{"--scale", "4x2"} + rotate << "bmp" << 0 << "2 4";
    QTest::newRow("crop after rotate")
        << rotate + QStringList{"--crop", "3x5+0+1"} << "bmp" << 0 << "3 5";
    QTest::newRow("crop outside the picture")
        << QStringList{"--crop", "4x4+0+0"} << "bmp" << 3 << "";
    QTest::newRow("malformed crop") << QStringList{"--crop", "4x4"} << "bmp" << 3 << "";
    QTest::newRow("amount out of range") << QStringList{"--brighten", "300"} << "bmp" << 3 << "";
    QTest::newRow("unknown extension") << rotate << "xyz" << 1 << "";
}

void TestPictureCli::picture()
{
    QFETCH(QStringList, operations);
    QFETCH(QString, extension);
    QFETCH(int, exitCode);
    QFETCH(QString, identified);
    const QString out = m_dir.filePath("edited." + extension);
    QFile::remove(out);
    QCOMPARE(RunCli(QStringList{"picture", m_source, "--out", out} + operations).exitCode,
             exitCode);
    QCOMPARE(Identify(out).section(' ', 1), identified);
}

QTEST_GUILESS_MAIN(TestPictureCli)
#include "tst_picture_cli.moc"
