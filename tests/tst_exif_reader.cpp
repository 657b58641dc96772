// The EXIF reader on hand-built JPEG streams and TIFF blocks.

#include "exif_builder.h"
#include "pictures/exif_info.h"

#include <QTemporaryDir>
#include <QtTest>

using Field = TiffBuilder::Field;

namespace {

CExifInfo Read(const QByteArray& jpeg, int* result = nullptr)
{
    CExifInfo info;
    const int r = info.ReadExifBytes(std::string_view(jpeg.constData(), size_t(jpeg.size())));
    if (result)
        *result = r;
    return info;
}

QByteArray WithExif(const TiffBuilder& tiff, std::optional<quint32> firstOffset = std::nullopt)
{
    return Jpeg({ExifSegment(tiff.Build(firstOffset))});
}

// Every field, for comparing two records.
QStringList Fields(const CExifInfo& i)
{
    QStringList f;
    for (const std::string* s : {&i.exifVersion, &i.cameraMake, &i.cameraModel, &i.comments,
                                 &i.dateTime, &i.software, &i.artist, &i.copyright})
        f << QString::fromStdString(*s);
    for (int v : {i.flashUsed, i.imageWidth, i.imageHeight, i.orientation, i.meteringMode,
                  i.exposureProgram, i.isoSpeed, i.exposureSpeed, i.compressionLevel,
                  i.resolutionUnit, i.exifRead})
        f << QString::number(v);
    for (float v :
         {i.xResolution, i.yResolution, i.focalLength, i.exposureTime, i.shutterSpeedValue,
          i.fNumber, i.subjectDistance, i.exposureBias, i.focalPlaneXResolution,
          i.focalPlaneYResolution, i.focalPlaneResolutionUnit, i.brightness})
        f << QString::number(double(v), 'g', 9);
    return f;
}

// A camera's typical block: the main directory points to the EXIF directory,
// which points to the interoperability directory.
TiffBuilder CameraBlock(bool bigEndian)
{
    TiffBuilder t(bigEndian);
    t.AddDirectory({t.Ascii(0x010F, "Canon"), t.Ascii(0x0110, "Canon EOS 40D"), t.Short(0x0112, 6),
                    t.Rational(0x011A, 72, 1), t.Rational(0x011B, 300, 1), t.Short(0x0128, 3),
                    t.Ascii(0x0131, "GIMP 2.4.5"), t.Ascii(0x013B, "Ann"),
                    t.Ascii(0x8298, "(c) Ann"), t.Pointer(0x8769, 1)});
    t.AddDirectory({t.Rational(0x829A, 1, 160),
                    t.Rational(0x829D, 71, 10),
                    t.Short(0x8822, 1),
                    t.Short(0x8827, 400),
                    t.Undefined(0x9000, "0221"),
                    t.Ascii(0x9003, "2008:05:30 15:56:01"),
                    t.Rational(0x9102, 3, 1),
                    t.SRational(0x9201, 7, 1),
                    t.SRational(0x9203, -1, 2),
                    t.SRational(0x9204, -2, 3),
                    t.Rational(0x9206, 27, 10),
                    t.Short(0x9207, 5),
                    t.Short(0x9209, 9),
                    t.Rational(0x920A, 135, 1),
                    t.Undefined(0x9286, QByteArray("ASCII\0\0\0Hello there", 19)),
                    t.Long(0xA002, 3888),
                    t.Long(0xA003, 2592),
                    t.Pointer(0xA005, 2),
                    t.Rational(0xA20E, 4438, 1),
                    t.Rational(0xA20F, 4445, 1),
                    t.Short(0xA210, 2)});
    t.AddDirectory({t.Ascii(0x0001, "R98")});
    return t;
}

} // namespace

class TestExifReader : public QObject
{
    Q_OBJECT

private slots:
    void cameraBlock_data();
    void cameraBlock();
    void byteOrdersGiveIdenticalRecords();
    void flash_data();
    void flash();
    void apertureStandsInForFNumber_data();
    void apertureStandsInForFNumber();
    void valuePlacement_data();
    void valuePlacement();
    void userComment_data();
    void userComment();
    void firstTextsKept();
    void directoryBounds_data();
    void directoryBounds();
    void numericValue_data();
    void numericValue();
    void segmentWalk_data();
    void segmentWalk();
    void frameMarkers_data();
    void frameMarkers();
    void laterReadsKeepEarlierFields();
    void fileReadSkipsLargeSegments();
};

