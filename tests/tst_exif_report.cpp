// The EXIF report text: every line, its formatting and the optional lines.

#include "pictures/exif_info.h"
#include "pictures/exif_report.h"

#include <QtTest>

namespace {

// The report's line that starts with head, or "" when there is none.
QString Line(const CExifInfo& info, const QString& head)
{
    const QStringList lines = QString::fromStdString(BuildExifReport(info)).split("\r\n");
    for (const QString& line : lines) {
        if (line.startsWith(head))
            return line;
    }
    return QString();
}

} // namespace

class TestExifReport : public QObject
{
    Q_OBJECT

private slots:
    void wholeReport();
    void rules_data();
    void rules();
};

void TestExifReport::wholeReport()
{
    CExifInfo i;
    i.cameraMake = "Canon";
    i.cameraModel = "Canon EOS 40D";
    i.dateTime = "2008:05:30 15:56:01";
    i.exifVersion = "0221";
    i.flashUsed = 1;
    i.imageWidth = 3888;
    i.imageHeight = 2592;
    i.xResolution = 72;
    i.yResolution = 300;
    i.resolutionUnit = 2;
    i.exposureTime = 1.0f / 160;
    i.exposureBias = -0.6666667f;
    i.exposureProgram = 3;
    i.brightness = 5.25f;
    i.meteringMode = 2;
    i.focalLength = 135;
    i.fNumber = 7.1f;
    i.isoSpeed = 400;
    i.compressionLevel = 3;
    i.subjectDistance = 12.9f;
    i.artist = "Ann Lee";
    i.copyright = "(c) 2008";
    i.software = "GIMP 2.4.5";
    i.comments = "Harbour";
    // The expected report is kept with LF line ends; the report has CR LF.
    QFile expected(QStringLiteral(HB_TEST_DATA "/exif/whole_report.txt"));
    QVERIFY(expected.open(QIODevice::ReadOnly));
    QCOMPARE(QByteArray::fromStdString(BuildExifReport(i)),
             expected.readAll().replace("\n", "\r\n"));
}

void TestExifReport::rules_data()
{
    QTest::addColumn<QString>("field");
    QTest::addColumn<double>("value");
    QTest::addColumn<QString>("head");
    QTest::addColumn<QString>("line"); // empty: no line starts with head
    auto row = [](const char* name, const char* field, double value, const char* head,
                  const char* line) { QTest::newRow(name) << field << value << head << line; };
    // Exposure time 0: 1 / 2^(shutter speed value); then 1/t + 0.5, truncated.
    const char* time = "Exposure time:";
    row("shutter 0", "shutter", 0, time, "Exposure time:\t1.000 (1/1)");
    row("shutter 6 is 1/64", "shutter", 6, time, "Exposure time:\t0.016 (1/64)");
    row("shutter -1 is 2 s", "shutter", -1, time, "Exposure time:\t2.000 (1/1)");
    row("shutter 200 underflows", "shutter", 200, time, "Exposure time:\t0.000 (1/2147483647)");
    row("1/8000 s", "time", 0.000125, time, "Exposure time:\t0.000 (1/8000)");
    row("30 s", "time", 30, time, "Exposure time:\t30.000 (1/0)");
    const char* x = "X Resolution:";
    row("unit 1 says inch", "unit", 1, x, "X Resolution:\t 5.0 (pixels per inch)");
    row("unit 3 says centimeter", "unit", 3, x, "X Resolution:\t 5.0 (pixels per centimeter)");
    row("unit 7 says inch", "unit", 7, x, "X Resolution:\t 5.0 (pixels per inch)");
    row("program 8", "program", 8, "Exposure program:", "Exposure program:\tLandscape mode");
    row("program 9 has no line", "program", 9, "Exposure program:", "");
    row("metering 6", "metering", 6, "Metering mode:", "Metering mode:\tPartial");
    row("metering 255 has no line", "metering", 255, "Metering mode:", "");
    row("compression -2 has no line", "compression", -2, "Compression Level:", "");
    row("distance 0.5 shows 0", "distance", 0.5, "Distance:", "Distance:\t\t0");
}

void TestExifReport::rules()
{
    QFETCH(QString, field);
    QFETCH(double, value);
    QFETCH(QString, head);
    QFETCH(QString, line);
    CExifInfo i;
    i.xResolution = 5;
    const auto v = float(value);
    const QHash<QString, std::function<void()>> set = {
        {"shutter", [&] { i.shutterSpeedValue = v; }},
        {"time", [&] { i.exposureTime = v; }},
        {"unit", [&] { i.resolutionUnit = int(v); }},
        {"program", [&] { i.exposureProgram = int(v); }},
        {"metering", [&] { i.meteringMode = int(v); }},
        {"compression", [&] { i.compressionLevel = int(v); }},
        {"distance", [&] { i.subjectDistance = v; }}};
    set.value(field)();
    QCOMPARE(Line(i, head), line);
}

QTEST_GUILESS_MAIN(TestExifReport)
#include "tst_exif_report.moc"
