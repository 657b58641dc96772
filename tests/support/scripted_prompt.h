#pragma once
// A prompt for tests: records every message shown and answers from a queue
// (the safe answer, No or Cancel, when the queue is empty).

#include "catalog/prompt.h"

#include <deque>
#include <string>
#include <vector>

class CScriptedPrompt : public CPrompt
{
public:
    struct Shown
    {
        std::string text;
        std::string caption;
        Icon icon;
        Buttons buttons;
    };

    Answer MessageBox(const std::string& text, const std::string& caption, Icon icon,
                      Buttons buttons) override;
    void ShowReadMe(const std::string& text) override { readMeShown.push_back(text); }
    bool OpenWithShell(const std::string& path) override;
    bool ChooseFolder(std::string& folder) override;
    bool GetSaveFileName(const std::string& defaultExtension, const std::string& filter,
                         std::string& path) override;
    bool ChoosePrinter(std::string& printerName, std::string& pdfPath) override;

    void QueueAnswer(Answer answer) { answers.push_back(answer); }
    // The one message shown, or an empty record when there was not exactly one.
    Shown Only() const;

    std::vector<Shown> shown;
    std::vector<std::string> readMeShown;
    std::deque<Answer> answers;
    std::vector<std::string> opened;          // paths handed to the desktop
    std::deque<std::string> folderAnswers;     // ChooseFolder; none left: cancelled
    std::deque<std::string> saveFileAnswers;   // GetSaveFileName; none left: cancelled
    std::deque<std::string> pdfAnswers;        // ChoosePrinter prints to these PDF files
    std::vector<std::string> dialogsShown;     // the dialogs' names, in order
};
