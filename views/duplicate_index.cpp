#include "views/duplicate_index.h"

#include "catalog/app_folders.h"
#include "catalog/tallowmere_doc.h"

#include <cstring>

namespace {

void AppendField(std::string& key, const std::string& text)
{
    const uint32_t size = static_cast<uint32_t>(text.size());
    key.append(reinterpret_cast<const char*>(&size), sizeof size);
    key += text;
}

template <typename T> void AppendValue(std::string& key, T value)
{
    char bytes[sizeof value];
    std::memcpy(bytes, &value, sizeof value);
    key.append(bytes, sizeof bytes);
}

} // namespace

CDuplicateIndex::CDuplicateIndex(const CTallowmereDoc& doc)
{
    const CCatalogSettings& settings = doc.GetSettings();
    m_pictureCriteria.name = settings.compareFileName != 0;
    m_pictureCriteria.createDate = settings.compareFileCreateDate != 0;
    m_pictureCriteria.modifyDate = settings.compareFileModifyDate != 0;
    m_pictureCriteria.size = settings.compareFileSize != 0;
    m_pictures.reserve(doc.GetPictures().size());
    for (const auto& item : doc.GetPictures())
        m_pictures.emplace(Key(*item, m_pictureCriteria), item.get());
    m_documents.reserve(doc.GetDocuments().size());
    for (const auto& item : doc.GetDocuments())
        m_documents.emplace(Key(*item, m_documentCriteria), item.get());
}

std::string CDuplicateIndex::Key(const CDocumentItem& item, const Criteria& criteria)
{
    std::string key;
    key.reserve(item.GetCategoryPath().size() + item.GetOriginalPathname().size() + 40);
    AppendField(key, item.GetCategoryPath());
    if (criteria.name)
        AppendField(key, item.GetOriginalPathname());
    if (criteria.createDate)
        AppendValue(key, item.GetFileCreateDate().GetTime());
    if (criteria.modifyDate)
        AppendValue(key, item.GetFileModifyDate().GetTime());
    if (criteria.size)
        AppendValue(key, item.GetFileSize());
    return key;
}

bool CDuplicateIndex::IsPicture(const CDocumentItem& item) const
{
    return CAppFolders::IsPictureFile(item.GetPathname()) == 1;
}

CDocumentItem* CDuplicateIndex::Find(const CDocumentItem& entry) const
{
    const bool picture = IsPicture(entry);
    const auto& map = picture ? m_pictures : m_documents;
    const auto it = map.find(Key(entry, picture ? m_pictureCriteria : m_documentCriteria));
    return it == map.end() ? nullptr : it->second;
}

void CDuplicateIndex::Add(CDocumentItem& item)
{
    if (item.IsPicture())
        m_pictures.emplace(Key(item, m_pictureCriteria), &item);
    else
        m_documents.emplace(Key(item, m_documentCriteria), &item);
}
