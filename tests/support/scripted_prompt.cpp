#include "tests/support/scripted_prompt.h"

CPrompt::Answer CScriptedPrompt::MessageBox(const std::string& text, const std::string& caption,
                                            Icon icon, Buttons buttons)
{
    shown.push_back({text, caption, icon, buttons});
    if (!answers.empty()) {
        const Answer answer = answers.front();
        answers.pop_front();
        return answer;
    }
    switch (buttons) {
    case Buttons::Ok:
        return Answer::Ok;
    case Buttons::OkCancel:
        return Answer::Cancel;
    case Buttons::YesNo:
    case Buttons::YesNoCancel:
        return Answer::No;
    }
    return Answer::Cancel;
}

CScriptedPrompt::Shown CScriptedPrompt::Only() const
{
    if (shown.size() != 1)
        return {std::string(), std::string(), Icon::None, Buttons::Ok};
    return shown.front();
}

namespace {
bool Take(std::deque<std::string>& queue, std::string& out)
{
    if (queue.empty())
        return false;
    out = queue.front();
    queue.pop_front();
    return true;
}
} // namespace

bool CScriptedPrompt::OpenWithShell(const std::string& path)
{
    opened.push_back(path);
    return true;
}

bool CScriptedPrompt::ChooseFolder(std::string& folder)
{
    dialogsShown.push_back("ChooseFolder");
    return Take(folderAnswers, folder);
}

bool CScriptedPrompt::GetSaveFileName(const std::string& defaultExtension,
                                      const std::string& filter, std::string& path)
{
    dialogsShown.push_back("GetSaveFileName " + defaultExtension + " " + filter);
    return Take(saveFileAnswers, path);
}

bool CScriptedPrompt::ChoosePrinter(std::string& printerName, std::string& pdfPath)
{
    dialogsShown.push_back("ChoosePrinter");
    printerName.clear();
    return Take(pdfAnswers, pdfPath);
}
