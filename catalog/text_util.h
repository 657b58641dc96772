#pragma once
// Byte-string helpers shared by the whole program: printf-style formatting,
// single-line cleaning, CR LF splitting and display decoding.

#include <string>
#include <string_view>
#include <vector>

std::string StrFormat(const char* format, ...) __attribute__((format(printf, 1, 2)));

// A line field cannot hold CR or LF (they end the field in the data file).
std::string OneLine(std::string_view text);
bool HasLineBreak(std::string_view text);

// Each stretch before a CR LF pair is a line; the text after the last pair is
// always a last line, even when empty.
std::vector<std::string> SplitCrLfLines(std::string_view text);

bool IsValidUtf8(std::string_view bytes);
// Stored text is UTF-8 when it is valid UTF-8, else bytes of Windows-1252.
std::string DisplayUtf8(std::string_view bytes);

bool EqualsNoCase(std::string_view a, std::string_view b);