void TestExifReader::cameraBlock_data()
{
    QTest::addColumn<bool>("bigEndian");
    QTest::newRow("little-endian") << false;
    QTest::newRow("big-endian") << true;
}

void TestExifReader::cameraBlock()
{
    QFETCH(bool, bigEndian);
    int result = -1;
    const CExifInfo i = Read(WithExif(CameraBlock(bigEndian)), &result);
    QCOMPARE(result, 1);
    QCOMPARE(i.exifRead, 1);
    QCOMPARE(i.cameraMake, std::string("Canon"));
    QCOMPARE(i.cameraModel, std::string("Canon EOS 40D"));
    QCOMPARE(i.orientation, 6);
    QCOMPARE(i.xResolution, 72.0f);
    QCOMPARE(i.yResolution, 300.0f);
    QCOMPARE(i.resolutionUnit, 3);
    QCOMPARE(i.software, std::string("GIMP 2.4.5"));
    QCOMPARE(i.artist, std::string("Ann"));
    QCOMPARE(i.copyright, std::string("(c) Ann"));
    QCOMPARE(i.exposureTime, 1.0f / 160);
    QCOMPARE(i.fNumber, 7.1f);
    QCOMPARE(i.exposureProgram, 1);
    QCOMPARE(i.isoSpeed, 400);
    QCOMPARE(i.exifVersion, std::string("0221"));
    QCOMPARE(i.dateTime, std::string("2008:05:30 15:56:01"));
    QCOMPARE(i.compressionLevel, 3);
    QCOMPARE(i.shutterSpeedValue, 7.0f);
    QCOMPARE(i.brightness, -0.5f);
    QCOMPARE(i.exposureBias, -2.0f / 3);
    QCOMPARE(i.subjectDistance, 2.7f);
    QCOMPARE(i.meteringMode, 5);
    QCOMPARE(i.flashUsed, 1);
    QCOMPARE(i.focalLength, 135.0f);
    QCOMPARE(i.comments, std::string("Hello there"));
    // No frame header in this stream: the EXIF pixel dimensions stand.
    QCOMPARE(i.imageWidth, 3888);
    QCOMPARE(i.imageHeight, 2592);
    QCOMPARE(i.focalPlaneXResolution, 4438.0f);
    QCOMPARE(i.focalPlaneYResolution, 4445.0f);
    QCOMPARE(i.focalPlaneResolutionUnit, 2.0f);
    QCOMPARE(i.exposureSpeed, 0);
}

void TestExifReader::byteOrdersGiveIdenticalRecords()
{
    const CExifInfo little = Read(WithExif(CameraBlock(false)));
    const CExifInfo big = Read(WithExif(CameraBlock(true)));
    QCOMPARE(Fields(little), Fields(big));
    QVERIFY(Fields(little) != Fields(CExifInfo()));
}

void TestExifReader::flash_data()
{
    QTest::addColumn<int>("value");
    QTest::addColumn<int>("used");
    QTest::newRow("0x00 no flash") << 0x00 << 0;
    QTest::newRow("0x10 off, compulsory") << 0x10 << 0;
    QTest::newRow("0x20 no flash function") << 0x20 << 0;
    QTest::newRow("0x01 fired") << 0x01 << 1;
    QTest::newRow("0x05 fired, no return") << 0x05 << 1;
    QTest::newRow("0x07 fired, return") << 0x07 << 1;
    QTest::newRow("0x18 auto, not fired") << 0x18 << 1;
}

void TestExifReader::flash()
{
    QFETCH(int, value);
    QFETCH(int, used);
    for (bool bigEndian : {false, true}) {
        TiffBuilder t(bigEndian);
        t.AddDirectory({t.Short(0x9209, quint16(value))});
        QCOMPARE(Read(WithExif(t)).flashUsed, used);
    }
}

