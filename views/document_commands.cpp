#include "views/document_commands.h"

#include "catalog/prompt.h"
#include "catalog/tallowmere_doc.h"
#include "views/command_env.h"
#include "views/data_list_state.h"

namespace {

std::vector<const CDocumentItem*> Pointers(const std::vector<std::unique_ptr<CDocumentItem>>& items)
{
    std::vector<const CDocumentItem*> pointers;
    for (const auto& item : items)
        pointers.push_back(item.get());
    return pointers;
}

} // namespace

CDocumentCommands::CDocumentCommands(CDataListState& state, CCommandEnv& env)
    : m_state(state), m_env(env), m_loader(env), m_entries(env), m_items(env),
      m_categories(state, env)
{}

void CDocumentCommands::Refuse(const char* text, const char* caption) const
{
    m_env.Prompt().MessageBox(text, caption, CPrompt::Icon::Stop);
}

bool CDocumentCommands::NothingSelected(const std::vector<std::unique_ptr<CDocumentItem>>& items,
                                        const char* caption) const
{
    if (!items.empty())
        return false;
    Refuse("No item has been selected!", caption);
    return true;
}

int CDocumentCommands::Handle(int number)
{
    const bool managed = m_state.GetTab() == TabKind::ManagedDocuments;
    switch (number) {
    case kCmdLoad:
        if (managed)
            Load();
        else
            Refuse("Unable to load documents from this tab!", "Load Document(s)");
        return 1;
    case kCmdAdd:
        if (managed)
            Add();
        else
            AddSelectedFiles();
        return 1;
    case kCmdDelete:
        if (managed)
            Delete();
        else
            Refuse("Unable to delete documents from this tab!", "Delete Document(s)");
        return 1;
    case kCmdEdit:
        if (managed)
            Edit();
        else
            Refuse("Unable to move documents from this tab!", "Edit Document(s)");
        return 1;
    case kCmdMail:
        Mail();
        return 1;
    case kCmdMove:
        if (managed)
            Move();
        else
            Refuse("Unable to load documents from this tab!", "Load Document(s)");
        return 1;
    case kCmdCreateSet:
        CreateSet();
        return 1;
    case kCmdAddToSet:
        AddToSet();
        return 1;
    case kCmdShowFolder:
        m_state.ShowFolderFiles();
        return 1;
    case kCmdSelectAll:
    case kCmdUnselectAll:
        SelectAll(number == kCmdSelectAll);
        return 1;
    case kCmdSearchFilter:
        m_state.SwitchFilter();
        return 1;
    case kCmdApplyFilter:
        m_state.RefreshList(m_state.GetCategoryBoxText());
        return 1;
    case kCmdNewCategory:
        m_categories.NewCategory();
        return 1;
    case kCmdRemoveCategory:
        m_categories.RemoveSelectedCategory();
        return 1;
    default:
        return number >= kCmdFirstFrameMessage ? 1 : 0;
    }
}

void CDocumentCommands::Load()
{
    CEntryList loaded;
    m_loader.LoadDocuments(loaded, false);
    for (const auto& entry : loaded)
        m_state.AddDocumentRow(*entry);
    m_state.Notify(CDataListState::Change::Rows);
    m_state.RebuildCategoryTree();
}

void CDocumentCommands::Add()
{
    CEntryList added;
    if (!m_loader.AddDocuments(added))
        return;
    for (const auto& entry : added)
        m_state.AddDocumentRow(*entry);
    m_state.Notify(CDataListState::Change::Rows);
    m_state.RebuildCategoryTree();
}

void CDocumentCommands::AddSelectedFiles()
{
    std::vector<std::string> paths;
    for (const auto& item : m_state.SelectedDocuments())
        paths.push_back(item->GetPathname());
    m_loader.AddManagedFiles(paths);
    m_state.ShowFolderFiles();
}

void CDocumentCommands::Delete()
{
    const auto selected = m_state.SelectedDocuments();
    if (NothingSelected(selected, "Delete Document(s)"))
        return;
    for (const auto& item : selected) {
        m_entries.RemoveEntry(*item);
        m_state.Notify(CDataListState::Change::PreviewPane);
        const size_t row = m_state.FindDocumentRow(item->GetSequenceNumber());
        if (row != CRowList::npos)
            m_state.Rows(TabKind::ManagedDocuments).RemoveAt(row);
    }
    m_state.Notify(CDataListState::Change::Rows);
}

void CDocumentCommands::Edit()
{
    const auto selected = m_state.SelectedDocuments();
    if (NothingSelected(selected, "Edit Document(s)"))
        return;
    for (const auto& item : selected) {
        m_entries.EditEntry(*item);
        const size_t row = m_state.FindDocumentRow(item->GetSequenceNumber());
        if (row == CRowList::npos)
            continue;
        CListRow& cells = m_state.Rows(TabKind::ManagedDocuments).at(row);
        cells.cells[kDocCaption] = item->GetLabel();
        cells.cells[kDocLocation] = item->GetPathname();
    }
    m_state.Notify(CDataListState::Change::Rows);
}

void CDocumentCommands::Mail()
{
    const auto selected = m_state.SelectedDocuments();
    if (NothingSelected(selected, "Selected Document"))
        return;
    m_entries.MailDocuments(Pointers(selected));
}

void CDocumentCommands::Move()
{
    const auto selected = m_state.SelectedDocuments();
    if (NothingSelected(selected, "Selected Document"))
        return;
    CTallowmereDoc& doc = m_env.Doc();
    CCategoryChooserFields fields;
    fields.roots = {kRootDocuments};
    for (const CCategory* category : doc.GetCategoriesUnder(kRootDocuments))
        fields.categories.push_back(category->GetPath());
    if (!m_env.Prompt().ChooseCategory(fields))
        return;
    for (const auto& item : selected) {
        item->SetCategoryPath(fields.category);
        item->SetDocumentCategoryPath(fields.category);
        m_entries.MoveEntry(*item);
    }
    m_state.RefreshList(std::string());
}

void CDocumentCommands::CreateSet()
{
    const auto selected = m_state.SelectedDocuments();
    if (!selected.empty())
        m_items.CreateDocumentSet(Pointers(selected));
}

void CDocumentCommands::AddToSet()
{
    const auto selected = m_state.SelectedDocuments();
    if (NothingSelected(selected, "Selected Document"))
        return;
    m_items.AddToDocumentSet(Pointers(selected));
}

void CDocumentCommands::SelectAll(bool selected)
{
    m_state.CurrentRows().SelectAll(selected);
    m_state.Notify(CDataListState::Change::Rows);
}
