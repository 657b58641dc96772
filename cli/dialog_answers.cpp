#include "cli/dialog_answers.h"

bool CDialogAnswers::SelectFolder(CSelectFolderFields& fields)
{
    if (!load)
        return false;
    fields.selectedFolder = load->folder;
    if (load->newCategory) {
        fields.newCategory = *load->newCategory;
        fields.category = fields.baseCategory.empty() || fields.newCategory.empty()
                              ? fields.baseCategory
                              : fields.baseCategory + "\\" + fields.newCategory;
    }
    if (load->keyword1)
        fields.keyword1 = *load->keyword1;
    if (load->keyword2)
        fields.keyword2 = *load->keyword2;
    if (load->unique)
        fields.uniqueEntries = *load->unique;
    if (load->archive)
        fields.archiveMode = *load->archive;
    fields.createSubCategories = load->subCategories;
    return true;
}

bool CDialogAnswers::ChooseDocumentFiles(CDocumentFileFields& fields)
{
    if (!add)
        return false;
    fields.files = add->files;
    fields.caption = add->caption;
    fields.archive = add->archive;
    return true;
}

bool CDialogAnswers::ChooseCategory(CCategoryChooserFields& fields)
{
    if (!category)
        return false;
    fields.category = *category;
    return true;
}

bool CDialogAnswers::UpdateDocumentSet(CUpdateDocumentSetFields& fields)
{
    fields.chosenSequence = setSequence;
    return setSequence != 0;
}

bool CDialogAnswers::EditDocumentSet(CDocumentSetFields& fields)
{
    if (!setLabel)
        return false;
    fields.label = *setLabel;
    return true;
}

bool CDialogAnswers::NewCategory(CNewCategoryFields& fields)
{
    if (!newCategoryName)
        return false;
    fields.name = *newCategoryName;
    return true;
}
