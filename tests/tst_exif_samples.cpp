// The EXIF reader on real camera JPEGs, checked against exiv2's reading of
// the same files (run at test time, as an independent reader).

#include "pictures/exif_info.h"

#include <QDirIterator>
#include <QProcess>
#include <QRegularExpression>
#include <QStandardPaths>
#include <QtTest>

namespace {

const QString kSamples = QStringLiteral(HB_SHARED_TESTDATA "/exif-samples/jpg");

// exiv2's plain values by key ("Exif.Image.Make" -> "Canon"), first occurrence.
QHash<QString, QByteArray> Exiv2Values(const QString& path)
{
    QProcess process;
    process.start(QStringLiteral("exiv2"), {QStringLiteral("-PEkv"), path});
    process.waitForFinished(30000);
    QHash<QString, QByteArray> values;
    static const QRegularExpression line(QStringLiteral("^(Exif\\.\\S+) *(.*)$"));
    for (const QByteArray& raw : process.readAllStandardOutput().split('\n')) {
        const QRegularExpressionMatch m = line.match(QString::fromLatin1(raw));
        if (m.hasMatch() && !values.contains(m.captured(1)))
            values.insert(m.captured(1), m.captured(2).toLatin1());
    }
    return values;
}

// "71/10" -> 7.1; a zero denominator reads 0, as in the reader's rules.
double Rational(const QByteArray& value)
{
    const QList<QByteArray> parts = value.split(' ').value(0).split('/');
    const double numerator = parts.value(0).toDouble();
    const double denominator = parts.size() > 1 ? parts.at(1).toDouble() : 1.0;
    return denominator == 0 ? 0.0 : numerator / denominator;
}

bool Near(float actual, double expected)
{
    return std::abs(double(actual) - expected) <= 1e-6 * std::max(1.0, std::abs(expected));
}

} // namespace

class TestExifSamples : public QObject
{
    Q_OBJECT

private slots:
    void initTestCase();
    void camera_data();
    void camera();
    void cleanupTestCase();

private:
    int m_makesCompared = 0;
    bool m_skipped = false;
};

void TestExifSamples::initTestCase()
{
    m_skipped = true;
    if (QStandardPaths::findExecutable(QStringLiteral("exiv2")).isEmpty())
        QSKIP("exiv2 is needed as the independent reader (scripts/setup-debian.sh installs it)");
    if (!QFileInfo(kSamples).isDir())
        QSKIP("the camera samples are not there");
    m_skipped = false;
}

void TestExifSamples::camera_data()
{
    QTest::addColumn<QString>("path");
    QDirIterator it(kSamples, {QStringLiteral("*.jpg"), QStringLiteral("*.jpeg")}, QDir::Files,
                    QDirIterator::Subdirectories);
    QStringList paths;
    while (it.hasNext())
        paths << it.next();
    paths.sort();
    for (const QString& path : paths)
        QTest::newRow(qPrintable(path.mid(kSamples.size() + 1))) << path;
}

void TestExifSamples::camera()
{
    QFETCH(QString, path);
    const QHash<QString, QByteArray> e = Exiv2Values(path);
    CExifInfo info;
    info.ReadExif(QFile::encodeName(path).toStdString());
    QCOMPARE(info.exifRead, e.isEmpty() ? 0 : 1);

    // Texts: the first 31 (make), 39 (model) and 19 (date) bytes.
    if (e.contains("Exif.Image.Make")) {
        QCOMPARE(QByteArray::fromStdString(info.cameraMake), e.value("Exif.Image.Make").left(31));
        ++m_makesCompared;
    }
    if (e.contains("Exif.Image.Model"))
        QCOMPARE(QByteArray::fromStdString(info.cameraModel), e.value("Exif.Image.Model").left(39));
    if (e.contains("Exif.Photo.DateTimeOriginal"))
        QCOMPARE(QByteArray::fromStdString(info.dateTime),
                 e.value("Exif.Photo.DateTimeOriginal").left(19));

    if (e.contains("Exif.Photo.ExposureTime"))
        QVERIFY2(Near(info.exposureTime, Rational(e.value("Exif.Photo.ExposureTime"))),
                 qPrintable(QString::number(double(info.exposureTime))));
    // Without an F-number the aperture value stands in, then the maximum aperture.
    double fNumber = Rational(e.value("Exif.Photo.FNumber", "0"));
    if (fNumber == 0)
        fNumber = Rational(e.value("Exif.Photo.ApertureValue", "0"));
    if (fNumber == 0)
        fNumber = Rational(e.value("Exif.Photo.MaxApertureValue", "0"));
    QVERIFY2(Near(info.fNumber, fNumber), qPrintable(QString::number(double(info.fNumber))));
    if (e.contains("Exif.Photo.ISOSpeedRatings"))
        QCOMPARE(info.isoSpeed, e.value("Exif.Photo.ISOSpeedRatings").split(' ').value(0).toInt());
    if (e.contains("Exif.Photo.FocalLength"))
        QVERIFY(Near(info.focalLength, Rational(e.value("Exif.Photo.FocalLength"))));
    if (e.contains("Exif.Photo.Flash"))
        QCOMPARE(info.flashUsed, (e.value("Exif.Photo.Flash").toInt() & 0x0F) != 0 ? 1 : 0);
}

void TestExifSamples::cleanupTestCase()
{
    // Guards against a silently empty comparison (exiv2 output not understood).
    if (m_skipped)
        return;
    QVERIFY2(m_makesCompared >= 50, qPrintable(QString::number(m_makesCompared)));
}

QTEST_GUILESS_MAIN(TestExifSamples)
#include "tst_exif_samples.moc"
