#pragma once
// A progress line on a terminal ("Loading documents: 1200 of 10000"),
// rewritten in place on stderr; nothing when stderr is not a terminal.

#include "catalog/progress.h"

class CTerminalProgress : public CProgress
{
public:
    CTerminalProgress();
    void Begin(const std::string& text, int64_t total) override;
    void Advance(int64_t done) override;
    void End() override;

private:
    bool m_terminal;
    bool m_shown = false;
    std::string m_text;
    int64_t m_total = 0;
    int64_t m_lastShownMs = 0;
};