void TestExifReader::apertureStandsInForFNumber_data()
{
    QTest::addColumn<QList<int>>("tags"); // each with the value tag / 0x1000 + 1
    QTest::addColumn<float>("fNumber");
    // Values: FNumber 2.8 (28/10), ApertureValue 4/1, MaxApertureValue 3/1.
    QTest::newRow("aperture only") << QList<int>{0x9202} << 4.0f;
    QTest::newRow("max aperture only") << QList<int>{0x9205} << 3.0f;
    QTest::newRow("f-number first wins") << QList<int>{0x829D, 0x9202} << 2.8f;
    QTest::newRow("aperture first, then f-number") << QList<int>{0x9202, 0x829D} << 2.8f;
    QTest::newRow("aperture before max aperture") << QList<int>{0x9202, 0x9205} << 4.0f;
}

void TestExifReader::apertureStandsInForFNumber()
{
    QFETCH(QList<int>, tags);
    QFETCH(float, fNumber);
    TiffBuilder t(false);
    QList<Field> fields;
    for (int tag : tags) {
        if (tag == 0x829D)
            fields << t.Rational(0x829D, 28, 10);
        else
            fields << t.Rational(quint16(tag), tag == 0x9202 ? 4 : 3, 1);
    }
    t.AddDirectory(fields);
    QCOMPARE(Read(WithExif(t)).fNumber, fNumber);
}

void TestExifReader::valuePlacement_data()
{
    QTest::addColumn<bool>("bigEndian");
    QTest::addColumn<QByteArray>("block");
    QTest::addColumn<QString>("make");
    QTest::addColumn<QString>("model");
    for (bool be : {false, true}) {
        const char* order = be ? "MM" : "II";
        TiffBuilder t(be);
        // Three letters and a NUL fit the entry; a longer text sits at an offset.
        t.AddDirectory({t.Ascii(0x010F, "Abc"), t.Ascii(0x0110, "Model Five")});
        QTest::addRow("%s in entry and at offset", order) << be << t.Build() << "Abc"
                                                          << "Model Five";

        // Four letters without a NUL: the text ends with its own four bytes.
        TiffBuilder u(be);
        u.AddDirectory({Field{0x010F, 2, 4, "Leic"}, u.Ascii(0x0110, "M")});
        QTest::addRow("%s unterminated in entry", order) << be << u.Build() << "Leic"
                                                         << "M";

        // Count x size decides: three SHORTs are 6 bytes, so the value sits at an offset.
        TiffBuilder w(be);
        w.AddDirectory({Field{0x010F, 3, 3, QByteArray("Sony\0\0", 6)}});
        QTest::addRow("%s three shorts at offset", order) << be << w.Build() << "Sony"
                                                          << "";

        // Make is cut at 31 bytes, model at 39.
        TiffBuilder l(be);
        l.AddDirectory(
            {l.Ascii(0x010F, QByteArray(40, 'a')), l.Ascii(0x0110, QByteArray(45, 'b'))});
        QTest::addRow("%s long texts cut", order)
            << be << l.Build() << QString(31, 'a') << QString(39, 'b');
    }
}

void TestExifReader::valuePlacement()
{
    QFETCH(QByteArray, block);
    QFETCH(QString, make);
    QFETCH(QString, model);
    const CExifInfo i = Read(Jpeg({ExifSegment(block)}));
    QCOMPARE(QString::fromStdString(i.cameraMake), make);
    QCOMPARE(QString::fromStdString(i.cameraModel), model);
    QCOMPARE(i.exifRead, 1);
}

void TestExifReader::userComment_data()
{
    QTest::addColumn<QByteArray>("comment");
    QTest::addColumn<QString>("shown");
    QTest::newRow("ascii") << QByteArray("ASCII\0\0\0Holiday at sea", 22) << "Holiday at sea";
    QTest::newRow("unicode shows its code") << QByteArray("UNICODE\0H\0i\0", 12) << "UNICODE";
    QTest::newRow("undefined code is empty") << QByteArray("\0\0\0\0\0\0\0\0text", 12) << "";
    QTest::newRow("ascii, 100 bytes at most")
        << (QByteArray("ASCII\0\0\0", 8) + QByteArray(120, 'x')) << QString(92, 'x');
    QTest::newRow("too short for its code") << QByteArray("ASCI", 4) << "ASCI";
}

