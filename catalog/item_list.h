#pragma once
// The reference-counting list of documents and pictures: the catalog's lists
// and every document set's members may share one item, which lives until the
// last list lets it go.

#include "catalog/document_item.h"

#include <memory>
#include <vector>

class CItemList
{
public:
    using Ptr = std::shared_ptr<CDocumentItem>;

    CItemList() = default;
    ~CItemList();
    CItemList(CItemList&& other) noexcept;
    CItemList& operator=(CItemList&& other) noexcept;
    CItemList(const CItemList&) = delete;
    CItemList& operator=(const CItemList&) = delete;

    void Append(Ptr item);
    // Unlinks the item at index and hands it back (it dies with the last holder).
    Ptr RemoveAt(size_t index);
    bool Remove(const CDocumentItem* item);
    void RemoveAll();

    size_t size() const { return m_items.size(); }
    bool empty() const { return m_items.empty(); }
    const Ptr& at(size_t index) const { return m_items.at(index); }
    std::vector<Ptr>::const_iterator begin() const { return m_items.begin(); }
    std::vector<Ptr>::const_iterator end() const { return m_items.end(); }

    CDocumentItem* FindBySequence(int32_t sequenceNumber) const;

private:
    std::vector<Ptr> m_items;
};
