#pragma once
// Progress of a long operation (a folder load), shown beside the prompt: a
// busy cursor or progress bar in the window, a line on a terminal.

#include <cstdint>
#include <string>

class CProgress
{
public:
    virtual ~CProgress() = default;
    // total is the number of steps, 0 when not known.
    virtual void Begin(const std::string& text, int64_t total)
    {
        (void)text;
        (void)total;
    }
    virtual void Advance(int64_t done) { (void)done; }
    virtual void End() {}
};