void TestExifReader::userComment()
{
    QFETCH(QByteArray, comment);
    QFETCH(QString, shown);
    for (bool bigEndian : {false, true}) {
        TiffBuilder t(bigEndian);
        t.AddDirectory({t.Undefined(0x9286, comment)});
        QCOMPARE(QString::fromStdString(Read(WithExif(t)).comments), shown);
    }
}

void TestExifReader::firstTextsKept()
{
    TiffBuilder t(true);
    t.AddDirectory({t.Ascii(0x0131, "First soft"), t.Ascii(0x013B, "First artist"),
                    t.Ascii(0x8298, "First right"), t.Pointer(0x8769, 1)});
    t.AddDirectory({t.Ascii(0x0131, "Second soft"), t.Ascii(0x013B, "Second artist"),
                    t.Ascii(0x8298, "Second right"), t.Ascii(0x010F, "Later make")});
    const CExifInfo i = Read(WithExif(t));
    QCOMPARE(i.software, std::string("First soft"));
    QCOMPARE(i.artist, std::string("First artist"));
    QCOMPARE(i.copyright, std::string("First right"));
    QCOMPARE(i.cameraMake, std::string("Later make"));
}

void TestExifReader::directoryBounds_data()
{
    QTest::addColumn<QByteArray>("block");
    QTest::addColumn<int>("exifRead");
    QTest::addColumn<int>("iso");
    QTest::addColumn<QString>("make");

    TiffBuilder self(false);
    self.AddDirectory({self.Pointer(0x8769, 0), self.Short(0x8827, 100)});
    QTest::newRow("directory pointing at itself") << self.Build() << 1 << 100 << "";

    TiffBuilder cycle(true);
    cycle.AddDirectory({cycle.Pointer(0x8769, 1), cycle.Ascii(0x010F, "Nikon")});
    cycle.AddDirectory({cycle.Pointer(0xA005, 0), cycle.Short(0x8827, 200)});
    QTest::newRow("two directories pointing at each other") << cycle.Build() << 1 << 200 << "Nikon";

    TiffBuilder negative(false);
    negative.AddDirectory({negative.Slot(0x8769, 4, 1, 4), negative.Short(0x8827, 50)});
    QTest::newRow("negative pointer skips only that directory")
        << negative.Build() << 1 << 50 << "";

    TiffBuilder beyond(false);
    beyond.AddDirectory({beyond.Slot(0x8769, 4, 1, 100000), beyond.Short(0x8827, 64)});
    QTest::newRow("pointer past the end") << beyond.Build() << 1 << 64 << "";

    TiffBuilder firstNegative(true);
    firstNegative.AddDirectory({firstNegative.Short(0x8827, 80)});
    QTest::newRow("first directory before the data") << firstNegative.Build(2) << 0 << 0 << "";

    TiffBuilder badType(false);
    badType.AddDirectory(
        {badType.Ascii(0x010F, "Kept"), Field{0x8827, 13, 1, "\x10\0"}, badType.Short(0x8827, 99)});
    QTest::newRow("type above 12 abandons the directory") << badType.Build() << 0 << 0 << "Kept";

    TiffBuilder subBadType(false);
    subBadType.AddDirectory({subBadType.Pointer(0x8769, 1), subBadType.Ascii(0x010F, "After")});
    subBadType.AddDirectory({Field{0x0001, 200, 1, "\0\0"}});
    QTest::newRow("bad sub-directory, parent goes on") << subBadType.Build() << 1 << 0 << "After";

    TiffBuilder valueOutside(true);
    valueOutside.AddDirectory(
        {valueOutside.Slot(0x010F, 2, 20, 5000), valueOutside.Short(0x8827, 12)});
    QTest::newRow("value past the end abandons the directory")
        << valueOutside.Build() << 0 << 0 << "";

    // The ISO entry's value slot is whole, but the block ends in the next entry.
    TiffBuilder cut(false);
    cut.AddDirectory({cut.Short(0x8827, 320), cut.Ascii(0x010F, "Lost")});
    QTest::newRow("entry cut by the end of the data")
        << cut.Build().left(8 + 2 + 12 + 6) << 1 << 320 << "";

    // A rational whose offset is inside the data but whose 8 bytes are not.
    TiffBuilder rational(false);
    rational.AddDirectory({rational.Short(0x8827, 25), rational.Slot(0x829A, 5, 1, 8 + 2 + 36 + 4),
                           rational.Ascii(0x010F, "Unread")});
    QTest::newRow("numeric value cut by the end")
        << rational.Build().left(8 + 2 + 36 + 4 + 4) << 1 << 25 << "";

    TiffBuilder notTiff(false);
    notTiff.AddDirectory({notTiff.Short(0x8827, 7)});
    QByteArray bad = notTiff.Build();
    bad[2] = 43;
    QTest::newRow("magic other than 42") << bad << 0 << 0 << "";
    QTest::newRow("header cut short") << QByteArray("II*\0\x08\0", 6) << 0 << 0 << "";
}

