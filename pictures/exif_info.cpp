#include "pictures/exif_info.h"

#include <algorithm>
#include <cerrno>
#include <climits>
#include <cmath>
#include <cstring>
#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>
#include <vector>

namespace {

constexpr int kMaxSegments = 20;
constexpr int kMaxFillBytes = 7;
constexpr uint8_t kTypeSizes[13] = {0, 1, 1, 2, 4, 8, 1, 1, 2, 4, 8, 4, 8};

uint16_t Read16(const uint8_t* b, bool bigEndian)
{
    return bigEndian ? uint16_t(b[0] << 8 | b[1]) : uint16_t(b[1] << 8 | b[0]);
}

uint32_t Read32(const uint8_t* b, bool bigEndian)
{
    if (bigEndian)
        return uint32_t(b[0]) << 24 | uint32_t(b[1]) << 16 | uint32_t(b[2]) << 8 | b[3];
    return uint32_t(b[3]) << 24 | uint32_t(b[2]) << 16 | uint32_t(b[1]) << 8 | b[0];
}

// The bytes before the first NUL.
std::string TextUpToNul(const uint8_t* bytes, size_t size)
{
    const auto* begin = reinterpret_cast<const char*>(bytes);
    return std::string(begin, strnlen(begin, size));
}

class MemorySource
{
public:
    explicit MemorySource(std::string_view bytes) : m_bytes(bytes) {}
    int64_t Size() const { return static_cast<int64_t>(m_bytes.size()); }
    size_t ReadAt(int64_t pos, uint8_t* out, size_t n) const
    {
        if (pos < 0 || pos >= Size())
            return 0;
        n = std::min(n, m_bytes.size() - static_cast<size_t>(pos));
        std::memcpy(out, m_bytes.data() + pos, n);
        return n;
    }

private:
    std::string_view m_bytes;
};

// Reads a file through one window, so that the few small reads of a header
// walk cost one or two system calls.
class FileSource
{
public:
    explicit FileSource(const std::string& path) : m_fd(::open(path.c_str(), O_RDONLY | O_CLOEXEC))
    {
        struct stat st;
        if (m_fd >= 0 && ::fstat(m_fd, &st) == 0 && S_ISREG(st.st_mode))
            m_size = st.st_size;
    }
    ~FileSource()
    {
        if (m_fd >= 0)
            ::close(m_fd);
    }
    FileSource(const FileSource&) = delete;
    FileSource& operator=(const FileSource&) = delete;

    bool IsOpen() const { return m_fd >= 0 && m_size >= 0; }
    int64_t Size() const { return m_size; }

    size_t ReadAt(int64_t pos, uint8_t* out, size_t n)
    {
        if (pos < 0 || pos >= m_size)
            return 0;
        n = static_cast<size_t>(std::min<int64_t>(static_cast<int64_t>(n), m_size - pos));
        const int64_t windowEnd = m_windowStart + static_cast<int64_t>(m_window.size());
        if (pos < m_windowStart || pos + static_cast<int64_t>(n) > windowEnd) {
            if (n > kWindowSize)
                return ReadFully(pos, out, n);
            m_window.resize(static_cast<size_t>(std::min<int64_t>(kWindowSize, m_size - pos)));
            m_window.resize(ReadFully(pos, m_window.data(), m_window.size()));
            m_windowStart = pos;
            n = std::min(n, m_window.size());
        }
        std::memcpy(out, m_window.data() + (pos - m_windowStart), n);
        return n;
    }

private:
    static constexpr size_t kWindowSize = 64 * 1024;

    size_t ReadFully(int64_t pos, uint8_t* out, size_t n)
    {
        size_t done = 0;
        while (done < n) {
            const ssize_t got = ::pread(m_fd, out + done, n - done, pos + done);
            if (got < 0 && errno == EINTR)
                continue;
            if (got <= 0)
                break;
            done += static_cast<size_t>(got);
        }
        return done;
    }

    int m_fd;
    int64_t m_size = -1;
    std::vector<uint8_t> m_window;
    int64_t m_windowStart = 0;
};

} // namespace

struct CExifInfo::Walk
{
    const uint8_t* data;
    int64_t size;
    bool bigEndian;
    std::vector<int64_t> visited;
};

int CExifInfo::ReadExif(const std::string& path)
{
    FileSource source(path);
    if (!source.IsOpen())
        return 0;
    return WalkSegments(source);
}

int CExifInfo::ReadExifBytes(std::string_view bytes)
{
    MemorySource source(bytes);
    return WalkSegments(source);
}

