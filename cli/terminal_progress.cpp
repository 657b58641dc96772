#include "cli/terminal_progress.h"

#include <chrono>
#include <cstdio>
#include <unistd.h>

namespace {

int64_t NowMs()
{
    using namespace std::chrono;
    return duration_cast<milliseconds>(steady_clock::now().time_since_epoch()).count();
}

} // namespace

CTerminalProgress::CTerminalProgress() : m_terminal(::isatty(STDERR_FILENO) == 1) {}

void CTerminalProgress::Begin(const std::string& text, int64_t total)
{
    m_text = text;
    m_total = total;
    m_lastShownMs = NowMs();
}

void CTerminalProgress::Advance(int64_t done)
{
    // Only long loads get a line, refreshed a few times a second.
    const int64_t now = NowMs();
    if (!m_terminal || now - m_lastShownMs < 250)
        return;
    m_lastShownMs = now;
    m_shown = true;
    std::fprintf(stderr, "\r%s: %lld of %lld", m_text.c_str(), static_cast<long long>(done),
                 static_cast<long long>(m_total));
    std::fflush(stderr);
}

void CTerminalProgress::End()
{
    if (m_shown)
        std::fputs("\r\033[K", stderr);
    m_shown = false;
}
