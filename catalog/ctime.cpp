#include "catalog/ctime.h"

#include <ctime>

CTime CTime::GetCurrentTime()
{
    return CTime(static_cast<int64_t>(std::time(nullptr)));
}

std::string CTime::Format(const char* format) const
{
    const std::time_t t = static_cast<std::time_t>(m_seconds);
    std::tm local{};
    if (!localtime_r(&t, &local))
        return std::string();
    char buffer[256];
    const size_t n = std::strftime(buffer, sizeof buffer, format, &local);
    return std::string(buffer, n);
}