bool CExifInfo::IsFrameHeaderMarker(uint8_t marker)
{
    // Start-of-frame codes; C4 (Huffman tables), C8 (reserved) and CC (arithmetic
    // conditioning) share the high nibble but carry no frame size.
    return marker >= 0xC0 && marker <= 0xCF && marker != 0xC4 && marker != 0xC8 && marker != 0xCC;
}

template <typename Source> int CExifInfo::WalkSegments(Source& source)
{
    uint8_t head[5];
    if (source.ReadAt(0, head, 2) < 2 || head[0] != 0xFF || head[1] != 0xD8)
        return 0;
    int64_t p = 2;
    for (int segment = 0; segment < kMaxSegments && p < source.Size(); ++segment) {
        int fills = 0;
        uint8_t marker = 0;
        for (;;) {
            if (source.ReadAt(p, &marker, 1) < 1)
                return 1;
            if (marker != 0xFF)
                break;
            if (++fills == kMaxFillBytes)
                return 0;
            ++p;
        }
        if (source.ReadAt(p + 1, head, 2) < 2)
            return 1;
        const int64_t length = head[0] << 8 | head[1];
        const int64_t d = p + 3;
        if (marker == 0xE1 && source.ReadAt(d, head, 4) == 4 && std::memcmp(head, "Exif", 4) == 0) {
            // The block is the segment's own bytes after "Exif\0\0": L less the
            // length field and those six.
            std::string block(static_cast<size_t>(std::max<int64_t>(length - 8, 0)), '\0');
            auto* bytes = reinterpret_cast<uint8_t*>(block.data());
            block.resize(source.ReadAt(d + 6, bytes, block.size()));
            ParseTiffBlock(bytes, block.size());
        }
        if (IsFrameHeaderMarker(marker)) {
            if (source.ReadAt(d, head, 5) < 5)
                return 1;
            imageHeight = head[1] << 8 | head[2];
            imageWidth = head[3] << 8 | head[4];
        }
        if (marker == 0xDA)
            break;
        // Lands on the next marker's code byte, past its leading 0xFF.
        p = d - 1 + length;
    }
    return 1;
}

int CExifInfo::ParseTiffBlock(const uint8_t* block, size_t size)
{
    if (size < 8)
        return 0;
    const bool bigEndian = !(block[0] == 'I' && block[1] == 'I');
    if (Read16(block + 2, bigEndian) != 42)
        return 0;
    Walk walk{block + 8, static_cast<int64_t>(size - 8), bigEndian, {}};
    ParseDirectory(walk, int64_t(Read32(block + 4, bigEndian)) - 8, 0);
    return 1;
}

void CExifInfo::ParseDirectory(Walk& walk, int64_t start, int depth)
{
    if (start < 0)
        return;
    if (start >= walk.size) {
        exifRead = 1;
        return;
    }
    // A directory already walked (a pointer cycle or a shared target) is refused.
    if (depth >= kMaxDirectoryDepth || walk.visited.size() >= kMaxDirectories ||
        std::find(walk.visited.begin(), walk.visited.end(), start) != walk.visited.end())
        return;
    walk.visited.push_back(start);

    if (start + 2 > walk.size) {
        exifRead = 1;
        return;
    }
    const int count = Read16(walk.data + start, walk.bigEndian);
    for (int i = 0; i < count; ++i) {
        const int64_t e = start + 2 + 12 * int64_t(i);
        if (e + 12 > walk.size)
            break;
        const uint8_t* entry = walk.data + e;
        const uint16_t tag = Read16(entry, walk.bigEndian);
        const int type = Read16(entry + 2, walk.bigEndian);
        const auto components = static_cast<int32_t>(Read32(entry + 4, walk.bigEndian));
        if (type > 12)
            return;
        const int64_t bytes = int64_t(components) * kTypeSizes[type];
        const int64_t v = bytes > 4 ? int64_t(Read32(entry + 8, walk.bigEndian)) - 8 : e + 8;
        if (v < 0 || v >= walk.size)
            return;
        if (!ApplyTag(walk, tag, type, v, std::max<int64_t>(bytes, 0), depth))
            break;
    }
    exifRead = 1;
}

