// The stream encodings of the data file, byte for byte, and how the reader
// refuses damaged input.

#include "catalog/archive.h"
#include "tests/support/hex_fixture.h"

#include <QTemporaryFile>
#include <QtTest>

#include <fcntl.h>
#include <unistd.h>

namespace {

std::string Bytes(const char* hex)
{
    return ParseHexFixture(QByteArray(hex)).toStdString();
}

template <typename Write> std::string Written(Write write)
{
    std::string out;
    CArchive ar(&out);
    write(ar);
    return out;
}

} // namespace

class TestArchive : public QObject
{
    Q_OBJECT

private slots:
    void timeForms_data()
    {
        QTest::addColumn<qint64>("seconds");
        QTest::addColumn<QByteArray>("bytes");
        QTest::newRow("zero") << qint64(0) << ParseHexFixture("00 00 00 00");
        QTest::newRow("2003") << qint64(0x3F000000) << ParseHexFixture("00 00 00 3F");
        QTest::newRow("largest DWORD") << qint64(0xFFFFFFFFll) << ParseHexFixture("FF FF FF FF");
        QTest::newRow("equal to the marker")
            << qint64(0x8000000Al) << ParseHexFixture("0A 00 00 80 0A 00 00 80 00 00 00 00");
        QTest::newRow("before 1970")
            << qint64(-86400) << ParseHexFixture("0A 00 00 80 80 AE FE FF FF FF FF FF");
        QTest::newRow("after 2106")
            << qint64(0x100000000ll) << ParseHexFixture("0A 00 00 80 00 00 00 00 01 00 00 00");
    }

    void timeForms()
    {
        QFETCH(qint64, seconds);
        QFETCH(QByteArray, bytes);
        const std::string out = Written([&](CArchive& ar) { ar.WriteTime(CTime(seconds)); });
        QCOMPARE(QByteArray::fromStdString(out), bytes);
        CArchive ar{std::string_view(out)};
        QCOMPARE(ar.ReadTime().GetTime(), seconds);
        QCOMPARE(ar.BytesLeft(), 0);
    }

    void lineReading_data()
    {
        QTest::addColumn<QByteArray>("bytes");
        QTest::addColumn<QByteArray>("first");
        QTest::addColumn<QByteArray>("rest");
        QTest::newRow("LF") << QByteArray("abc\nX") << QByteArray("abc") << QByteArray("X");
        QTest::newRow("CR LF") << QByteArray("abc\r\nX") << QByteArray("abc") << QByteArray("X");
        QTest::newRow("CR takes the next byte")
            << QByteArray("abc\rYX") << QByteArray("abc") << QByteArray("X");
        QTest::newRow("empty line") << QByteArray("\nX") << QByteArray("") << QByteArray("X");
        QTest::newRow("file ends in the line")
            << QByteArray("abc") << QByteArray("abc") << QByteArray("");
    }

    void lineReading()
    {
        QFETCH(QByteArray, bytes);
        QFETCH(QByteArray, first);
        QFETCH(QByteArray, rest);
        const std::string in = bytes.toStdString();
        CArchive ar{std::string_view(in)};
        QCOMPARE(QByteArray::fromStdString(ar.ReadLine()), first);
        std::string left(static_cast<size_t>(ar.BytesLeft()), '\0');
        ar.ReadBytes(left.data(), left.size());
        QCOMPARE(QByteArray::fromStdString(left), rest);
    }

    void lineAtTheEndIsTruncation()
    {
        CArchive ar{std::string_view("")};
        QVERIFY_THROWS_EXCEPTION(CArchiveException, ar.ReadLine());
    }

    void lineWriterCannotBreakARecord()
    {
        QCOMPARE(Written([](CArchive& ar) { ar.WriteLine("a\r\nb\nc"); }), std::string("a  b c\n"));
    }

    void cstringPrefixes_data()
    {
        QTest::addColumn<int>("length");
        QTest::addColumn<QByteArray>("prefix");
        QTest::newRow("empty") << 0 << ParseHexFixture("00");
        QTest::newRow("254") << 254 << ParseHexFixture("FE");
        QTest::newRow("255") << 255 << ParseHexFixture("FF FF 00");
        QTest::newRow("65533") << 65533 << ParseHexFixture("FF FD FF");
        QTest::newRow("65534") << 65534 << ParseHexFixture("FF FF FF FE FF 00 00");
        QTest::newRow("70000") << 70000 << ParseHexFixture("FF FF FF 70 11 01 00");
    }

