#include "output/safe_file_name.h"

std::string SafeFileName(const std::string& text, const std::string& fallback)
{
    std::string name = text;
    for (char& c : name) {
        const auto u = static_cast<unsigned char>(c);
        if (c == '/' || u < 0x20 || u == 0x7F)
            c = '_';
    }
    if (!name.empty() && name.front() == '.')
        name.front() = '_';
    return name.empty() ? fallback : name;
}
