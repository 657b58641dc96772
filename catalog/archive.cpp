#include "catalog/archive.h"

#include "catalog/text_util.h"

#include <QString>

#include <algorithm>
#include <cerrno>
#include <cstring>
#include <unistd.h>

namespace {
constexpr size_t kBufferSize = 1 << 20;
}

CArchiveException::CArchiveException(Cause cause, int64_t offset, const std::string& what,
                                     int osError)
    : std::runtime_error(what), m_cause(cause), m_offset(offset), m_osError(osError)
{}

CArchive::CArchive(std::string_view bytes) : m_storing(false)
{
    m_bufferStart = bytes.data();
    m_cur = bytes.data();
    m_end = bytes.data() + bytes.size();
    m_size = static_cast<int64_t>(bytes.size());
}

CArchive::CArchive(int fd, int64_t size) : m_storing(false), m_fd(fd), m_size(size)
{
    m_buffer.reset(new char[kBufferSize]);
    m_bufferStart = m_cur = m_end = m_buffer.get();
}

CArchive::CArchive(std::string* sink) : m_storing(true), m_sink(sink) {}

CArchive::CArchive(int fd) : m_storing(true), m_fd(fd)
{
    m_buffer.reset(new char[kBufferSize]);
}

CArchive::~CArchive() = default;

void CArchive::Fail(CArchiveException::Cause cause, const std::string& what) const
{
    throw CArchiveException(cause, GetPosition(), what);
}

int64_t CArchive::GetPosition() const
{
    if (m_sink)
        return static_cast<int64_t>(m_sink->size());
    if (m_storing)
        return m_written + static_cast<int64_t>(m_bufferUsed);
    return m_bufferOffset + (m_cur - m_bufferStart);
}

int64_t CArchive::BytesLeft() const
{
    return m_size - GetPosition();
}

bool CArchive::Refill()
{
    if (m_fd < 0)
        return false;
    m_bufferOffset += m_end - m_bufferStart;
    m_bufferStart = m_cur = m_end = m_buffer.get();
    const int64_t left = m_size - m_bufferOffset;
    if (left <= 0)
        return false;
    const size_t want = static_cast<size_t>(std::min<int64_t>(left, kBufferSize));
    ssize_t got;
    do {
        got = ::read(m_fd, m_buffer.get(), want);
    } while (got < 0 && errno == EINTR);
    if (got < 0)
        throw CArchiveException(CArchiveException::ReadFailed, m_bufferOffset, std::strerror(errno),
                                errno);
    m_end = m_buffer.get() + got;
    return got > 0;
}

void CArchive::ReadBytes(void* data, size_t size)
{
    auto* out = static_cast<char*>(data);
    while (size > 0) {
        if (m_cur == m_end && !Refill())
            Fail(CArchiveException::EndOfFile, "the file ends inside a record");
        const size_t n = std::min(size, static_cast<size_t>(m_end - m_cur));
        std::memcpy(out, m_cur, n);
        m_cur += n;
        out += n;
        size -= n;
    }
}

uint8_t CArchive::ReadUInt8()
{
    uint8_t b;
    ReadBytes(&b, 1);
    return b;
}

uint16_t CArchive::ReadUInt16()
{
    unsigned char b[2];
    ReadBytes(b, 2);
    return static_cast<uint16_t>(b[0] | (b[1] << 8));
}

uint32_t CArchive::ReadUInt32()
{
    unsigned char b[4];
    ReadBytes(b, 4);
    return static_cast<uint32_t>(b[0]) | (static_cast<uint32_t>(b[1]) << 8) |
           (static_cast<uint32_t>(b[2]) << 16) | (static_cast<uint32_t>(b[3]) << 24);
}

int32_t CArchive::ReadInt()
{
    return static_cast<int32_t>(ReadUInt32());
}

int64_t CArchive::ReadInt64()
{
    const uint64_t low = ReadUInt32();
    const uint64_t high = ReadUInt32();
    return static_cast<int64_t>(low | (high << 32));
}

CTime CArchive::ReadTime()
{
    const uint32_t value = ReadUInt32();
    if (value == kLongTimeMarker)
        return CTime(ReadInt64());
    return CTime(static_cast<int64_t>(value));
}

std::string CArchive::ReadLine()
{
    // Every record ends with fixed-size fields, so a line that would start at
    // the very end can only belong to a truncated file.
    if (m_cur == m_end && !Refill())
        Fail(CArchiveException::EndOfFile, "the file ends inside a record");
    std::string line;
    for (;;) {
        const char* p = m_cur;
        while (p < m_end && *p != '\n' && *p != '\r')
            ++p;
        line.append(m_cur, static_cast<size_t>(p - m_cur));
        m_cur = p;
        if (p < m_end) {
            const bool cr = *p == '\r';
            ++m_cur;
            // A CR takes the byte after it along, whatever it is.
            if (cr && (m_cur < m_end || Refill()))
                ++m_cur;
            return line;
        }
        if (!Refill())
            return line; // the file ended: what was read so far
    }
}

std::string CArchive::ReadCountedText()
{
    const int32_t n = ReadInt();
    if (n < 0 || n > BytesLeft())
        Fail(CArchiveException::BadLength,
             StrFormat("a text length of %d exceeds the %lld bytes left", n,
                       static_cast<long long>(BytesLeft())));
    std::string text(static_cast<size_t>(n), '\0');
    ReadBytes(text.data(), text.size());
    return text;
}

