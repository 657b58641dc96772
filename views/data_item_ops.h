#pragma once
// Filing, finding, editing and deleting data items (document sets, events,
// recipes), and grouping documents into document sets.

#include "catalog/catalog_items.h"

#include <memory>
#include <vector>

class CCommandEnv;

inline constexpr const char* kDocumentSetsCategory = "DOCUMENTS\\DOCUMENT SETS";

class CDataItemOps
{
public:
    explicit CDataItemOps(CCommandEnv& env);

    // Register the item and append it to its list.
    void AddDocumentSet(std::unique_ptr<CDocumentSet> item);
    void AddEvent(std::unique_ptr<CEventItem> item);
    void AddRecipe(std::unique_ptr<CRecipeItem> item);
    // Files a new item of any of the three kinds; false for another kind.
    bool AddDataItem(std::unique_ptr<CCatalogItem> item);

    // The catalog's item with the kind tag and sequence number, or nullptr.
    CCatalogItem* FindDataItem(const std::string& kindTag, int32_t sequence) const;
    // Runs the item's dialog; true when confirmed.
    bool EditDataItem(const std::string& kindTag, int32_t sequence);
    bool DeleteDataItem(const std::string& kindTag, int32_t sequence);

    // A new set of new entries for the items' files (filed under
    // "DOCUMENTS\DOCUMENT SETS"), kept when its dialog is confirmed.
    bool CreateDocumentSet(const std::vector<const CDocumentItem*>& items);
    // New entries for the items' files, appended to the set chosen in
    // "Update Document Set"; nothing when no set is chosen.
    bool AddToDocumentSet(const std::vector<const CDocumentItem*>& items);

private:
    // A catalog entry for the file at path, shared with the caller's set.
    std::shared_ptr<CDocumentItem> FileMember(const std::string& path);

    CCommandEnv& m_env;
};
