#pragma once
// File names made from user text: they stay inside the chosen folder.

#include <string>

// '/', control characters and a leading dot become '_'; an empty result
// becomes fallback.
std::string SafeFileName(const std::string& text, const std::string& fallback);
