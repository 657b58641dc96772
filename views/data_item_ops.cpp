#include "views/data_item_ops.h"

#include "catalog/prompt.h"
#include "catalog/tallowmere_doc.h"
#include "views/command_env.h"

#include <algorithm>

namespace {

template <typename Item>
Item* FindIn(const std::vector<std::unique_ptr<Item>>& list, int32_t sequence)
{
    for (const auto& item : list) {
        if (item->GetSequenceNumber() == sequence)
            return item.get();
    }
    return nullptr;
}

template <typename Item> bool RemoveFrom(std::vector<std::unique_ptr<Item>>& list, int32_t sequence)
{
    const auto it = std::find_if(list.begin(), list.end(), [sequence](const auto& item) {
        return item->GetSequenceNumber() == sequence;
    });
    if (it == list.end())
        return false;
    list.erase(it);
    return true;
}

} // namespace

CDataItemOps::CDataItemOps(CCommandEnv& env) : m_env(env) {}

void CDataItemOps::AddDocumentSet(std::unique_ptr<CDocumentSet> item)
{
    m_env.Doc().RegisterItem(*item);
    m_env.Doc().AddDocumentSet(std::move(item));
    m_env.MarkChanged();
}

void CDataItemOps::AddEvent(std::unique_ptr<CEventItem> item)
{
    m_env.Doc().RegisterItem(*item);
    m_env.Doc().AddEvent(std::move(item));
    m_env.MarkChanged();
}

void CDataItemOps::AddRecipe(std::unique_ptr<CRecipeItem> item)
{
    m_env.Doc().RegisterItem(*item);
    m_env.Doc().AddRecipe(std::move(item));
    m_env.MarkChanged();
}

bool CDataItemOps::AddDataItem(std::unique_ptr<CCatalogItem> item)
{
    if (dynamic_cast<CDocumentSet*>(item.get())) {
        AddDocumentSet(std::unique_ptr<CDocumentSet>(static_cast<CDocumentSet*>(item.release())));
    } else if (dynamic_cast<CEventItem*>(item.get())) {
        AddEvent(std::unique_ptr<CEventItem>(static_cast<CEventItem*>(item.release())));
    } else if (dynamic_cast<CRecipeItem*>(item.get())) {
        AddRecipe(std::unique_ptr<CRecipeItem>(static_cast<CRecipeItem*>(item.release())));
    } else {
        return false;
    }
    return true;
}

CCatalogItem* CDataItemOps::FindDataItem(const std::string& kindTag, int32_t sequence) const
{
    const CTallowmereDoc& doc = m_env.Doc();
    if (kindTag == kKindRecipe)
        return FindIn(doc.GetRecipes(), sequence);
    if (kindTag == kKindDocumentSets)
        return FindIn(doc.GetDocumentSets(), sequence);
    if (kindTag == kKindEvent)
        return FindIn(doc.GetEvents(), sequence);
    return nullptr;
}

bool CDataItemOps::EditDataItem(const std::string& kindTag, int32_t sequence)
{
    CCatalogItem* item = FindDataItem(kindTag, sequence);
    if (!item || !item->Edit(m_env.Doc().GetContext()))
        return false;
    m_env.MarkChanged();
    return true;
}

bool CDataItemOps::DeleteDataItem(const std::string& kindTag, int32_t sequence)
{
    CTallowmereDoc& doc = m_env.Doc();
    CCurrentItems& current = doc.GetCurrentItems();
    bool removed = false;
    if (kindTag == kKindRecipe) {
        removed = RemoveFrom(doc.GetRecipes(), sequence);
        if (removed && current.recipeSequence == sequence)
            current.recipeSequence = 0;
    } else if (kindTag == kKindDocumentSets) {
        removed = RemoveFrom(doc.GetDocumentSets(), sequence);
        if (removed && current.documentSetSequence == sequence)
            current.documentSetSequence = 0;
    } else if (kindTag == kKindEvent) {
        removed = RemoveFrom(doc.GetEvents(), sequence);
        if (removed && current.eventSequence == sequence)
            current.eventSequence = 0;
    }
    if (removed)
        m_env.MarkChanged();
    return removed;
}

std::shared_ptr<CDocumentItem> CDataItemOps::FileMember(const std::string& path)
{
    CTallowmereDoc& doc = m_env.Doc();
    CFileStatus status; // a file gone from disk keeps zero dates and size
    CFileStatus::GetStatus(path, status);
    auto entry = std::make_shared<CDocumentItem>(path, status);
    doc.SetCurrentCategoryPath(kDocumentSetsCategory);
    m_env.MarkChanged();
    // The member is the catalog's entry itself, picture or not.
    if (CAppFolders::IsPictureFile(path) == 1) {
        auto picture = std::make_shared<CPictureItem>(*entry);
        doc.AddPicture(picture);
        return picture;
    }
    doc.AddDocument(entry);
    return entry;
}

bool CDataItemOps::CreateDocumentSet(const std::vector<const CDocumentItem*>& items)
{
    CTallowmereDoc& doc = m_env.Doc();
    auto set = std::make_unique<CDocumentSet>();
    for (const CDocumentItem* item : items)
        set->GetMembers().Append(FileMember(item->GetPathname()));
    doc.SetCurrentCategoryPath(kRootDocumentSets);
    if (!set->Edit(doc.GetContext()))
        return false; // the member entries stay in the catalog
    doc.SetCurrentCategoryPath(kRootDocumentSets);
    AddDocumentSet(std::move(set));
    return true;
}

bool CDataItemOps::AddToDocumentSet(const std::vector<const CDocumentItem*>& items)
{
    CTallowmereDoc& doc = m_env.Doc();
    CUpdateDocumentSetFields fields;
    for (const auto& set : doc.GetDocumentSets())
        fields.sets.push_back(std::make_shared<const CDocumentSet>(*set));
    for (const CCategory* category : doc.GetCategoriesUnder(kRootDocumentSets))
        fields.categories.push_back(category->GetPath());
    if (!m_env.Prompt().UpdateDocumentSet(fields) || fields.chosenSequence == 0)
        return false;
    CDocumentSet* set = FindIn(doc.GetDocumentSets(), fields.chosenSequence);
    if (!set)
        return false;
    for (const CDocumentItem* item : items)
        set->GetMembers().Append(FileMember(item->GetPathname()));
    return true;
}
