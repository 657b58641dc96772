#include "views/data_item_commands.h"

#include "catalog/prompt.h"
#include "catalog/tallowmere_doc.h"
#include "views/command_env.h"
#include "views/data_list_state.h"
#include "views/services.h"

CDataItemCommands::CDataItemCommands(CDataListState& state, CCommandEnv& env)
    : m_state(state), m_env(env), m_items(env), m_categories(state, env)
{}

bool CDataItemCommands::NothingSelected(const std::vector<std::unique_ptr<CCatalogItem>>& items,
                                        const char* caption) const
{
    if (!items.empty())
        return false;
    m_env.Prompt().MessageBox("No item has been selected!", caption, CPrompt::Icon::Stop);
    return true;
}

std::vector<CCatalogItem*>
CDataItemCommands::CatalogItems(const std::vector<std::unique_ptr<CCatalogItem>>& selected) const
{
    std::vector<CCatalogItem*> items;
    for (const auto& row : selected) {
        if (CCatalogItem* item = m_items.FindDataItem(row->GetKindTag(), row->GetSequenceNumber()))
            items.push_back(item);
    }
    return items;
}

int CDataItemCommands::Handle(int number)
{
    switch (number) {
    case kCmdAdd:
        Add();
        return 1;
    case kCmdDelete:
        Delete();
        return 1;
    case kCmdEdit:
        Edit();
        return 1;
    case kCmdMail:
        Mail();
        return 1;
    case kCmdSave:
    case kCmdPrint:
        return Output(number);
    case kCmdMove:
        Move();
        return 1;
    case kCmdSelectAll:
    case kCmdUnselectAll:
        m_state.CurrentRows().SelectAll(number == kCmdSelectAll);
        m_state.Notify(CDataListState::Change::Rows);
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
    case kCmdWebPages:
        WebPages();
        return 1;
    default:
        return number >= kCmdFirstFrameMessage ? 1 : 0;
    }
}

void CDataItemCommands::SetCurrent(const CCatalogItem& item, int32_t sequence)
{
    CCurrentItems& current = m_env.Doc().GetCurrentItems();
    if (item.GetKindTag() == kKindEvent)
        current.eventSequence = sequence;
    else if (item.GetKindTag() == kKindRecipe)
        current.recipeSequence = sequence;
    else
        current.documentSetSequence = sequence;
}

void CDataItemCommands::Add()
{
    std::unique_ptr<CCatalogItem> item;
    switch (m_state.GetTab()) {
    case TabKind::DocumentSets:
        item = std::make_unique<CDocumentSet>();
        break;
    case TabKind::Events:
        item = std::make_unique<CEventItem>();
        break;
    default:
        item = std::make_unique<CRecipeItem>();
        break;
    }
    if (m_state.IsPreviewOn()) {
        // The pane edits the new item; its OK files it (CommitPendingItem).
        SetCurrent(*item, 0);
        m_env.Doc().GetCurrentItems().pending = std::move(item);
        m_state.Notify(CDataListState::Change::PreviewPane);
        return;
    }
    if (!item->Edit(m_env.Doc().GetContext()))
        return;
    CCatalogItem& added = *item;
    m_items.AddDataItem(std::move(item));
    m_state.AddDataItemRow(added);
    m_state.Notify(CDataListState::Change::Rows);
}

bool CDataItemCommands::CommitPendingItem()
{
    CCurrentItems& current = m_env.Doc().GetCurrentItems();
    if (!current.pending)
        return false;
    CCatalogItem& added = *current.pending;
    if (!m_items.AddDataItem(std::move(current.pending)))
        return false;
    SetCurrent(added, added.GetSequenceNumber());
    m_state.AddDataItemRow(added);
    m_state.Notify(CDataListState::Change::Rows);
    return true;
}

void CDataItemCommands::Delete()
{
    const auto selected = m_state.SelectedDataItems();
    if (NothingSelected(selected, "Selected Document"))
        return;
    for (const auto& item : selected) {
        m_items.DeleteDataItem(item->GetKindTag(), item->GetSequenceNumber());
        m_state.Notify(CDataListState::Change::PreviewPane);
        const size_t row = m_state.FindDataItemRow(m_state.GetTab(), item->GetSequenceNumber());
        if (row != CRowList::npos)
            m_state.CurrentRows().RemoveAt(row);
    }
    m_state.Notify(CDataListState::Change::Rows);
}

void CDataItemCommands::Edit()
{
    const auto selected = m_state.SelectedDataItems();
    if (NothingSelected(selected, "Selected Document"))
        return;
    for (const auto& row : selected) {
        if (!m_items.EditDataItem(row->GetKindTag(), row->GetSequenceNumber()))
            continue;
        // The row shows the item as edited (name, category, keyword).
        CCatalogItem* item = m_items.FindDataItem(row->GetKindTag(), row->GetSequenceNumber());
        CCatalogItem summary(item->GetKindTag());
        summary.CopyBaseFrom(*item);
        m_state.UpdateDataItemRow(summary);
    }
    m_state.Notify(CDataListState::Change::Rows);
}

void CDataItemCommands::Mail()
{
    const auto selected = m_state.SelectedDataItems();
    if (NothingSelected(selected, "Selected Document"))
        return;
    for (CCatalogItem* item : CatalogItems(selected)) {
        CMailService* mail = m_env.Mail();
        if (!mail || !mail->IsAvailable()) {
            m_env.Prompt().MessageBox(
                "Error! The mail system is not available - could not find xdg-email", "Send Mail",
                CPrompt::Icon::Stop);
            continue;
        }
        item->Mail(m_env.Doc().GetContext());
    }
}

int CDataItemCommands::Output(int number)
{
    CDataItemOutput* output = m_env.Output();
    if (!output)
        return 0;
    const auto selected = m_state.SelectedDataItems();
    if (NothingSelected(selected, "Selected Document"))
        return 1;
    if (number == kCmdSave)
        output->SaveDataItemsToFile(CatalogItems(selected));
    else
        output->PrintDataItems(CatalogItems(selected));
    return 1;
}

void CDataItemCommands::Move()
{
    const auto selected = m_state.SelectedDataItems();
    if (NothingSelected(selected, "Selected Data Item"))
        return;
    CCategoryChooserFields fields;
    fields.roots = m_state.TreeRoots();
    for (const CCategory* category : m_env.Doc().GetCategoriesUnder(fields.roots.front()))
        fields.categories.push_back(category->GetPath());
    if (!m_env.Prompt().ChooseCategory(fields))
        return;
    for (CCatalogItem* item : CatalogItems(selected)) {
        item->SetCategoryPath(fields.category);
        m_env.MarkChanged();
    }
    m_state.RefreshList(std::string());
}

void CDataItemCommands::WebPages()
{
    for (CCatalogItem* item : CatalogItems(m_state.SelectedDataItems()))
        item->WriteWebPages(m_env.Doc().GetContext());
}