    void cstringPrefixes()
    {
        QFETCH(int, length);
        QFETCH(QByteArray, prefix);
        const std::string text(static_cast<size_t>(length), 'x');
        const std::string out = Written([&](CArchive& ar) { ar.WriteCString(text); });
        QCOMPARE(QByteArray::fromStdString(out.substr(0, prefix.size())), prefix);
        QCOMPARE(out.size(), prefix.size() + text.size());
        CArchive ar{std::string_view(out)};
        QCOMPARE(ar.ReadCString(), text);
    }

    void wideCStringBecomesUtf8()
    {
        // 0xFF 0xFFFE marks UTF-16LE; then the length in characters.
        const std::string in = Bytes("FF FE FF 03 41 00 E9 00 AC 20");
        CArchive ar{std::string_view(in)};
        QCOMPARE(QString::fromStdString(ar.ReadCString()), QString::fromUtf8("A\u00e9\u20ac"));
    }

    void damagedLengthsRaise_data()
    {
        QTest::addColumn<QByteArray>("bytes");
        QTest::addColumn<int>("kind"); // 0 counted text, 1 CString, 2 count
        QTest::addColumn<int>("cause");
        QTest::newRow("negative text length")
            << ParseHexFixture("FF FF FF FF") << 0 << int(CArchiveException::BadLength);
        QTest::newRow("text longer than the file")
            << ParseHexFixture("05 00 00 00 61 62") << 0 << int(CArchiveException::BadLength);
        QTest::newRow("string longer than the file")
            << ParseHexFixture("FF FF FF FF FF FF 7F 61") << 1 << int(CArchiveException::BadLength);
        QTest::newRow("wide string longer than the file")
            << ParseHexFixture("FF FE FF 02 41 00") << 1 << int(CArchiveException::BadLength);
        QTest::newRow("negative count")
            << ParseHexFixture("FF FF FF 80") << 2 << int(CArchiveException::BadCount);
        QTest::newRow("count the file cannot hold") << ParseHexFixture("03 00 00 00 0A 0A 0A 0A 0A")
                                                    << 2 << int(CArchiveException::BadCount);
        QTest::newRow("int cut short")
            << ParseHexFixture("01 00") << 2 << int(CArchiveException::EndOfFile);
    }

    void damagedLengthsRaise()
    {
        QFETCH(QByteArray, bytes);
        QFETCH(int, kind);
        QFETCH(int, cause);
        const std::string in = bytes.toStdString();
        CArchive ar{std::string_view(in)};
        try {
            if (kind == 0)
                ar.ReadCountedText();
            else if (kind == 1)
                ar.ReadCString();
            else
                ar.ReadCount(2, "test");
            QFAIL("no error raised");
        } catch (const CArchiveException& e) {
            QCOMPARE(int(e.GetCause()), cause);
        }
    }

    void fileStreamCrossesItsBuffer()
    {
        // Lines, ints and texts that straddle the reader's 1 MiB buffer.
        QTemporaryFile file;
        QVERIFY(file.open());
        const std::string longLine(1500000, 'a');
        const std::string text(700000, 'b');
        {
            CArchive ar(file.handle());
            ar.WriteLine(longLine);
            ar.WriteCountedText(text);
            for (int i = 0; i < 200000; ++i)
                ar.WriteInt(i);
            ar.WriteLine("end");
            ar.Flush();
        }
        const int fd = ::open(file.fileName().toLocal8Bit().constData(), O_RDONLY);
        QVERIFY(fd >= 0);
        const off_t size = ::lseek(fd, 0, SEEK_END);
        ::lseek(fd, 0, SEEK_SET);
        CArchive ar(fd, size);
        QCOMPARE(ar.ReadLine().size(), longLine.size());
        QCOMPARE(ar.ReadCountedText(), text);
        bool inOrder = true;
        for (int i = 0; i < 200000; ++i)
            inOrder = inOrder && ar.ReadInt() == i;
        QVERIFY(inOrder);
        QCOMPARE(ar.ReadLine(), std::string("end"));
        QCOMPARE(ar.BytesLeft(), 0);
        ::close(fd);
    }
};

QTEST_GUILESS_MAIN(TestArchive)
#include "tst_archive.moc"
