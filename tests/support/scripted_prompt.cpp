#include "tests/support/scripted_prompt.h"

namespace {

template <typename Fields> bool Run(CScriptedPrompt::Script<Fields>& script, Fields& fields)
{
    if (script.empty())
        return false;
    const auto answer = std::move(script.front());
    script.pop_front();
    return answer(fields);
}

} // namespace

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

bool CScriptedPrompt::SelectFolder(CSelectFolderFields& fields)
{
    dialogs.push_back("Select Folder");
    return Run(selectFolder, fields);
}

bool CScriptedPrompt::ChooseDocumentFiles(CDocumentFileFields& fields)
{
    dialogs.push_back(fields.title);
    return Run(documentFiles, fields);
}

bool CScriptedPrompt::ManageFiles(CManageFilesFields& fields)
{
    dialogs.push_back("Manage Files Dialog");
    return Run(manageFiles, fields);
}

bool CScriptedPrompt::ChooseCategory(CCategoryChooserFields& fields)
{
    dialogs.push_back(fields.caption);
    return Run(chooseCategory, fields);
}

bool CScriptedPrompt::UpdateDocumentSet(CUpdateDocumentSetFields& fields)
{
    dialogs.push_back("Update Document Set");
    return Run(updateDocumentSet, fields);
}

bool CScriptedPrompt::NewCategory(CNewCategoryFields& fields)
{
    dialogs.push_back("New Category");
    return Run(newCategory, fields);
}

bool CScriptedPrompt::EditDocumentEntry(CEntryEditFields& fields)
{
    dialogs.push_back("Edit Document");
    return Run(editDocumentEntry, fields);
}

bool CScriptedPrompt::EditPictureEntry(CEntryEditFields& fields)
{
    dialogs.push_back("Edit Picture Entry");
    return Run(editPictureEntry, fields);
}

bool CScriptedPrompt::EditEvent(CEventFields& fields)
{
    dialogs.push_back("Event");
    return Run(editEvent, fields);
}

bool CScriptedPrompt::EditRecipe(CRecipeFields& fields)
{
    dialogs.push_back("Recipe");
    return Run(editRecipe, fields);
}

bool CScriptedPrompt::EditDocumentSet(CDocumentSetFields& fields)
{
    dialogs.push_back("Document Sets");
    return Run(editDocumentSet, fields);
}

bool CScriptedPrompt::ResizePictures(CPicResizeFields& fields)
{
    dialogs.push_back("Resize/Convert Picture(s)");
    return Run(resizePictures, fields);
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
    dialogs.push_back("ChooseFolder");
    return Take(folderAnswers, folder);
}

bool CScriptedPrompt::GetSaveFileName(const std::string& defaultExtension,
                                      const std::string& filter, std::string& path)
{
    dialogs.push_back("GetSaveFileName " + defaultExtension + " " + filter);
    return Take(saveFileAnswers, path);
}

bool CScriptedPrompt::ChoosePrinter(std::string& printerName, std::string& pdfPath)
{
    dialogs.push_back("ChoosePrinter");
    printerName.clear();
    return Take(pdfAnswers, pdfPath) || Take(printerAnswers, printerName);
}
