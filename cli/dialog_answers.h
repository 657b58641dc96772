#pragma once
// The command line's answers to the dialogs a command runs: each command
// fills in what its options say before it calls the command layer.

#include "cli/console_prompt.h"

#include <optional>

class CDialogAnswers : public CConsolePrompt
{
public:
    using CConsolePrompt::CConsolePrompt;

    bool SelectFolder(CSelectFolderFields& fields) override;
    bool ChooseDocumentFiles(CDocumentFileFields& fields) override;
    bool ChooseCategory(CCategoryChooserFields& fields) override;
    bool UpdateDocumentSet(CUpdateDocumentSetFields& fields) override;
    bool EditDocumentSet(CDocumentSetFields& fields) override;
    bool NewCategory(CNewCategoryFields& fields) override;

    // The load options; unset fields keep the dialog's start values.
    struct Load
    {
        std::string folder;
        std::optional<std::string> newCategory;
        std::optional<std::string> keyword1;
        std::optional<std::string> keyword2;
        std::optional<bool> unique;
        std::optional<bool> archive;
        bool subCategories = true;
    };
    std::optional<Load> load;

    struct Add
    {
        std::vector<std::string> files;
        std::string caption;
        bool archive = false;
    };
    std::optional<Add> add;

    std::optional<std::string> category; // the destination category
    int32_t setSequence = 0;             // the set to add to
    std::optional<std::string> setLabel; // a new set's label
    std::optional<std::string> newCategoryName;
};