std::string CArchive::ReadCString()
{
    int64_t length = ReadUInt8();
    bool wide = false;
    if (length == 0xFF) {
        length = ReadUInt16();
        if (length == 0xFFFE) {
            wide = true;
            length = ReadUInt8();
            if (length == 0xFF)
                length = ReadUInt16();
        }
        if (length == 0xFFFF)
            length = ReadUInt32();
    }
    const int64_t bytes = wide ? length * 2 : length;
    if (bytes > BytesLeft())
        Fail(CArchiveException::BadLength,
             StrFormat("a string length of %lld exceeds the %lld bytes left",
                       static_cast<long long>(length), static_cast<long long>(BytesLeft())));
    std::string text(static_cast<size_t>(bytes), '\0');
    ReadBytes(text.data(), text.size());
    if (!wide)
        return text;
    std::u16string units(static_cast<size_t>(length), u'\0');
    for (size_t i = 0; i < units.size(); ++i)
        units[i] = static_cast<char16_t>(static_cast<unsigned char>(text[2 * i]) |
                                         (static_cast<unsigned char>(text[2 * i + 1]) << 8));
    return QString::fromUtf16(units.data(), static_cast<qsizetype>(units.size())).toStdString();
}

int32_t CArchive::ReadCount(int64_t minBytesEach, const char* what)
{
    const int32_t n = ReadInt();
    if (n < 0 || (minBytesEach > 0 && n > BytesLeft() / minBytesEach))
        Fail(CArchiveException::BadCount,
             StrFormat("a %s count of %d does not fit in the %lld bytes left", what, n,
                       static_cast<long long>(BytesLeft())));
    return n;
}

void CArchive::WriteAll(const char* p, size_t size)
{
    while (size > 0) {
        const ssize_t n = ::write(m_fd, p, size);
        if (n < 0 && errno == EINTR)
            continue;
        if (n <= 0)
            throw CArchiveException(CArchiveException::WriteFailed, m_written,
                                    std::strerror(n < 0 ? errno : ENOSPC), n < 0 ? errno : ENOSPC);
        p += n;
        size -= static_cast<size_t>(n);
        m_written += n;
    }
}

void CArchive::Put(const void* data, size_t size)
{
    if (m_sink) {
        m_sink->append(static_cast<const char*>(data), size);
        return;
    }
    if (m_bufferUsed + size > kBufferSize)
        Flush();
    if (size > kBufferSize) {
        WriteAll(static_cast<const char*>(data), size);
        return;
    }
    std::memcpy(m_buffer.get() + m_bufferUsed, data, size);
    m_bufferUsed += size;
}

void CArchive::Flush()
{
    if (!m_storing || m_sink)
        return;
    WriteAll(m_buffer.get(), m_bufferUsed);
    m_bufferUsed = 0;
}

void CArchive::WriteBytes(const void* data, size_t size)
{
    Put(data, size);
}

void CArchive::WriteInt(int32_t value)
{
    const auto v = static_cast<uint32_t>(value);
    const unsigned char b[4] = {static_cast<unsigned char>(v), static_cast<unsigned char>(v >> 8),
                                static_cast<unsigned char>(v >> 16),
                                static_cast<unsigned char>(v >> 24)};
    Put(b, 4);
}

void CArchive::WriteInt64(int64_t value)
{
    const auto v = static_cast<uint64_t>(value);
    WriteInt(static_cast<int32_t>(static_cast<uint32_t>(v)));
    WriteInt(static_cast<int32_t>(static_cast<uint32_t>(v >> 32)));
}

void CArchive::WriteTime(CTime value)
{
    const int64_t t = value.GetTime();
    if (t >= 0 && t <= 0xFFFFFFFFll && t != kLongTimeMarker) {
        WriteInt(static_cast<int32_t>(static_cast<uint32_t>(t)));
        return;
    }
    WriteInt(static_cast<int32_t>(kLongTimeMarker));
    WriteInt64(t);
}

void CArchive::WriteLine(std::string_view text)
{
    if (HasLineBreak(text)) {
        const std::string clean = OneLine(text);
        Put(clean.data(), clean.size());
    } else {
        Put(text.data(), text.size());
    }
    Put("\n", 1);
}

void CArchive::WriteCountedText(std::string_view text)
{
    WriteInt(static_cast<int32_t>(text.size()));
    Put(text.data(), text.size());
}

void CArchive::WriteCString(std::string_view text)
{
    const size_t n = text.size();
    if (n < 0xFF) {
        const unsigned char b = static_cast<unsigned char>(n);
        Put(&b, 1);
    } else if (n < 0xFFFE) {
        const unsigned char b[3] = {0xFF, static_cast<unsigned char>(n),
                                    static_cast<unsigned char>(n >> 8)};
        Put(b, 3);
    } else {
        const unsigned char b[3] = {0xFF, 0xFF, 0xFF};
        Put(b, 3);
        WriteInt(static_cast<int32_t>(n));
    }
    Put(text.data(), n);
}

void CArchive::Int(int32_t& value)
{
    if (m_storing)
        WriteInt(value);
    else
        value = ReadInt();
}

void CArchive::Int64(int64_t& value)
{
    if (m_storing)
        WriteInt64(value);
    else
        value = ReadInt64();
}

void CArchive::UInt64(uint64_t& value)
{
    if (m_storing)
        WriteInt64(static_cast<int64_t>(value));
    else
        value = static_cast<uint64_t>(ReadInt64());
}

void CArchive::Time(CTime& value)
{
    if (m_storing)
        WriteTime(value);
    else
        value = ReadTime();
}

void CArchive::Line(std::string& text)
{
    if (m_storing)
        WriteLine(text);
    else
        text = ReadLine();
}

void CArchive::CountedText(std::string& text)
{
    if (m_storing)
        WriteCountedText(text);
    else
        text = ReadCountedText();
}

void CArchive::CString(std::string& text)
{
    if (m_storing)
        WriteCString(text);
    else
        text = ReadCString();
}
