#include "views/list_rows.h"

#include "catalog/text_util.h"

#include <algorithm>
#include <charconv>
#include <cstdlib>
#include <ctime>

const std::vector<std::string> kDocumentColumns = {"Doc #", "Caption", "Category", "Location",
                                                   "Create Date"};
const std::vector<std::string> kRecipeColumns = {"Name", "Category",    "Primary Ingredient",
                                                 "Type", "Create Date", "Sequence #"};
const std::vector<std::string> kEventColumns = {"Name", "Category",    "Keyword",
                                                "Type", "Create Date", "Sequence #"};
const std::vector<std::string> kDocumentSetColumns = kEventColumns;

namespace {

bool FirstCellLess(const CListRow& a, const CListRow& b)
{
    return a.cells.front() < b.cells.front();
}

} // namespace

std::string FormatSequence(int32_t number)
{
    char digits[16];
    const auto result = std::to_chars(digits, digits + sizeof digits, number);
    const size_t length = static_cast<size_t>(result.ptr - digits);
    std::string text(length < 9 ? 9 - length : 0, ' ');
    text.append(digits, length);
    return text;
}

std::string FormatListDate(CTime date)
{
    // Lists format one date per row; most rows of a list share a few days,
    // so the local day last formatted is kept with its bounds.
    static thread_local int64_t dayStart = 1;
    static thread_local int64_t dayEnd = 0;
    static thread_local std::string text;
    const int64_t t = date.GetTime();
    if (t >= dayStart && t < dayEnd)
        return text;
    text = date.Format("%b %d, %Y");
    const time_t seconds = static_cast<time_t>(t);
    struct tm local;
    if (!localtime_r(&seconds, &local)) {
        dayEnd = dayStart;
        return text;
    }
    struct tm start = local;
    start.tm_hour = start.tm_min = start.tm_sec = 0;
    start.tm_isdst = -1;
    struct tm next = start;
    next.tm_mday += 1;
    const time_t begin = mktime(&start);
    const time_t end = mktime(&next);
    if (begin == static_cast<time_t>(-1) || end == static_cast<time_t>(-1) || begin > t) {
        dayEnd = dayStart;
        return text;
    }
    dayStart = begin;
    dayEnd = end;
    return text;
}

int32_t ParseSequence(const std::string& text)
{
    return static_cast<int32_t>(std::strtol(text.c_str(), nullptr, 10));
}

void FillDocumentRow(const CDocumentItem& item, CListRow& row)
{
    row.cells.resize(5);
    row.cells[kDocNumber] = FormatSequence(item.GetSequenceNumber());
    row.cells[kDocCaption].assign(item.GetLabel());
    row.cells[kDocCategory].assign(item.GetCategoryPath());
    row.cells[kDocLocation].assign(item.GetPathname());
    row.cells[kDocCreateDate] = FormatListDate(item.GetCreateDate());
    row.selected = false;
}

void FillDataItemRow(const CCatalogItem& item, CListRow& row)
{
    row.cells.resize(6);
    row.cells[kItemName].assign(item.GetName());
    row.cells[kItemCategory].assign(item.GetCategoryPath());
    row.cells[kItemKeyword].assign(item.GetKeyword1());
    row.cells[kItemType].assign(item.GetKindTag());
    row.cells[kItemCreateDate] = FormatListDate(item.GetCreateDate());
    row.cells[kItemSequence] = FormatSequence(item.GetSequenceNumber());
    row.selected = false;
}

CListRow DocumentRow(const CDocumentItem& item)
{
    CListRow row;
    FillDocumentRow(item, row);
    return row;
}

CListRow DataItemRow(const CCatalogItem& item)
{
    CListRow row;
    FillDataItemRow(item, row);
    return row;
}

size_t CRowList::Insert(CListRow row)
{
    const auto at = std::upper_bound(m_rows.begin(), m_rows.end(), row, FirstCellLess);
    const size_t index = static_cast<size_t>(at - m_rows.begin());
    m_rows.insert(at, std::move(row));
    return index;
}

void CRowList::InsertAll(std::vector<CListRow> rows)
{
    if (!std::is_sorted(rows.begin(), rows.end(), FirstCellLess))
        std::stable_sort(rows.begin(), rows.end(), FirstCellLess);
    const auto middle = static_cast<std::ptrdiff_t>(m_rows.size());
    m_rows.insert(m_rows.end(), std::make_move_iterator(rows.begin()),
                  std::make_move_iterator(rows.end()));
    std::inplace_merge(m_rows.begin(), m_rows.begin() + middle, m_rows.end(), FirstCellLess);
}

CListRow& CRowList::NextRow()
{
    if (m_filled == m_rows.size())
        m_rows.emplace_back();
    return m_rows[m_filled++];
}

void CRowList::EndRefill()
{
    m_rows.resize(m_filled);
    if (!std::is_sorted(m_rows.begin(), m_rows.end(), FirstCellLess))
        std::stable_sort(m_rows.begin(), m_rows.end(), FirstCellLess);
}

void CRowList::RemoveAt(size_t index)
{
    m_rows.erase(m_rows.begin() + static_cast<std::ptrdiff_t>(index));
}

size_t CRowList::Find(size_t column, const std::string& text) const
{
    for (size_t i = 0; i < m_rows.size(); ++i) {
        if (column < m_rows[i].cells.size() && m_rows[i].cells[column] == text)
            return i;
    }
    return npos;
}

void CRowList::SelectAll(bool selected)
{
    for (CListRow& row : m_rows)
        row.selected = selected;
}

std::vector<size_t> CRowList::SelectedIndexes() const
{
    std::vector<size_t> indexes;
    for (size_t i = 0; i < m_rows.size(); ++i) {
        if (m_rows[i].selected)
            indexes.push_back(i);
    }
    return indexes;
}
