#pragma once
// The byte stream of the catalog data file: writes and reads the encodings of
// the item records (int, int64, CTime, line, counted text, CString) and raises
// CArchiveException on a damaged or truncated stream instead of reading on.

#include "catalog/ctime.h"

#include <cstdint>
#include <memory>
#include <stdexcept>
#include <string>
#include <string_view>

class CArchiveException : public std::runtime_error
{
public:
    enum Cause
    {
        EndOfFile,
        BadLength,
        BadCount,
        BadVersion,
        WriteFailed,
        ReadFailed
    };

    CArchiveException(Cause cause, int64_t offset, const std::string& what, int osError = 0);

    Cause GetCause() const { return m_cause; }
    int64_t GetOffset() const { return m_offset; }
    int GetOsError() const { return m_osError; }

private:
    Cause m_cause;
    int64_t m_offset;
    int m_osError;
};

class CArchive
{
public:
    // Loading from bytes that must outlive the archive.
    explicit CArchive(std::string_view bytes);
    // Loading from an open file descriptor holding `size` bytes from its current offset.
    CArchive(int fd, int64_t size);
    // Storing into a string.
    explicit CArchive(std::string* sink);
    // Storing into an open file descriptor; Flush() before closing it.
    explicit CArchive(int fd);
    ~CArchive();

    CArchive(const CArchive&) = delete;
    CArchive& operator=(const CArchive&) = delete;

    bool IsStoring() const { return m_storing; }
    bool IsLoading() const { return !m_storing; }

    int64_t GetPosition() const;
    int64_t BytesLeft() const; // loading only
    void Flush();              // storing only; raises WriteFailed

    void WriteInt(int32_t value);
    void WriteInt64(int64_t value);
    void WriteTime(CTime value);
    void WriteLine(std::string_view text); // CR and LF become blanks
    void WriteCountedText(std::string_view text);
    void WriteCString(std::string_view text);
    void WriteBytes(const void* data, size_t size);

    int32_t ReadInt();
    int64_t ReadInt64();
    CTime ReadTime();
    std::string ReadLine();
    std::string ReadCountedText();
    std::string ReadCString();
    void ReadBytes(void* data, size_t size);
    // A count of records that each take at least minBytesEach bytes; a negative
    // count or one the rest of the stream cannot hold is damage.
    int32_t ReadCount(int64_t minBytesEach, const char* what);

    // One call per field for Serialize: writes when storing, reads when loading.
    void Int(int32_t& value);
    void Int64(int64_t& value);
    void UInt64(uint64_t& value);
    void Time(CTime& value);
    void Line(std::string& text);
    void CountedText(std::string& text);
    void CString(std::string& text);

    [[noreturn]] void Fail(CArchiveException::Cause cause, const std::string& what) const;

    // The MFC 7.0 time form is a DWORD; a time it cannot hold (or one equal to
    // the long-form marker) is written in the long form the reader also takes.
    static constexpr uint32_t kLongTimeMarker = 0x8000000Au;

private:
    bool Refill();
    void Put(const void* data, size_t size);
    void WriteAll(const char* data, size_t size);
    uint32_t ReadUInt32();
    uint16_t ReadUInt16();
    uint8_t ReadUInt8();

    bool m_storing;
    int m_fd = -1;
    // loading
    const char* m_cur = nullptr;
    const char* m_end = nullptr;
    int64_t m_bufferOffset = 0; // stream offset of the byte before m_cur's buffer start
    const char* m_bufferStart = nullptr;
    int64_t m_size = 0;
    // storing
    std::string* m_sink = nullptr;
    int64_t m_written = 0;
    std::unique_ptr<char[]> m_buffer;
    size_t m_bufferUsed = 0;
};
