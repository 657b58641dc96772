// libFuzzer target: the EXIF reader over any bytes, both as a JPEG stream
// (segment walk) and as a bare TIFF block (directory walk), then the report.

#include "pictures/exif_info.h"
#include "pictures/exif_report.h"

#include <cstddef>
#include <cstdint>
#include <string_view>

extern "C" int LLVMFuzzerTestOneInput(const uint8_t* data, size_t size)
{
    CExifInfo stream;
    stream.ReadExifBytes(std::string_view(reinterpret_cast<const char*>(data), size));
    CExifInfo block;
    block.ParseTiffBlock(data, size);
    BuildExifReport(stream);
    BuildExifReport(block);
    return 0;
}
