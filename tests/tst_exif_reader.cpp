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

// Every field by name, as text.
QMap<QString, QString> Fields(const CExifInfo& i)
{
    QMap<QString, QString> f;
    const auto num = [](double v) { return QString::number(v, 'g', 7); };
    f["version"] = QString::fromStdString(i.exifVersion);
    f["make"] = QString::fromStdString(i.cameraMake);
    f["model"] = QString::fromStdString(i.cameraModel);
    f["comments"] = QString::fromStdString(i.comments);
    f["date"] = QString::fromStdString(i.dateTime);
    f["software"] = QString::fromStdString(i.software);
    f["artist"] = QString::fromStdString(i.artist);
    f["copyright"] = QString::fromStdString(i.copyright);
    f["flash"] = num(i.flashUsed);
    f["size"] = QStringLiteral("%1x%2").arg(i.imageWidth).arg(i.imageHeight);
    f["orientation"] = num(i.orientation);
    f["metering"] = num(i.meteringMode);
    f["program"] = num(i.exposureProgram);
    f["iso"] = num(i.isoSpeed);
    f["compression"] = num(i.compressionLevel);
    f["resolution"] = QStringLiteral("%1/%2/%3")
                          .arg(num(i.xResolution), num(i.yResolution), num(i.resolutionUnit));
    f["focal"] = num(i.focalLength);
    f["time"] = num(i.exposureTime);
    f["shutter"] = num(i.shutterSpeedValue);
    f["fnumber"] = num(i.fNumber);
    f["distance"] = num(i.subjectDistance);
    f["bias"] = num(i.exposureBias);
    f["plane"] = QStringLiteral("%1/%2/%3")
                     .arg(num(i.focalPlaneXResolution), num(i.focalPlaneYResolution),
                          num(i.focalPlaneResolutionUnit));
    f["brightness"] = num(i.brightness);
    f["read"] = num(i.exifRead);
    return f;
}

// Compares "name=value|name=value" with the record's fields.
void Expect(const CExifInfo& info, const QString& expected)
{
    const QMap<QString, QString> fields = Fields(info);
    for (const QString& pair : expected.split('|')) {
        const QString name = pair.section('=', 0, 0);
        QVERIFY2(fields.contains(name), qPrintable(name));
        QCOMPARE(name + "=" + fields.value(name), pair);
    }
}

using Dirs = QList<QList<Field>>;
using TB = const TiffBuilder&;
using MakeDirectories = std::function<Dirs(TB)>;

} // namespace

class TestExifReader : public QObject
{
    Q_OBJECT

private slots:
    void tags_data();
    void tags();
    void numericValue_data();
    void numericValue();
    void segmentWalk_data();
    void segmentWalk();
    void frameMarkers_data();
    void frameMarkers();
    void laterReadsKeepEarlierFields();
    void fileReadSkipsLargeSegments();
};

