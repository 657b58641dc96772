// The EXIF report text: every line, its formatting and the optional lines.

#include "pictures/exif_info.h"
#include "pictures/exif_report.h"

#include <QtTest>

namespace {

QStringList Lines(const std::string& report)
{
    QString text = QString::fromStdString(report);
    if (!text.endsWith(QLatin1String("\r\n")))
        return {QStringLiteral("<report does not end in CR LF>")};
    text.chop(2);
    return text.split(QStringLiteral("\r\n"));
}

QString LineStarting(const std::string& report, const QString& head)
{
    for (const QString& line : Lines(report)) {
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
    void emptyRecord();
    void exposureTime_data();
    void exposureTime();
    void resolutionUnit_data();
    void resolutionUnit();
    void optionalLines_data();
    void optionalLines();
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
    const std::string expected = "Camera Make:\tCanon\r\n"
                                 "Camera Model:\tCanon EOS 40D\r\n"
                                 "Date/Time:\t2008:05:30 15:56:01\r\n"
                                 "Version of EXIF:\t0221\r\n"
                                 "Flash Used:\tYes\r\n"
                                 "Coordinates:\t3888 x 2592\r\n"
                                 "X Resolution:\t72.0 (pixels per inch)\r\n"
                                 "Y Resolution:\t300.0 (pixels per inch)\r\n"
                                 "Exposure time:\t0.006 (1/160)\r\n"
                                 "Exposure bias:\t-0.667\r\n"
                                 "Exposure program:\tAperture priority\r\n"
                                 "Brightness:\t5.250\r\n"
                                 "Metering mode:\tCenter Weighted Average\r\n"
                                 "Focal Length:\t135.00 mm\r\n"
                                 "FNumber:\t\t7.100\r\n"
                                 "Exposure speed:\t0\r\n"
                                 "ISO Speed:\t400\r\n"
                                 "Compression Level:\t3\r\n"
                                 "Distance:\t\t12\r\n"
                                 "Artist:\t\tAnn Lee\r\n"
                                 "Copyright:\t\t(c) 2008\r\n"
                                 "Software:\t\tGIMP 2.4.5\r\n"
                                 "Comments:\tHarbour\r\n";
    QCOMPARE(BuildExifReport(i), expected);
}

void TestExifReport::emptyRecord()
{
    const std::string expected = "Camera Make:\t\r\n"
                                 "Camera Model:\t\r\n"
                                 "Date/Time:\t\r\n"
                                 "Version of EXIF:\t\r\n"
                                 "Flash Used:\tNo\r\n"
                                 "Coordinates:\t0 x 0\r\n"
                                 "X Resolution:\t 0.0 (pixels per inch)\r\n"
                                 "Y Resolution:\t 0.0 (pixels per inch)\r\n"
                                 "Exposure time:\t1.000 (1/1)\r\n"
                                 "Exposure bias:\t0.000\r\n"
                                 "Brightness:\t0.000\r\n"
                                 "Focal Length:\t0.00 mm\r\n"
                                 "FNumber:\t\t0.000\r\n"
                                 "Exposure speed:\t0\r\n"
                                 "ISO Speed:\t0\r\n";
    QCOMPARE(BuildExifReport(CExifInfo()), expected);
}

void TestExifReport::exposureTime_data()
{
    QTest::addColumn<float>("exposureTime");
    QTest::addColumn<float>("shutterSpeed");
    QTest::addColumn<QString>("line");
    QTest::newRow("neither set") << 0.0f << 0.0f << "Exposure time:\t1.000 (1/1)";
    QTest::newRow("shutter speed 6 is 1/64") << 0.0f << 6.0f << "Exposure time:\t0.016 (1/64)";
    QTest::newRow("shutter speed -1 is 2 s") << 0.0f << -1.0f << "Exposure time:\t2.000 (1/1)";
    QTest::newRow("exposure time wins") << 0.004f << 6.0f << "Exposure time:\t0.004 (1/250)";
    QTest::newRow("1/3 rounds to 1/3") << (1.0f / 3) << 0.0f << "Exposure time:\t0.333 (1/3)";
    QTest::newRow("long exposure") << 30.0f << 0.0f << "Exposure time:\t30.000 (1/0)";
    QTest::newRow("1/8000") << 0.000125f << 0.0f << "Exposure time:\t0.000 (1/8000)";
    QTest::newRow("shutter speed beyond float")
        << 0.0f << 200.0f << "Exposure time:\t0.000 (1/2147483647)";
}

void TestExifReport::exposureTime()
{
    QFETCH(float, exposureTime);
    QFETCH(float, shutterSpeed);
    QFETCH(QString, line);
    CExifInfo i;
    i.exposureTime = exposureTime;
    i.shutterSpeedValue = shutterSpeed;
    QCOMPARE(LineStarting(BuildExifReport(i), QStringLiteral("Exposure time:")), line);
}

void TestExifReport::resolutionUnit_data()
{
    QTest::addColumn<int>("unit");
    QTest::addColumn<QString>("word");
    QTest::newRow("1 none") << 1 << "inch";
    QTest::newRow("2 inch") << 2 << "inch";
    QTest::newRow("3 centimeter") << 3 << "centimeter";
    QTest::newRow("7 unknown") << 7 << "inch";
}

void TestExifReport::resolutionUnit()
{
    QFETCH(int, unit);
    QFETCH(QString, word);
    CExifInfo i;
    i.resolutionUnit = unit;
    i.xResolution = 118.11f;
    i.yResolution = 5;
    const std::string report = BuildExifReport(i);
    QCOMPARE(LineStarting(report, QStringLiteral("X Resolution:")),
             QStringLiteral("X Resolution:\t118.1 (pixels per %1)").arg(word));
    QCOMPARE(LineStarting(report, QStringLiteral("Y Resolution:")),
             QStringLiteral("Y Resolution:\t 5.0 (pixels per %1)").arg(word));
}

void TestExifReport::optionalLines_data()
{
    QTest::addColumn<QString>("field");
    QTest::addColumn<int>("value");
    QTest::addColumn<QString>("line"); // empty: no line starting with the head
    QTest::addColumn<QString>("head");
    const QStringList programs = {"Manual",           "Normal Program",   "Aperture priority",
                                  "Shutter priority", "Creative program", "Action program",
                                  "Portrait mode",    "Landscape mode"};
    for (int p = 0; p <= 9; ++p) {
        const QString text = p >= 1 && p <= 8 ? "Exposure program:\t" + programs.at(p - 1) : "";
        QTest::addRow("program %d", p) << "program" << p << text << "Exposure program:";
    }
    const QStringList modes = {"Average", "Center Weighted Average", "Spot", "Multispot", "Pattern",
                               "Partial"};
    for (int m : {0, 1, 2, 3, 4, 5, 6, 7, 255}) {
        const QString text = m >= 1 && m <= 6 ? "Metering mode:\t" + modes.at(m - 1) : "";
        QTest::addRow("metering %d", m) << "metering" << m << text << "Metering mode:";
    }
    QTest::newRow("compression 0") << "compression" << 0 << ""
                                   << "Compression Level:";
    QTest::newRow("compression -2") << "compression" << -2 << ""
                                    << "Compression Level:";
    QTest::newRow("compression 2") << "compression" << 2 << "Compression Level:\t2"
                                   << "Compression Level:";
    QTest::newRow("distance 0") << "distance" << 0 << ""
                                << "Distance:";
    QTest::newRow("distance 0.5 shows 0") << "distance" << 5 << "Distance:\t\t0"
                                          << "Distance:";
    QTest::newRow("distance 2.9 shows 2") << "distance" << 29 << "Distance:\t\t2"
                                          << "Distance:";
    QTest::newRow("flash 0") << "flash" << 0 << "Flash Used:\tNo"
                             << "Flash Used:";
    QTest::newRow("flash 1") << "flash" << 1 << "Flash Used:\tYes"
                             << "Flash Used:";
    QTest::newRow("artist") << "artist" << 1 << "Artist:\t\tA"
                            << "Artist:";
    QTest::newRow("no artist") << "artist" << 0 << ""
                               << "Artist:";
    QTest::newRow("copyright") << "copyright" << 1 << "Copyright:\t\tA"
                               << "Copyright:";
    QTest::newRow("no copyright") << "copyright" << 0 << ""
                                  << "Copyright:";
    QTest::newRow("software") << "software" << 1 << "Software:\t\tA"
                              << "Software:";
    QTest::newRow("no software") << "software" << 0 << ""
                                 << "Software:";
    QTest::newRow("comments") << "comments" << 1 << "Comments:\tA"
                              << "Comments:";
    QTest::newRow("no comments") << "comments" << 0 << ""
                                 << "Comments:";
}

void TestExifReport::optionalLines()
{
    QFETCH(QString, field);
    QFETCH(int, value);
    QFETCH(QString, line);
    QFETCH(QString, head);
    CExifInfo i;
    const std::string text = value ? "A" : "";
    if (field == "program")
        i.exposureProgram = value;
    else if (field == "metering")
        i.meteringMode = value;
    else if (field == "compression")
        i.compressionLevel = value;
    else if (field == "distance")
        i.subjectDistance = float(value) / 10;
    else if (field == "flash")
        i.flashUsed = value;
    else if (field == "artist")
        i.artist = text;
    else if (field == "copyright")
        i.copyright = text;
    else if (field == "software")
        i.software = text;
    else if (field == "comments")
        i.comments = text;
    QCOMPARE(LineStarting(BuildExifReport(i), head), line);
}

QTEST_GUILESS_MAIN(TestExifReport)
#include "tst_exif_report.moc"
