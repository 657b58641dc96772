#pragma once
// What the command layer works with besides the catalog: the prompt, the
// clock, the progress display, the mail and output services, and whether a
// command changed the catalog (so the command line knows to save it).

#include <functional>

#include "catalog/ctime.h"

class CDataItemOutput;
class CMailService;
class CProgress;
class CPrompt;
class CTallowmereDoc;

class CCommandEnv
{
public:
    explicit CCommandEnv(CTallowmereDoc& doc);

    CTallowmereDoc& Doc() const { return m_doc; }
    CPrompt& Prompt() const;

    CTime Now() const { return m_clock ? m_clock() : CTime::GetCurrentTime(); }
    void SetClock(std::function<CTime()> clock) { m_clock = std::move(clock); }

    CProgress& Progress() const;
    void SetProgress(CProgress* progress) { m_progress = progress; }

    // nullptr: no mail program can be reached.
    CMailService* Mail() const { return m_mail; }
    void SetMail(CMailService* mail) { m_mail = mail; }

    // nullptr: saving and printing data items are not available.
    CDataItemOutput* Output() const { return m_output; }
    void SetOutput(CDataItemOutput* output) { m_output = output; }

    void MarkChanged() { m_changed = true; }
    bool Changed() const { return m_changed; }

private:
    CTallowmereDoc& m_doc;
    std::function<CTime()> m_clock;
    CProgress* m_progress = nullptr;
    CMailService* m_mail = nullptr;
    CDataItemOutput* m_output = nullptr;
    bool m_changed = false;
};
