#pragma once
// Builds TIFF blocks and JPEG streams by hand, byte by byte, in either byte
// order, so that the EXIF reader's tests state their input exactly.

#include <QByteArray>
#include <QList>

#include <optional>

class TiffBuilder
{
public:
    struct Field
    {
        quint16 tag;
        quint16 type;
        qint32 count;
        QByteArray value;                           // in the block's byte order
        int pointsTo = -1;                          // a directory index: the value is its offset
        std::optional<quint32> slot = std::nullopt; // the value/offset slot as given
    };

    explicit TiffBuilder(bool bigEndian) : m_bigEndian(bigEndian) {}

    QByteArray U16(quint32 v) const
    {
        QByteArray b(2, '\0');
        b[m_bigEndian ? 0 : 1] = char(v >> 8);
        b[m_bigEndian ? 1 : 0] = char(v);
        return b;
    }
    QByteArray U32(quint32 v) const
    {
        QByteArray b(4, '\0');
        for (int i = 0; i < 4; ++i)
            b[m_bigEndian ? 3 - i : i] = char(v >> (8 * i));
        return b;
    }

    Field Ascii(quint16 tag, const QByteArray& text) const
    {
        return {tag, 2, qint32(text.size() + 1), text + '\0'};
    }
    Field Short(quint16 tag, quint16 v) const { return {tag, 3, 1, U16(v)}; }
    Field Long(quint16 tag, quint32 v) const { return {tag, 4, 1, U32(v)}; }
    Field Rational(quint16 tag, quint32 n, quint32 d) const { return {tag, 5, 1, U32(n) + U32(d)}; }
    Field SRational(quint16 tag, qint32 n, qint32 d) const
    {
        return {tag, 10, 1, U32(quint32(n)) + U32(quint32(d))};
    }
    Field Undefined(quint16 tag, const QByteArray& bytes) const
    {
        return {tag, 7, qint32(bytes.size()), bytes};
    }
    Field Pointer(quint16 tag, int directory) const { return {tag, 4, 1, {}, directory}; }
    Field Slot(quint16 tag, quint16 type, qint32 count, quint32 slot) const
    {
        return {tag, type, count, {}, -1, slot};
    }

    int AddDirectory(const QList<Field>& fields)
    {
        m_directories.append(fields);
        return int(m_directories.size() - 1);
    }

    // Header, then the directories in order, each followed by its long values.
    // firstOffset replaces the header's offset of the first directory.
    QByteArray Build(std::optional<quint32> firstOffset = std::nullopt) const
    {
        QList<quint32> offsets;
        quint32 at = 8;
        for (const QList<Field>& fields : m_directories) {
            offsets.append(at);
            at += 2 + 12 * quint32(fields.size()) + 4;
            for (const Field& f : fields) {
                if (IsLong(f))
                    at += quint32(f.value.size() + (f.value.size() & 1));
            }
        }
        QByteArray block = m_bigEndian ? QByteArray("MM") : QByteArray("II");
        block += U16(42) + U32(firstOffset.value_or(offsets.value(0, 8)));
        for (int d = 0; d < m_directories.size(); ++d) {
            const QList<Field>& fields = m_directories.at(d);
            quint32 data = offsets.at(d) + 2 + 12 * quint32(fields.size()) + 4;
            QByteArray longValues;
            block += U16(quint32(fields.size()));
            for (const Field& f : fields) {
                block += U16(f.tag) + U16(f.type) + U32(quint32(f.count));
                if (f.slot) {
                    block += U32(*f.slot);
                } else if (f.pointsTo >= 0) {
                    block += U32(offsets.at(f.pointsTo));
                } else if (IsLong(f)) {
                    block += U32(data);
                    QByteArray v = f.value;
                    if (v.size() & 1)
                        v += '\0';
                    longValues += v;
                    data += quint32(v.size());
                } else {
                    block += f.value.leftJustified(4, '\0', true);
                }
            }
            block += U32(0) + longValues;
        }
        return block;
    }

private:
    static bool IsLong(const Field& f)
    {
        static const int sizes[13] = {0, 1, 1, 2, 4, 8, 1, 1, 2, 4, 8, 4, 8};
        return !f.slot && f.pointsTo < 0 && f.type <= 12 && qint64(f.count) * sizes[f.type] > 4;
    }

    bool m_bigEndian;
    QList<QList<Field>> m_directories;
};

inline QByteArray JpegSegment(quint8 marker, const QByteArray& payload)
{
    const int length = int(payload.size()) + 2;
    return QByteArray("\xFF") + char(marker) + char(length >> 8) + char(length & 0xFF) + payload;
}

inline QByteArray ExifSegment(const QByteArray& tiff)
{
    return JpegSegment(0xE1, QByteArray("Exif\0\0", 6) + tiff);
}

// A frame header: precision 8, the size, one component.
inline QByteArray FrameSegment(quint8 marker, int width, int height)
{
    const char payload[] = {
        8, char(height >> 8), char(height), char(width >> 8), char(width), 1, 1, 0x11, 0};
    return JpegSegment(marker, QByteArray(payload, sizeof payload));
}

inline QByteArray JfifSegment()
{
    return JpegSegment(0xE0, QByteArray("JFIF\0\x01\x01\0\0\x01\0\x01\0\0", 14));
}

// Start of image, the segments, a start of scan and a little scan data.
inline QByteArray Jpeg(const QList<QByteArray>& segments)
{
    QByteArray bytes("\xFF\xD8");
    for (const QByteArray& s : segments)
        bytes += s;
    return bytes + JpegSegment(0xDA, QByteArray("\x01\x01\x00\x00\x3F\x00", 6)) +
           QByteArray("\x12\x34\xFF\xD9");
}