void TestExifReader::directoryBounds()
{
    QFETCH(QByteArray, block);
    QFETCH(int, exifRead);
    QFETCH(int, iso);
    QFETCH(QString, make);
    const CExifInfo i = Read(Jpeg({ExifSegment(block)}));
    QCOMPARE(i.exifRead, exifRead);
    QCOMPARE(i.isoSpeed, iso);
    QCOMPARE(QString::fromStdString(i.cameraMake), make);
}

void TestExifReader::numericValue_data()
{
    QTest::addColumn<int>("type");
    QTest::addColumn<QByteArray>("bigEndianBytes");
    QTest::addColumn<float>("value");
    QTest::newRow("BYTE 200") << 1 << QByteArray("\xC8", 1) << 200.0f;
    QTest::newRow("SBYTE -56") << 6 << QByteArray("\xC8", 1) << -56.0f;
    QTest::newRow("SHORT 65535") << 3 << QByteArray("\xFF\xFF", 2) << 65535.0f;
    QTest::newRow("SSHORT -1") << 8 << QByteArray("\xFF\xFF", 2) << -1.0f;
    QTest::newRow("LONG 4294967295") << 4 << QByteArray("\xFF\xFF\xFF\xFF", 4) << 4294967296.0f;
    QTest::newRow("SLONG -2") << 9 << QByteArray("\xFF\xFF\xFF\xFE", 4) << -2.0f;
    QTest::newRow("RATIONAL 3/2") << 5 << QByteArray("\0\0\0\x03\0\0\0\x02", 8) << 1.5f;
    QTest::newRow("RATIONAL 1/0") << 5 << QByteArray("\0\0\0\x01\0\0\0\0", 8) << 0.0f;
    QTest::newRow("RATIONAL 4294967295/1")
        << 5 << QByteArray("\xFF\xFF\xFF\xFF\0\0\0\x01", 8) << 4294967296.0f;
    QTest::newRow("SRATIONAL -3/2") << 10 << QByteArray("\xFF\xFF\xFF\xFD\0\0\0\x02", 8) << -1.5f;
    QTest::newRow("SRATIONAL 1/-4") << 10 << QByteArray("\0\0\0\x01\xFF\xFF\xFF\xFC", 8) << -0.25f;
    QTest::newRow("ASCII") << 2 << QByteArray("1234", 4) << 0.0f;
    QTest::newRow("UNDEFINED") << 7 << QByteArray("\x01\x02", 2) << 0.0f;
    QTest::newRow("FLOAT") << 11 << QByteArray("\x3F\x80\0\0", 4) << 0.0f;
    QTest::newRow("DOUBLE") << 12 << QByteArray("\x3F\xF0\0\0\0\0\0\0", 8) << 0.0f;
}

