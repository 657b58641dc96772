#include "views/data_list_state.h"

#include "catalog/tallowmere_doc.h"
#include "views/folder_listing.h"

CDataListState::CDataListState(CTallowmereDoc& doc) : m_doc(doc) {}

void CDataListState::Notify(Change change) const
{
    if (m_observer)
        m_observer(change);
}

CRowList& CDataListState::Rows(TabKind tab)
{
    return const_cast<CRowList&>(static_cast<const CDataListState*>(this)->Rows(tab));
}

const CRowList& CDataListState::Rows(TabKind tab) const
{
    switch (tab) {
    case TabKind::DocumentSets:
        return m_documentSets;
    case TabKind::Events:
        return m_events;
    case TabKind::Recipes:
        return m_recipes;
    default:
        return m_documents;
    }
}

CRowList& CDataListState::ListOfKind(const std::string& kindTag)
{
    if (kindTag == kKindDocumentSets)
        return m_documentSets;
    if (kindTag == kKindEvent)
        return m_events;
    return m_recipes;
}

void CDataListState::SetTab(TabKind tab)
{
    m_tab = tab;
    if (tab == TabKind::Documents)
        ShowFolderFiles();
    else if (tab != TabKind::PersonalInformation)
        RebuildCategoryTree();
    Notify(Change::Tab);
}

void CDataListState::SwitchFilter()
{
    m_filter.filterOn = !m_filter.filterOn;
    RefreshList(m_categoryBox);
}

void CDataListState::SwitchSubCategories()
{
    m_filter.includeSubCategories = !m_filter.includeSubCategories;
    RefreshList(std::string());
}

void CDataListState::SelectCategory(const std::string& path)
{
    m_selectedCategory = path;
    m_categoryBox = path;
    RefreshList(path);
}

std::vector<std::string> CDataListState::TreeRoots() const
{
    switch (m_tab) {
    case TabKind::ManagedDocuments:
        return {kRootDocuments};
    case TabKind::DocumentSets:
        return {kRootDocumentSets, kRootPhotoAlbums};
    case TabKind::Events:
        return {kRootEvents};
    case TabKind::Recipes:
        return {kRootRecipes};
    default:
        return {};
    }
}

void CDataListState::RebuildCategoryTree()
{
    const std::vector<std::string> roots = TreeRoots();
    if (roots.empty())
        return;
    Notify(Change::CategoryTree);
    SelectCategory(roots.front());
}

void CDataListState::ShowFolderFiles()
{
    if (m_folder.empty())
        return;
    m_folderItems = ListFolderFiles(m_folder);
    FillFolderRows(m_folderItems, m_documents);
    m_categoryBox = m_folder;
    Notify(Change::Rows);
}

bool CDataListState::IsPreviewOn() const
{
    return m_doc.GetSettings().previewWindow != 0;
}

void CDataListState::SetPreviewOn(bool on)
{
    m_doc.GetSettings().previewWindow = on ? 1 : 0;
    Notify(Change::PreviewPane);
}

void CDataListState::RefreshList(const std::string& categoryPath)
{
    // The "Documents" tab lists its folder's files, never catalog entries.
    if (m_tab == TabKind::Documents) {
        ShowFolderFiles();
        return;
    }
    if (m_tab == TabKind::PersonalInformation)
        return;
    const std::string path = categoryPath.empty() ? m_doc.GetCurrentCategoryPath() : categoryPath;
    m_doc.SetCurrentCategoryPath(path);
    CSearchFilter filter = MakeFilter(m_filter, path);
    if (m_tab == TabKind::ManagedDocuments) {
        filter.includeSubCategories = m_filter.includeSubCategories;
        FillDocumentRows(m_doc, filter, m_documents);
    } else {
        FillDataItemRows(m_doc, KindTagOfTab(m_tab), filter, Rows(m_tab));
    }
    Notify(Change::Rows);
}

std::vector<std::unique_ptr<CDocumentItem>> CDataListState::SelectedDocuments() const
{
    std::vector<std::unique_ptr<CDocumentItem>> items;
    for (const CListRow& row : m_documents) {
        if (!row.selected)
            continue;
        auto item = std::make_unique<CDocumentItem>();
        item->SetSequenceNumber(ParseSequence(row.cells[kDocNumber]));
        item->SetLabel(row.cells[kDocCaption]);
        item->SetCategoryPath(row.cells[kDocCategory]);
        item->SetDocumentCategoryPath(row.cells[kDocCategory]);
        item->SetPathname(row.cells[kDocLocation]);
        items.push_back(std::move(item));
    }
    return items;
}

std::vector<std::unique_ptr<CCatalogItem>> CDataListState::SelectedDataItems() const
{
    std::vector<std::unique_ptr<CCatalogItem>> items;
    const CRowList& rows = Rows(m_tab);
    for (const CListRow& row : rows) {
        if (!row.selected)
            continue;
        auto item = std::make_unique<CCatalogItem>(row.cells[kItemType]);
        item->SetSequenceNumber(ParseSequence(row.cells[kItemSequence]));
        items.push_back(std::move(item));
    }
    return items;
}

void CDataListState::AddDocumentRow(const CDocumentItem& item)
{
    m_documents.Insert(DocumentRow(item));
}

void CDataListState::AddDataItemRow(const CCatalogItem& item)
{
    const std::string& kind = item.GetKindTag();
    if (kind != kKindRecipe && kind != kKindEvent && kind != kKindDocumentSets)
        return;
    ListOfKind(kind).Insert(DataItemRow(item));
}

void CDataListState::UpdateDataItemRow(const CCatalogItem& item)
{
    CRowList& rows = ListOfKind(item.GetKindTag());
    const size_t index = rows.Find(kItemSequence, FormatSequence(item.GetSequenceNumber()));
    if (index == CRowList::npos)
        return;
    const bool selected = rows.at(index).selected;
    rows.RemoveAt(index);
    CListRow row = DataItemRow(item);
    row.selected = selected;
    rows.Insert(std::move(row));
}

size_t CDataListState::FindDocumentRow(int32_t sequence) const
{
    return m_documents.Find(kDocNumber, FormatSequence(sequence));
}

size_t CDataListState::FindDataItemRow(TabKind tab, int32_t sequence) const
{
    return Rows(tab).Find(kItemSequence, FormatSequence(sequence));
}
