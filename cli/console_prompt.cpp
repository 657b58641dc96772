#include "cli/console_prompt.h"

#include <cstdio>
#include <string>

CPrompt::Answer CConsolePrompt::MessageBox(const std::string& text, const std::string& caption,
                                           Icon icon, Buttons buttons)
{
    // Message texts may break lines with CR alone.
    std::string shown = text;
    for (char& c : shown) {
        if (c == '\r')
            c = '\n';
    }
    const bool error = icon == Icon::Stop || icon == Icon::Exclamation;
    if (error)
        ++m_errors;
    std::FILE* out = (error || buttons != Buttons::Ok) ? stderr : stdout;
    if (error)
        std::fprintf(out, "%s: %s\n", caption.c_str(), shown.c_str());
    else
        std::fprintf(out, "%s\n", shown.c_str());
    std::fflush(out);
    switch (buttons) {
    case Buttons::Ok:
        return Answer::Ok;
    case Buttons::OkCancel:
        return m_questionAnswer == Answer::Yes ? Answer::Ok : Answer::Cancel;
    case Buttons::YesNo:
    case Buttons::YesNoCancel:
        return m_questionAnswer;
    }
    return Answer::Cancel;
}

bool CConsolePrompt::OpenWithShell(const std::string& path)
{
    // A command line does not start desktop programs; it says where the file is.
    std::printf("%s\n", path.c_str());
    return true;
}