void TestExifReader::numericValue()
{
    QFETCH(int, type);
    QFETCH(QByteArray, bigEndianBytes);
    QFETCH(float, value);
    const auto* big = reinterpret_cast<const uint8_t*>(bigEndianBytes.constData());
    QCOMPARE(CExifInfo::GetNumericValue(type, true, big), value);
    // Little-endian: each number's bytes reversed (a rational's two numbers apart).
    QByteArray little = bigEndianBytes;
    const int unit = (type == 5 || type == 10) ? 4 : int(little.size());
    for (int at = 0; at < little.size(); at += unit)
        std::reverse(little.begin() + at, little.begin() + at + unit);
    QCOMPARE(CExifInfo::GetNumericValue(type, false,
                                        reinterpret_cast<const uint8_t*>(little.constData())),
             value);
}

void TestExifReader::segmentWalk_data()
{
    QTest::addColumn<QByteArray>("bytes");
    QTest::addColumn<int>("result");
    QTest::addColumn<int>("width");
    QTest::addColumn<int>("height");
    QTest::addColumn<int>("exifRead");

    TiffBuilder t(false);
    t.AddDirectory({t.Long(0xA002, 4000), t.Long(0xA003, 3000)});
    const QByteArray exif = ExifSegment(t.Build());

    QTest::newRow("frame header replaces EXIF dimensions")
        << Jpeg({exif, FrameSegment(0xC0, 640, 480)}) << 1 << 640 << 480 << 1;
    QTest::newRow("EXIF after the frame header wins")
        << Jpeg({FrameSegment(0xC0, 640, 480), exif}) << 1 << 4000 << 3000 << 1;
    QTest::newRow("not a JPEG stream") << QByteArray("\x89PNG\r\n\x1a\n", 8) << 0 << 0 << 0 << 0;
    QTest::newRow("empty") << QByteArray() << 0 << 0 << 0 << 0;
    QTest::newRow("six fill bytes")
        << (QByteArray("\xFF\xD8") + QByteArray(5, '\xFF') + FrameSegment(0xC0, 10, 20)) << 1 << 10
        << 20 << 0;
    QTest::newRow("seven fill bytes")
        << (QByteArray("\xFF\xD8") + QByteArray(6, '\xFF') + FrameSegment(0xC0, 10, 20)) << 0 << 0
        << 0 << 0;
    QTest::newRow("fill bytes to the end")
        << QByteArray("\xFF\xD8\xFF\xFF\xFF", 5) << 1 << 0 << 0 << 0;
    QTest::newRow("APP1 that is not EXIF")
        << Jpeg({JpegSegment(0xE1, "http://ns.adobe.com/xap/1.0/\0<x/>")}) << 1 << 0 << 0 << 0;
    QTest::newRow("APP1 EXIF cut by the end of the file")
        << Jpeg({exif}).left(2 + 4 + 6 + 8 + 2 + 12 + 4) << 1 << 4000 << 0 << 1;
    QTest::newRow("frame header cut by the end of the file")
        << FrameSegment(0xC0, 640, 480).prepend("\xFF\xD8").left(2 + 4 + 3) << 1 << 0 << 0 << 0;
    QTest::newRow("start of scan ends the walk")
        << (Jpeg({}).left(2 + 10) + FrameSegment(0xC0, 64, 48)) << 1 << 0 << 0 << 0;
    QList<QByteArray> twenty(20, JpegSegment(0xE2, "ICC"));
    QTest::newRow("frame header as 21st segment")
        << Jpeg(twenty + QList<QByteArray>{FrameSegment(0xC0, 64, 48)}) << 1 << 0 << 0 << 0;
    QList<QByteArray> nineteen(19, JpegSegment(0xE2, "ICC"));
    QTest::newRow("frame header as 20th segment")
        << Jpeg(nineteen + QList<QByteArray>{FrameSegment(0xC0, 64, 48)}) << 1 << 64 << 48 << 0;
    QTest::newRow("zero segment length")
        << QByteArray("\xFF\xD8\xFF\xE0\0\0\xFF\xC0", 8) << 1 << 0 << 0 << 0;
    QTest::newRow("EXIF segment too short for a block")
        << Jpeg({JpegSegment(0xE1, QByteArray("Exif", 4))}) << 1 << 0 << 0 << 0;
}

