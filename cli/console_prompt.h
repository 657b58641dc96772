#pragma once
// The prompt of the command line: messages are printed (results on stdout,
// warnings and errors on stderr); questions take the answer given up front.

#include "catalog/prompt.h"

#include <cstdio>
#include <optional>

class CConsolePrompt : public CPrompt
{
public:
    explicit CConsolePrompt(Answer questionAnswer = Answer::No) : m_questionAnswer(questionAnswer)
    {}

    Answer MessageBox(const std::string& text, const std::string& caption, Icon icon,
                      Buttons buttons) override;

    // How many errors (stop or exclamation messages) were shown.
    int ErrorCount() const { return m_errors; }

    // Dialogs answer from the command line's options; unset means cancelled.
    bool ChooseFolder(std::string& folder) override { return Given(m_folder, folder); }
    bool GetSaveFileName(const std::string&, const std::string&, std::string& path) override
    {
        return Given(m_saveFile, path);
    }
    bool ChoosePrinter(std::string& printerName, std::string& pdfPath) override
    {
        printerName = m_printer;
        return Given(m_pdfFile, pdfPath) || !m_printer.empty();
    }
    bool OpenWithShell(const std::string& path) override;
    bool ResizePictures(CPicResizeFields& fields) override
    {
        if (!m_resize)
            return false;
        fields = *m_resize;
        return true;
    }

    void SetFolder(const std::string& folder) { m_folder = folder; }
    void SetSaveFile(const std::string& path) { m_saveFile = path; }
    void SetPdfFile(const std::string& path) { m_pdfFile = path; }
    void SetPrinter(const std::string& name) { m_printer = name; }
    // Resize choices for mailed pictures: the convert question is then answered Yes.
    void SetResize(const CPicResizeFields& fields)
    {
        m_resize = fields;
        m_questionAnswer = CPrompt::Answer::Yes;
    }

private:
    static bool Given(const std::string& given, std::string& out)
    {
        if (given.empty())
            return false;
        out = given;
        return true;
    }

    CPrompt::Answer m_questionAnswer;
    int m_errors = 0;
    std::string m_folder;
    std::string m_saveFile;
    std::string m_pdfFile;
    std::string m_printer;
    std::optional<CPicResizeFields> m_resize;
};
