#include "catalog/item_list.h"

#include <algorithm>

CItemList::~CItemList()
{
    RemoveAll();
}

CItemList::CItemList(CItemList&& other) noexcept : m_items(std::move(other.m_items))
{
    other.m_items.clear();
}

CItemList& CItemList::operator=(CItemList&& other) noexcept
{
    if (this != &other) {
        RemoveAll();
        m_items = std::move(other.m_items);
        other.m_items.clear();
    }
    return *this;
}

void CItemList::Append(Ptr item)
{
    ++item->m_refCount;
    m_items.push_back(std::move(item));
}

CItemList::Ptr CItemList::RemoveAt(size_t index)
{
    Ptr item = std::move(m_items.at(index));
    m_items.erase(m_items.begin() + static_cast<std::ptrdiff_t>(index));
    --item->m_refCount;
    return item;
}

bool CItemList::Remove(const CDocumentItem* item)
{
    const auto it = std::find_if(m_items.begin(), m_items.end(),
                                 [item](const Ptr& p) { return p.get() == item; });
    if (it == m_items.end())
        return false;
    RemoveAt(static_cast<size_t>(it - m_items.begin()));
    return true;
}

void CItemList::RemoveAll()
{
    for (const Ptr& item : m_items)
        --item->m_refCount;
    m_items.clear();
}

CDocumentItem* CItemList::FindBySequence(int32_t sequenceNumber) const
{
    for (const Ptr& item : m_items) {
        if (item->GetSequenceNumber() == sequenceNumber)
            return item.get();
    }
    return nullptr;
}