void TestExifReader::segmentWalk()
{
    QFETCH(QByteArray, bytes);
    QFETCH(int, result);
    QFETCH(int, width);
    QFETCH(int, height);
    QFETCH(int, exifRead);
    int r = -1;
    const CExifInfo i = Read(bytes, &r);
    QCOMPARE(r, result);
    QCOMPARE(i.imageWidth, width);
    QCOMPARE(i.imageHeight, height);
    QCOMPARE(i.exifRead, exifRead);
}

void TestExifReader::frameMarkers_data()
{
    QTest::addColumn<int>("marker");
    QTest::addColumn<bool>("frame");
    for (int m = 0xC0; m <= 0xCF; ++m) {
        const bool frame = m != 0xC4 && m != 0xC8 && m != 0xCC;
        QTest::addRow("0x%02X", m) << m << frame;
    }
    QTest::newRow("0xD0") << 0xD0 << false;
    QTest::newRow("0xE0") << 0xE0 << false;
    QTest::newRow("0xF0") << 0xF0 << false;
}

void TestExifReader::frameMarkers()
{
    QFETCH(int, marker);
    QFETCH(bool, frame);
    // A JFIF file: its APP0 segment comes first and must not be taken for a frame.
    const CExifInfo i = Read(Jpeg({JfifSegment(), FrameSegment(quint8(marker), 1024, 768)}));
    QCOMPARE(i.imageWidth, frame ? 1024 : 0);
    QCOMPARE(i.imageHeight, frame ? 768 : 0);
}

void TestExifReader::laterReadsKeepEarlierFields()
{
    TiffBuilder t(false);
    t.AddDirectory({t.Ascii(0x010F, "Pentax"), t.Short(0x8827, 800)});
    CExifInfo info;
    const QByteArray first = WithExif(t);
    info.ReadExifBytes(std::string_view(first.constData(), size_t(first.size())));
    TiffBuilder u(true);
    u.AddDirectory({u.Short(0x8827, 100)});
    const QByteArray second = WithExif(u);
    info.ReadExifBytes(std::string_view(second.constData(), size_t(second.size())));
    QCOMPARE(info.cameraMake, std::string("Pentax"));
    QCOMPARE(info.isoSpeed, 100);
    const QByteArray plain = Jpeg({FrameSegment(0xC0, 8, 8)});
    QCOMPARE(info.ReadExifBytes(std::string_view(plain.constData(), size_t(plain.size()))), 1);
    QCOMPARE(info.exifRead, 1);
    QCOMPARE(info.imageWidth, 8);
}

void TestExifReader::fileReadSkipsLargeSegments()
{
    // The EXIF block and the frame header lie beyond a 200 KB segment, past
    // any read-ahead window; an unreadable path reads as no JPEG.
    QTemporaryDir dir;
    TiffBuilder t(true);
    t.AddDirectory({t.Ascii(0x010F, "Fujifilm")});
    QList<QByteArray> segments;
    for (int k = 0; k < 4; ++k)
        segments << JpegSegment(0xE2, QByteArray(60000, char('a' + k)));
    segments << ExifSegment(t.Build()) << FrameSegment(0xC2, 321, 123);
    const QString path = dir.filePath("far.jpg");
    QFile file(path);
    QVERIFY(file.open(QIODevice::WriteOnly));
    file.write(Jpeg(segments) + QByteArray(100000, '\x55'));
    file.close();
    CExifInfo info;
    QCOMPARE(info.ReadExif(path.toStdString()), 1);
    QCOMPARE(info.cameraMake, std::string("Fujifilm"));
    QCOMPARE(info.imageWidth, 321);
    QCOMPARE(info.imageHeight, 123);
    CExifInfo missing;
    QCOMPARE(missing.ReadExif(dir.filePath("none.jpg").toStdString()), 0);
    QCOMPARE(missing.ReadExif(dir.path().toStdString()), 0);
}

QTEST_GUILESS_MAIN(TestExifReader)
#include "tst_exif_reader.moc"
