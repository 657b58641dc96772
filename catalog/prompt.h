#pragma once
// The one interface through which program logic talks to the user: message
// boxes now, one call per dialog as the dialogs arrive. The GUI shows real
// windows, the command line prints, tests script the answers.

#include <string>

class CPrompt
{
public:
    enum class Icon { None, Information, Question, Exclamation, Stop };
    enum class Buttons { Ok, OkCancel, YesNo, YesNoCancel };
    enum class Answer { Ok, Cancel, Yes, No };

    virtual ~CPrompt() = default;

    // Shows text with a caption and waits for a button.
    virtual Answer MessageBox(const std::string& text, const std::string& caption, Icon icon,
                              Buttons buttons = Buttons::Ok) = 0;

    // The program's read-me text, shown when a new catalog is created.
    virtual void ShowReadMe(const std::string& text) { (void)text; }
};
