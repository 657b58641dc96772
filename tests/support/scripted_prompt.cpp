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
