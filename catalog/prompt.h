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

    // Opens a file or page with the desktop's program for it; false when that
    // cannot be started.
    virtual bool OpenWithShell(const std::string& path);

    // The compact folder chooser (a folder tree only). False when cancelled.
    virtual bool ChooseFolder(std::string& folder) { (void)folder; return false; }

    // A save-as file dialog: default extension and a filter such as
    // "Files(*.txt;)|*.txt;|". False when cancelled.
    virtual bool GetSaveFileName(const std::string& defaultExtension, const std::string& filter,
                                 std::string& path)
    {
        (void)defaultExtension;
        (void)filter;
        (void)path;
        return false;
    }

    // The print dialog: a CUPS queue (printerName) or a PDF file (pdfPath, and
    // printerName empty). False when cancelled or when there is no printer.
    virtual bool ChoosePrinter(std::string& printerName, std::string& pdfPath)
    {
        (void)printerName;
        (void)pdfPath;
        return false;
    }
};
