#pragma once
// The one interface through which program logic talks to the user: message
// boxes, and one call per dialog that hands back the dialog's fields. The GUI
// shows real windows, the command line prints, tests script the answers.
// Every dialog call returns true for OK; the default is Cancel.

#include "catalog/dialog_fields.h"

#include <string>

class CPrompt
{
public:
    enum class Icon
    {
        None,
        Information,
        Question,
        Exclamation,
        Stop
    };
    enum class Buttons
    {
        Ok,
        OkCancel,
        YesNo,
        YesNoCancel
    };
    enum class Answer
    {
        Ok,
        Cancel,
        Yes,
        No
    };

    virtual ~CPrompt() = default;

    // Shows text with a caption and waits for a button.
    virtual Answer MessageBox(const std::string& text, const std::string& caption, Icon icon,
                              Buttons buttons = Buttons::Ok) = 0;

    // The program's read-me text, shown when a new catalog is created.
    virtual void ShowReadMe(const std::string& text) { (void)text; }

    // Opens a file or page with the desktop's program for it; false when that
    // cannot be started.
    virtual bool OpenWithShell(const std::string& path);

    // The compact folder chooser (a folder tree only).
    virtual bool ChooseFolder(std::string& folder) { return Cancel(folder); }

    // A save-as file dialog with a default extension and a filter such as
    // "Files(*.txt;)|*.txt;|".
    virtual bool GetSaveFileName(const std::string& defaultExtension, const std::string& filter,
                                 std::string& path)
    {
        (void)defaultExtension;
        (void)filter;
        return Cancel(path);
    }

    // The print dialog: a CUPS queue (printerName) or a PDF file (pdfPath, and
    // printerName empty). Cancelled also when there is no printer.
    virtual bool ChoosePrinter(std::string& printerName, std::string& pdfPath)
    {
        (void)printerName;
        return Cancel(pdfPath);
    }

    virtual bool SelectFolder(CSelectFolderFields& fields) { return Cancel(fields); }
    virtual bool ChooseDocumentFiles(CDocumentFileFields& fields) { return Cancel(fields); }
    virtual bool ManageFiles(CManageFilesFields& fields) { return Cancel(fields); }
    virtual bool ChooseCategory(CCategoryChooserFields& fields) { return Cancel(fields); }
    virtual bool UpdateDocumentSet(CUpdateDocumentSetFields& fields) { return Cancel(fields); }
    virtual bool NewCategory(CNewCategoryFields& fields) { return Cancel(fields); }
    virtual bool EditDocumentEntry(CEntryEditFields& fields) { return Cancel(fields); }
    virtual bool EditPictureEntry(CEntryEditFields& fields) { return Cancel(fields); }
    virtual bool EditEvent(CEventFields& fields) { return Cancel(fields); }
    virtual bool EditRecipe(CRecipeFields& fields) { return Cancel(fields); }
    virtual bool EditDocumentSet(CDocumentSetFields& fields) { return Cancel(fields); }
    virtual bool ResizePictures(CPicResizeFields& fields) { return Cancel(fields); }

private:
    template <typename T> static bool Cancel(T&) { return false; }
};
