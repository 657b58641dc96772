#pragma once
// What the list view shows, without a window: the current tab, the rows of
// each list, the filter panel, the folder of the "Documents" tab, the
// selected category and the preview switch. The widgets draw this state,
// forward clicks to it and redraw when it reports a change.

#include "views/list_fill.h"

#include <functional>
#include <memory>
#include <vector>

class CTallowmereDoc;

class CDataListState
{
public:
    enum class Change
    {
        Rows,
        CategoryTree,
        PreviewPane,
        Tab
    };

    explicit CDataListState(CTallowmereDoc& doc);

    CTallowmereDoc& Doc() const { return m_doc; }
    void SetObserver(std::function<void(Change)> observer) { m_observer = std::move(observer); }

    TabKind GetTab() const { return m_tab; }
    // Shows a tab: the folder's files in tab 0, else the tab's category tree
    // with its root selected.
    void SetTab(TabKind tab);
    // The list a tab shows (tabs 0 and 1 share the documents list).
    CRowList& Rows(TabKind tab);
    const CRowList& Rows(TabKind tab) const;
    CRowList& CurrentRows() { return Rows(m_tab); }

    CFilterControls& Filter() { return m_filter; }
    // "Search Filter": switches the filter and refreshes.
    void SwitchFilter();
    // "Include SubCategories": switches and refreshes the current category.
    void SwitchSubCategories();

    // The text of the current category box: a category path, or the folder
    // in the "Documents" tab.
    const std::string& GetCategoryBoxText() const { return m_categoryBox; }
    // A category chosen in the tree (or the combo box): shown and refreshed.
    void SelectCategory(const std::string& path);
    // The category tree's selected category, which the category commands act on.
    const std::string& GetSelectedCategory() const { return m_selectedCategory; }
    // The roots of the current tab's category tree ("" in tab 0).
    std::vector<std::string> TreeRoots() const;
    // Rebuilds the tree for the tab's root and selects the root.
    void RebuildCategoryTree();

    // The folder the folder tree selected, and its files in the "Documents" tab.
    void SetCurrentFolder(const std::string& folder) { m_folder = folder; }
    const std::string& GetCurrentFolder() const { return m_folder; }
    void ShowFolderFiles();
    const std::vector<std::shared_ptr<CDocumentItem>>& FolderItems() const { return m_folderItems; }

    bool IsPreviewOn() const;
    void SetPreviewOn(bool on);

    // Rebuilds the current tab's rows for a category ("" for the catalog's
    // current category) through the search filter.
    void RefreshList(const std::string& categoryPath);

    // Temporary items rebuilt from the texts of the selected rows, in row order.
    std::vector<std::unique_ptr<CDocumentItem>> SelectedDocuments() const;
    std::vector<std::unique_ptr<CCatalogItem>> SelectedDataItems() const;

    void AddDocumentRow(const CDocumentItem& item);
    // Adds a row to the list of the item's kind; other kinds add nothing.
    void AddDataItemRow(const CCatalogItem& item);
    // Rewrites the row of the item with the item's sequence number.
    void UpdateDataItemRow(const CCatalogItem& item);
    // Row indexes by sequence number, or CRowList::npos.
    size_t FindDocumentRow(int32_t sequence) const;
    size_t FindDataItemRow(TabKind tab, int32_t sequence) const;

    void Notify(Change change) const;

private:
    CRowList& ListOfKind(const std::string& kindTag);

    CTallowmereDoc& m_doc;
    std::function<void(Change)> m_observer;
    TabKind m_tab = TabKind::Documents;
    CRowList m_documents;
    CRowList m_documentSets;
    CRowList m_events;
    CRowList m_recipes;
    CFilterControls m_filter;
    std::string m_categoryBox;
    std::string m_selectedCategory;
    std::string m_folder;
    std::vector<std::shared_ptr<CDocumentItem>> m_folderItems;
};