void TestExifReader::tags_data()
{
    QTest::addColumn<QByteArray>("block");
    QTest::addColumn<QString>("expected");
    // Every case in both byte orders, which must read the same. cut > 0 keeps
    // only the block's first bytes; first replaces the first directory's offset.
    const auto cutRow = [](const char* name, const QString& expected, int cut,
                           std::optional<quint32> first, const MakeDirectories& make) {
        for (bool be : {false, true}) {
            TiffBuilder t(be);
            for (const QList<Field>& directory : make(t))
                t.AddDirectory(directory);
            const QByteArray block = t.Build(first);
            QTest::addRow("%s %s", be ? "MM" : "II", name)
                << (cut ? block.left(cut) : block) << expected;
        }
    };
    const auto row = [&](const char* name, const QString& expected, const MakeDirectories& make) {
        cutRow(name, expected, 0, std::nullopt, make);
    };
    // clang-format off
    row("camera: main, EXIF and interoperability directories",
        "make=Canon|model=Canon EOS 40D|orientation=6|resolution=72/300/3|software=GIMP 2.4.5|"
        "artist=Ann|copyright=(c) Ann|time=0.00625|fnumber=7.1|program=1|iso=400|version=0221|"
        "date=2008:05:30 15:56:01|compression=3|shutter=7|brightness=-0.5|bias=-0.6666667|"
        "distance=2.7|metering=5|flash=1|focal=135|comments=Hello there|size=3888x2592|"
        "plane=4438/4445/2|read=1",
        [](TB t) -> Dirs {
            return {{t.Ascii(0x010F, "Canon"), t.Ascii(0x0110, "Canon EOS 40D"), t.Short(0x0112, 6),
                     t.Rational(0x011A, 72, 1), t.Rational(0x011B, 300, 1), t.Short(0x0128, 3),
                     t.Ascii(0x0131, "GIMP 2.4.5"), t.Ascii(0x013B, "Ann"),
                     t.Ascii(0x8298, "(c) Ann"), t.Pointer(0x8769, 1)},
                    {t.Rational(0x829A, 1, 160), t.Rational(0x829D, 71, 10), t.Short(0x8822, 1),
                     t.Short(0x8827, 400), t.Undefined(0x9000, "0221"),
                     t.Ascii(0x9003, "2008:05:30 15:56:01"), t.Rational(0x9102, 3, 1),
                     t.SRational(0x9201, 7, 1), t.SRational(0x9203, -1, 2),
                     t.SRational(0x9204, -2, 3), t.Rational(0x9206, 27, 10), t.Short(0x9207, 5),
                     t.Short(0x9209, 9), t.Rational(0x920A, 135, 1),
                     t.Undefined(0x9286, QByteArray("ASCII\0\0\0Hello there", 19)),
                     t.Long(0xA002, 3888), t.Long(0xA003, 2592), t.Pointer(0xA005, 2),
                     t.Rational(0xA20E, 4438, 1), t.Rational(0xA20F, 4445, 1), t.Short(0xA210, 2)},
                    {t.Ascii(0x0001, "R98")}};
        });
    // clang-format on

    for (int flash : {0x00, 0x10, 0x20, 0x01, 0x05, 0x07, 0x18}) {
        row(qPrintable(QStringLiteral("flash 0x%1").arg(flash, 2, 16, QLatin1Char('0'))),
            QStringLiteral("flash=%1").arg((flash & 0x0F) ? 1 : 0),
            [flash](TB t) -> Dirs { return {{t.Short(0x9209, flash)}}; });
    }
    row("aperture value stands in for the F-number", "fnumber=4",
        [](TB t) -> Dirs { return {{t.Rational(0x9202, 4, 1)}}; });
    row("max aperture value too", "fnumber=3",
        [](TB t) -> Dirs { return {{t.Rational(0x9205, 3, 1)}}; });
    row("an F-number read first wins", "fnumber=2.8", [](TB t) -> Dirs {
        return {{t.Rational(0x829D, 28, 10), t.Rational(0x9202, 4, 1)}};
    });
    row("the F-number replaces an aperture value", "fnumber=2.8", [](TB t) -> Dirs {
        return {{t.Rational(0x9202, 4, 1), t.Rational(0x829D, 28, 10)}};
    });

    // Count x size decides where a value sits; a text also ends with its own bytes.
    row("texts in the entry and at an offset", "make=Abc|model=Model Five", [](TB t) -> Dirs {
        return {{t.Ascii(0x010F, "Abc"), t.Ascii(0x0110, "Model Five")}};
    });
    row("unterminated text in the entry", "make=Leic|model=M", [](TB t) -> Dirs {
        return {{Field{0x010F, 2, 4, "Leic"}, t.Ascii(0x0110, "M")}};
    });
    row("three shorts sit at an offset", "make=Sony", [](TB) -> Dirs {
        return {{Field{0x010F, 3, 3, QByteArray("Sony\0\0", 6)}}};
    });
    row("make cut at 31, model at 39", "make=" + QString(31, 'a') + "|model=" + QString(39, 'b'),
        [](TB t) -> Dirs {
            return {{t.Ascii(0x010F, QByteArray(40, 'a')), t.Ascii(0x0110, QByteArray(45, 'b'))}};
        });
    row("first software, artist and copyright kept",
        "software=Soft 1|artist=Art 1|copyright=Right 1|make=Make 2", [](TB t) -> Dirs {
            return {{t.Ascii(0x0131, "Soft 1"), t.Ascii(0x013B, "Art 1"),
                     t.Ascii(0x8298, "Right 1"), t.Pointer(0x8769, 1)},
                    {t.Ascii(0x0131, "Soft 2"), t.Ascii(0x013B, "Art 2"),
                     t.Ascii(0x8298, "Right 2"), t.Ascii(0x010F, "Make 2")}};
        });

    const QList<QPair<QByteArray, QString>> comments = {
        {QByteArray("ASCII\0\0\0Holiday at sea", 22), "Holiday at sea"},
        {QByteArray("UNICODE\0H\0i\0", 12), "UNICODE"},
        {QByteArray("\0\0\0\0\0\0\0\0text", 12), ""},
        {QByteArray("ASCII\0\0\0", 8) + QByteArray(120, 'x'), QString(92, 'x')}};
    for (const auto& comment : comments) {
        row(qPrintable("comment " + comment.second.left(10)), "comments=" + comment.second,
            [comment](TB t) -> Dirs { return {{t.Undefined(0x9286, comment.first)}}; });
    }

    // Bounds: every directory is walked once, and only inside the data.
    row("directory pointing at itself", "iso=100|read=1", [](TB t) -> Dirs {
        return {{t.Pointer(0x8769, 0), t.Short(0x8827, 100)}};
    });
    row("two directories pointing at each other", "iso=200|make=Nikon|read=1", [](TB t) -> Dirs {
        return {{t.Pointer(0x8769, 1), t.Ascii(0x010F, "Nikon")},
                {t.Pointer(0xA005, 0), t.Short(0x8827, 200)}};
    });
    row("negative pointer skips only its directory", "iso=50|read=1", [](TB t) -> Dirs {
        return {{t.Slot(0x8769, 4, 1, 4), t.Short(0x8827, 50)}};
    });
    row("pointer past the end is an empty directory", "iso=64|read=1", [](TB t) -> Dirs {
        return {{t.Slot(0x8769, 4, 1, 100000), t.Short(0x8827, 64)}};
    });
    cutRow("first directory before the data", "iso=0|read=0", 0, 2,
           [](TB t) -> Dirs { return {{t.Short(0x8827, 80)}}; });
    row("type above 12 abandons the directory", "make=Kept|iso=0|read=0", [](TB t) -> Dirs {
        return {{t.Ascii(0x010F, "Kept"), Field{0x8827, 13, 1, "\x10\0"}, t.Short(0x8827, 9)}};
    });
    row("an abandoned sub-directory leaves its parent going", "make=After|read=1",
        [](TB t) -> Dirs {
            return {{t.Pointer(0x8769, 1), t.Ascii(0x010F, "After")}, {Field{1, 200, 1, "\0\0"}}};
        });
    row("value past the end abandons the directory", "iso=0|read=0", [](TB t) -> Dirs {
        return {{t.Slot(0x010F, 2, 20, 5000), t.Short(0x8827, 12)}};
    });
    cutRow("entry cut by the end of the data", "iso=320|make=|read=1", 8 + 2 + 12 + 6, std::nullopt,
           [](TB t) -> Dirs {
               return {{t.Short(0x8827, 320), t.Ascii(0x010F, "Lost")}};
           });
    cutRow("rational cut by the end of the data", "iso=25|time=0|make=|read=1", 8 + 2 + 36 + 4 + 4,
           std::nullopt, [](TB t) -> Dirs {
               return {{t.Short(0x8827, 25), t.Slot(0x829A, 5, 1, 8 + 2 + 36 + 4),
                        t.Ascii(0x010F, "Unread")}};
           });
    cutRow("header cut short", "iso=0|read=0", 6, std::nullopt,
           [](TB t) -> Dirs { return {{t.Short(0x8827, 7)}}; });
}

