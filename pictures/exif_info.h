#pragma once
// The camera information of one picture, read from the EXIF block and the
// frame header of a JPEG file.

#include <cstddef>
#include <cstdint>
#include <string>
#include <string_view>

// A plain record: a new read overwrites the fields it finds tags for and
// leaves the others as an earlier read left them.
class CExifInfo
{
public:
    virtual ~CExifInfo() = default;

    // Walks the file's header segments up to the start of scan; the image
    // data is never read. 0 when the file cannot be read or is not a JPEG
    // stream, else 1.
    int ReadExif(const std::string& path);
    // The same walk over bytes in memory.
    int ReadExifBytes(std::string_view bytes);

    // 1 after walking the first directory, 0 when the header is not a TIFF header.
    int ParseTiffBlock(const uint8_t* block, size_t size);

    // The first component of a value; the bytes must hold NumericValueSize(type).
    static float GetNumericValue(int type, bool bigEndian, const uint8_t* value);
    static size_t NumericValueSize(int type);
    // Float to int field: truncated toward zero, held inside the int range.
    static int32_t ToInt(float value);
    static bool IsFrameHeaderMarker(uint8_t marker);

    // Texts hold the bytes before their first NUL.
    std::string exifVersion;
    std::string cameraMake;
    std::string cameraModel;
    std::string comments;
    std::string dateTime;
    std::string software;
    std::string artist;
    std::string copyright;
    int32_t flashUsed = 0;
    int32_t imageWidth = 0;
    int32_t imageHeight = 0;
    int32_t orientation = 0;
    int32_t meteringMode = 0;
    int32_t exposureProgram = 0;
    int32_t isoSpeed = 0;
    int32_t exposureSpeed = 0;
    int32_t compressionLevel = 0;
    float xResolution = 0;
    float yResolution = 0;
    int32_t resolutionUnit = 0;
    float focalLength = 0;
    float exposureTime = 0;
    float shutterSpeedValue = 0;
    float fNumber = 0;
    float subjectDistance = 0;
    float exposureBias = 0;
    float focalPlaneXResolution = 0;
    float focalPlaneYResolution = 0;
    float focalPlaneResolutionUnit = 0;
    float brightness = 0;
    // 1 once a directory walk ended normally; never reset.
    int32_t exifRead = 0;

    // Bounds of one TIFF block's walk: nesting depth and directories walked.
    static constexpr int kMaxDirectoryDepth = 8;
    static constexpr size_t kMaxDirectories = 32;

private:
    struct Walk;
    template <typename Source> int WalkSegments(Source& source);
    void ParseDirectory(Walk& walk, int64_t start, int depth);
    // False when a value the tag needs lies past the end of the data.
    bool ApplyTag(Walk& walk, uint16_t tag, int type, int64_t v, int64_t bytes, int depth);
};
