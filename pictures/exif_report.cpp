#include "pictures/exif_report.h"

#include "catalog/text_util.h"
#include "pictures/exif_info.h"

#include <cmath>

namespace {

const char* UnitWord(int32_t unit)
{
    return unit == 3 ? "centimeter" : "inch";
}

const char* ProgramText(int32_t program)
{
    static const char* const texts[] = {"Manual",           "Normal Program",   "Aperture priority",
                                        "Shutter priority", "Creative program", "Action program",
                                        "Portrait mode",    "Landscape mode"};
    return program >= 1 && program <= 8 ? texts[program - 1] : nullptr;
}

const char* MeteringText(int32_t mode)
{
    static const char* const texts[] = {
        "Average", "Center Weighted Average", "Spot", "Multispot", "Pattern", "Partial"};
    return mode >= 1 && mode <= 6 ? texts[mode - 1] : nullptr;
}

} // namespace

float ReportExposureTime(const CExifInfo& info)
{
    if (info.exposureTime != 0)
        return info.exposureTime;
    return static_cast<float>(1.0 / std::exp(std::log(2.0) * info.shutterSpeedValue));
}

std::string BuildExifReport(const CExifInfo& info)
{
    std::string r;
    r += StrFormat("Camera Make:\t%s\r\n", info.cameraMake.c_str());
    r += StrFormat("Camera Model:\t%s\r\n", info.cameraModel.c_str());
    r += StrFormat("Date/Time:\t%s\r\n", info.dateTime.c_str());
    r += StrFormat("Version of EXIF:\t%s\r\n", info.exifVersion.c_str());
    r += StrFormat("Flash Used:\t%s\r\n", info.flashUsed != 0 ? "Yes" : "No");
    r += StrFormat("Coordinates:\t%d x %d\r\n", info.imageWidth, info.imageHeight);
    r += StrFormat("X Resolution:\t%4.1f (pixels per %s)\r\n", double(info.xResolution),
                   UnitWord(info.resolutionUnit));
    r += StrFormat("Y Resolution:\t%4.1f (pixels per %s)\r\n", double(info.yResolution),
                   UnitWord(info.resolutionUnit));
    const float t = ReportExposureTime(info);
    r +=
        StrFormat("Exposure time:\t%5.3f (1/%d)\r\n", double(t), CExifInfo::ToInt(1.0f / t + 0.5f));
    r += StrFormat("Exposure bias:\t%4.3f\r\n", double(info.exposureBias));
    if (const char* program = ProgramText(info.exposureProgram))
        r += StrFormat("Exposure program:\t%s\r\n", program);
    r += StrFormat("Brightness:\t%4.3f\r\n", double(info.brightness));
    if (const char* metering = MeteringText(info.meteringMode))
        r += StrFormat("Metering mode:\t%s\r\n", metering);
    r += StrFormat("Focal Length:\t%4.2f mm\r\n", double(info.focalLength));
    r += StrFormat("FNumber:\t\t%4.3f\r\n", double(info.fNumber));
    r += StrFormat("Exposure speed:\t%d\r\n", info.exposureSpeed);
    r += StrFormat("ISO Speed:\t%d\r\n", info.isoSpeed);
    if (info.compressionLevel > 0)
        r += StrFormat("Compression Level:\t%d\r\n", info.compressionLevel);
    if (info.subjectDistance > 0)
        r += StrFormat("Distance:\t\t%d\r\n", CExifInfo::ToInt(info.subjectDistance));
    if (!info.artist.empty())
        r += StrFormat("Artist:\t\t%s\r\n", info.artist.c_str());
    if (!info.copyright.empty())
        r += StrFormat("Copyright:\t\t%s\r\n", info.copyright.c_str());
    if (!info.software.empty())
        r += StrFormat("Software:\t\t%s\r\n", info.software.c_str());
    if (!info.comments.empty())
        r += StrFormat("Comments:\t%s\r\n", info.comments.c_str());
    return r;
}
