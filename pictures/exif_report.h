#pragma once
// The EXIF report: the camera information of one picture as the text that
// the EXIF dialog and `hearthbook-cli exif` show.

#include <string>

class CExifInfo;

// One line per field, each ending in CR LF; optional lines only when they
// have something to say.
std::string BuildExifReport(const CExifInfo& info);

// Seconds of exposure: the exposure time, else 1 / 2^(shutter speed value).
float ReportExposureTime(const CExifInfo& info);
