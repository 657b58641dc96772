#pragma once
// Finds an entry equal to a new one in constant time: the category path is
// always compared, then for pictures the criteria of the settings (original
// pathname, file create date, file modify date, file size) and for other
// documents all four. The first equal entry in list order is the one found.

#include "catalog/catalog_items.h"

#include <string>
#include <unordered_map>

class CTallowmereDoc;

class CDuplicateIndex
{
public:
    explicit CDuplicateIndex(const CTallowmereDoc& doc);

    // The catalog entry equal to entry, or nullptr.
    CDocumentItem* Find(const CDocumentItem& entry) const;
    // Takes in an entry just filed in the catalog.
    void Add(CDocumentItem& item);

private:
    struct Criteria
    {
        bool name = true;
        bool createDate = true;
        bool modifyDate = true;
        bool size = true;
    };

    static std::string Key(const CDocumentItem& item, const Criteria& criteria);
    bool IsPicture(const CDocumentItem& item) const;

    Criteria m_pictureCriteria;
    Criteria m_documentCriteria;
    std::unordered_map<std::string, CDocumentItem*> m_pictures;
    std::unordered_map<std::string, CDocumentItem*> m_documents;
};
