#pragma once
// A prompt for tests: records every message and dialog shown and answers from
// queues (the safe answer, No or Cancel, when a queue is empty). A dialog is
// scripted as a function that fills the fields and returns true for OK.

#include "catalog/prompt.h"

#include <deque>
#include <functional>
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

    template <typename Fields> using Script = std::deque<std::function<bool(Fields&)>>;

    Answer MessageBox(const std::string& text, const std::string& caption, Icon icon,
                      Buttons buttons) override;
    void ShowReadMe(const std::string& text) override { readMeShown.push_back(text); }
    bool OpenWithShell(const std::string& path) override;
    bool ChooseFolder(std::string& folder) override;
    bool GetSaveFileName(const std::string& defaultExtension, const std::string& filter,
                         std::string& path) override;
    bool ChoosePrinter(std::string& printerName, std::string& pdfPath) override;

    bool SelectFolder(CSelectFolderFields& fields) override;
    bool ChooseDocumentFiles(CDocumentFileFields& fields) override;
    bool ManageFiles(CManageFilesFields& fields) override;
    bool ChooseCategory(CCategoryChooserFields& fields) override;
    bool UpdateDocumentSet(CUpdateDocumentSetFields& fields) override;
    bool NewCategory(CNewCategoryFields& fields) override;
    bool EditDocumentEntry(CEntryEditFields& fields) override;
    bool EditPictureEntry(CEntryEditFields& fields) override;
    bool EditEvent(CEventFields& fields) override;
    bool EditRecipe(CRecipeFields& fields) override;
    bool EditDocumentSet(CDocumentSetFields& fields) override;
    bool ResizePictures(CPicResizeFields& fields) override;

    void QueueAnswer(Answer answer) { answers.push_back(answer); }
    // The one message shown, or an empty record when there was not exactly one.
    Shown Only() const;

    std::vector<Shown> shown;
    std::vector<std::string> readMeShown;
    std::deque<Answer> answers;
    std::vector<std::string> opened;         // paths handed to the desktop
    std::deque<std::string> folderAnswers;   // ChooseFolder; none left: cancelled
    std::deque<std::string> saveFileAnswers; // GetSaveFileName; none left: cancelled
    std::deque<std::string> pdfAnswers;      // ChoosePrinter prints to these PDF files,
    std::deque<std::string> printerAnswers;  // then to these print queues
    std::vector<std::string> dialogs;        // names of the dialogs run, in order

    Script<CSelectFolderFields> selectFolder;
    Script<CDocumentFileFields> documentFiles;
    Script<CManageFilesFields> manageFiles;
    Script<CCategoryChooserFields> chooseCategory;
    Script<CUpdateDocumentSetFields> updateDocumentSet;
    Script<CNewCategoryFields> newCategory;
    Script<CEntryEditFields> editDocumentEntry;
    Script<CEntryEditFields> editPictureEntry;
    Script<CEventFields> editEvent;
    Script<CRecipeFields> editRecipe;
    Script<CDocumentSetFields> editDocumentSet;
    Script<CPicResizeFields> resizePictures;
};