void TestExifReader::tags()
{
    QFETCH(QByteArray, block);
    QFETCH(QString, expected);
    Expect(Read(Jpeg({ExifSegment(block)})), expected);
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
    QTest::newRow("SRATIONAL 1/-4") << 10 << QByteArray("\0\0\0\x01\xFF\xFF\xFF\xFC", 8) << -0.25f;
    QTest::newRow("ASCII") << 2 << QByteArray("1234", 4) << 0.0f;
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
    const auto* bytes = reinterpret_cast<const uint8_t*>(little.constData());
    QCOMPARE(CExifInfo::GetNumericValue(type, false, bytes), value);
}

void TestExifReader::segmentWalk_data()
{
    QTest::addColumn<QByteArray>("bytes");
    QTest::addColumn<int>("result");
    QTest::addColumn<QString>("expected");
    TiffBuilder t(false);
    t.AddDirectory({t.Long(0xA002, 4000), t.Long(0xA003, 3000)});
    const QByteArray exif = ExifSegment(t.Build());
    const QByteArray frame = FrameSegment(0xC0, 64, 48);
    const QByteArray soi("\xFF\xD8");
    QTest::newRow("frame header replaces EXIF dimensions")
        << Jpeg({exif, frame}) << 1 << "size=64x48|read=1";
    QTest::newRow("EXIF after the frame header wins")
        << Jpeg({frame, exif}) << 1 << "size=4000x3000";
    QTest::newRow("not a JPEG stream") << QByteArray("\x89PNG\r\n\x1a\n", 8) << 0 << "size=0x0";
    QTest::newRow("empty") << QByteArray() << 0 << "size=0x0";
    QTest::newRow("six fill bytes") << soi + QByteArray(5, '\xFF') + frame << 1 << "size=64x48";
    QTest::newRow("seven fill bytes") << soi + QByteArray(6, '\xFF') + frame << 0 << "size=0x0";
    QTest::newRow("fill bytes to the end") << soi + QByteArray(3, '\xFF') << 1 << "size=0x0";
    QTest::newRow("APP1 that is not EXIF")
        << Jpeg({JpegSegment(0xE1, "http://ns.adobe.com/xap/1.0/")}) << 1 << "read=0";
    QTest::newRow("EXIF cut by the end of the file")
        << Jpeg({exif}).left(2 + 4 + 6 + 8 + 2 + 12 + 4) << 1 << "size=4000x0|read=1";
    QTest::newRow("frame header cut by the end of the file")
        << (soi + frame).left(2 + 4 + 3) << 1 << "size=0x0";
    QTest::newRow("start of scan ends the walk")
        << Jpeg({}).left(2 + 10) + frame << 1 << "size=0x0";
    QTest::newRow("frame header as 20th segment")
        << Jpeg(QList<QByteArray>(19, JpegSegment(0xE2, "ICC")) << frame) << 1 << "size=64x48";
    QTest::newRow("frame header as 21st segment")
        << Jpeg(QList<QByteArray>(20, JpegSegment(0xE2, "ICC")) << frame) << 1 << "size=0x0";
    QTest::newRow("zero segment length")
        << QByteArray("\xFF\xD8\xFF\xE0\0\0\xFF\xC0", 8) << 1 << "size=0x0";
}

