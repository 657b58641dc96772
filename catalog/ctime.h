#pragma once
// A point in time as the catalog keeps it: seconds since 1970-01-01 UTC,
// formatted in local time.

#include <cstdint>
#include <string>

class CTime
{
public:
    constexpr CTime() = default;
    constexpr explicit CTime(int64_t seconds) : m_seconds(seconds) {}

    static CTime GetCurrentTime();

    constexpr int64_t GetTime() const { return m_seconds; }
    // strftime in local time ("%b %d, %Y", "%y%m%d%H%M", ...).
    std::string Format(const char* format) const;

    friend constexpr bool operator==(CTime a, CTime b) { return a.m_seconds == b.m_seconds; }
    friend constexpr bool operator!=(CTime a, CTime b) { return a.m_seconds != b.m_seconds; }
    friend constexpr bool operator<(CTime a, CTime b) { return a.m_seconds < b.m_seconds; }
    friend constexpr bool operator<=(CTime a, CTime b) { return a.m_seconds <= b.m_seconds; }
    friend constexpr bool operator>(CTime a, CTime b) { return a.m_seconds > b.m_seconds; }
    friend constexpr bool operator>=(CTime a, CTime b) { return a.m_seconds >= b.m_seconds; }

private:
    int64_t m_seconds = 0;
};