bool CExifInfo::ApplyTag(Walk& walk, uint16_t tag, int type, int64_t v, int64_t bytes, int depth)
{
    const uint8_t* value = walk.data + v;
    const size_t left = static_cast<size_t>(walk.size - v);
    // A text ends at its NUL, its limit, the end of the data, and also the end of
    // its own value: an unterminated text must not run into its neighbour's bytes.
    const size_t own = static_cast<size_t>(std::min<int64_t>(bytes, walk.size - v));
    auto text = [&](size_t most) { return TextUpToNul(value, std::min(most, own)); };
    auto number = [&](float& target) {
        if (NumericValueSize(type) > left)
            return false;
        target = GetNumericValue(type, walk.bigEndian, value);
        return true;
    };
    auto integer = [&](int32_t& target) {
        float f = 0;
        if (!number(f))
            return false;
        target = ToInt(f);
        return true;
    };

    switch (tag) {
    case 0x010F:
        cameraMake = text(31);
        return true;
    case 0x0110:
        cameraModel = text(39);
        return true;
    case 0x0112:
        return integer(orientation);
    case 0x011A:
        return number(xResolution);
    case 0x011B:
        return number(yResolution);
    case 0x0128:
        return integer(resolutionUnit);
    case 0x0131:
        if (software.empty())
            software = text(own);
        return true;
    case 0x013B:
        if (artist.empty())
            artist = text(own);
        return true;
    case 0x8298:
        if (copyright.empty())
            copyright = text(own);
        return true;
    case 0x829A:
        return number(exposureTime);
    case 0x829D:
        return number(fNumber);
    case 0x8769:
    case 0xA005:
        if (left < 4)
            return false;
        ParseDirectory(walk, int64_t(Read32(value, walk.bigEndian)) - 8, depth + 1);
        return true;
    case 0x8822:
        return integer(exposureProgram);
    case 0x8827:
        return integer(isoSpeed);
    case 0x9000:
        exifVersion = text(4);
        return true;
    case 0x9003:
        dateTime = text(19);
        return true;
    case 0x9102:
        return integer(compressionLevel);
    case 0x9201:
        return number(shutterSpeedValue);
    case 0x9202:
    case 0x9205: {
        float aperture = 0;
        if (!number(aperture))
            return false;
        if (fNumber == 0)
            fNumber = aperture;
        return true;
    }
    case 0x9203:
        return number(brightness);
    case 0x9204:
        return number(exposureBias);
    case 0x9206:
        return number(subjectDistance);
    case 0x9207:
        return integer(meteringMode);
    case 0x9209: {
        int32_t flash = 0;
        if (!integer(flash))
            return false;
        flashUsed = (flash & 0x0F) != 0 ? 1 : 0;
        return true;
    }
    case 0x920A:
        return number(focalLength);
    case 0x9286: {
        const size_t n = std::min<size_t>(100, own);
        if (n >= 5 && std::memcmp(value, "ASCII", 5) == 0)
            comments = n > 8 ? TextUpToNul(value + 8, n - 8) : std::string();
        else
            comments = TextUpToNul(value, n);
        return true;
    }
    case 0xA002:
        return integer(imageWidth);
    case 0xA003:
        return integer(imageHeight);
    case 0xA20E:
        return number(focalPlaneXResolution);
    case 0xA20F:
        return number(focalPlaneYResolution);
    case 0xA210:
        return number(focalPlaneResolutionUnit);
    default:
        return true;
    }
}

size_t CExifInfo::NumericValueSize(int type)
{
    switch (type) {
    case 1:
    case 6:
        return 1;
    case 3:
    case 8:
        return 2;
    case 4:
    case 9:
        return 4;
    case 5:
    case 10:
        return 8;
    default:
        return 0;
    }
}

float CExifInfo::GetNumericValue(int type, bool bigEndian, const uint8_t* value)
{
    switch (type) {
    case 1:
        return value[0];
    case 6:
        return static_cast<int8_t>(value[0]);
    case 3:
        return Read16(value, bigEndian);
    case 8:
        return static_cast<int16_t>(Read16(value, bigEndian));
    case 4:
        return static_cast<float>(Read32(value, bigEndian));
    case 9:
        return static_cast<float>(static_cast<int32_t>(Read32(value, bigEndian)));
    case 5: {
        const uint32_t denominator = Read32(value + 4, bigEndian);
        return denominator == 0
                   ? 0.0f
                   : static_cast<float>(double(Read32(value, bigEndian)) / denominator);
    }
    case 10: {
        const auto numerator = static_cast<int32_t>(Read32(value, bigEndian));
        const auto denominator = static_cast<int32_t>(Read32(value + 4, bigEndian));
        return denominator == 0 ? 0.0f : static_cast<float>(double(numerator) / denominator);
    }
    default:
        return 0;
    }
}

int32_t CExifInfo::ToInt(float value)
{
    if (std::isnan(value))
        return 0;
    if (value >= 2147483647.0f)
        return INT32_MAX;
    if (value <= -2147483648.0f)
        return INT32_MIN;
    return static_cast<int32_t>(value);
}