void TestExifReader::segmentWalk()
{
    QFETCH(QByteArray, bytes);
    QFETCH(int, result);
    QFETCH(QString, expected);
    int r = -1;
    const CExifInfo info = Read(bytes, &r);
    QCOMPARE(r, result);
    Expect(info, expected);
}

void TestExifReader::frameMarkers_data()
{
    QTest::addColumn<int>("marker");
    QTest::addColumn<bool>("frame");
    for (int m = 0xC0; m <= 0xCF; ++m)
        QTest::addRow("0x%02X", m) << m << (m != 0xC4 && m != 0xC8 && m != 0xCC);
    for (int m : {0xD0, 0xE0, 0xF0})
        QTest::addRow("0x%02X", m) << m << false;
}

void TestExifReader::frameMarkers()
{
    QFETCH(int, marker);
    QFETCH(bool, frame);
    // A JFIF file: its APP0 segment comes first and must not be taken for a frame.
    const CExifInfo i = Read(Jpeg({JfifSegment(), FrameSegment(quint8(marker), 1024, 768)}));
    Expect(i, frame ? "size=1024x768" : "size=0x0");
}

void TestExifReader::laterReadsKeepEarlierFields()
{
    TiffBuilder t(false);
    t.AddDirectory({t.Ascii(0x010F, "Pentax"), t.Short(0x8827, 800)});
    TiffBuilder u(true);
    u.AddDirectory({u.Short(0x8827, 100)});
    CExifInfo info;
    for (const QByteArray& jpeg : {Jpeg({ExifSegment(t.Build())}), Jpeg({ExifSegment(u.Build())}),
                                   Jpeg({FrameSegment(0xC0, 8, 8)})})
        info.ReadExifBytes(std::string_view(jpeg.constData(), size_t(jpeg.size())));
    Expect(info, "make=Pentax|iso=100|size=8x8|read=1");
}

void TestExifReader::fileReadSkipsLargeSegments()
{
    // The EXIF block and the frame header lie past 240 KB of other segments.
    QTemporaryDir dir;
    TiffBuilder t(true);
    t.AddDirectory({t.Ascii(0x010F, "Fujifilm")});
    QList<QByteArray> segments;
    for (int k = 0; k < 4; ++k)
        segments << JpegSegment(0xE2, QByteArray(60000, char('a' + k)));
    segments << ExifSegment(t.Build()) << FrameSegment(0xC2, 321, 123);
    QFile file(dir.filePath("far.jpg"));
    QVERIFY(file.open(QIODevice::WriteOnly));
    file.write(Jpeg(segments) + QByteArray(100000, '\x55'));
    file.close();
    CExifInfo info;
    QCOMPARE(info.ReadExif(file.fileName().toStdString()), 1);
    Expect(info, "make=Fujifilm|size=321x123");
    QCOMPARE(info.ReadExif(dir.filePath("none.jpg").toStdString()), 0);
    QCOMPARE(info.ReadExif(dir.path().toStdString()), 0);
}

QTEST_GUILESS_MAIN(TestExifReader)
#include "tst_exif_reader.moc"
