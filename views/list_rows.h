#pragma once
// The texts of list rows, exactly as the list view shows them, and the rows
// of one list kept in the list's order.

#include "catalog/catalog_items.h"

#include <string>
#include <vector>

struct CListRow
{
    std::vector<std::string> cells;
    bool selected = false;
};

// Columns of the documents list and of the data item lists.
enum DocumentColumn
{
    kDocNumber = 0,
    kDocCaption,
    kDocCategory,
    kDocLocation,
    kDocCreateDate
};
enum DataItemColumn
{
    kItemName = 0,
    kItemCategory,
    kItemKeyword,
    kItemType,
    kItemCreateDate,
    kItemSequence
};

extern const std::vector<std::string> kDocumentColumns;
extern const std::vector<std::string> kRecipeColumns;
extern const std::vector<std::string> kEventColumns;
extern const std::vector<std::string> kDocumentSetColumns;

// "%9d", so that text order is numeric order.
std::string FormatSequence(int32_t number);
// "%b %d, %Y" in local time.
std::string FormatListDate(CTime date);
// The number a "Doc #" or "Sequence #" text holds, 0 when it holds none.
int32_t ParseSequence(const std::string& text);

CListRow DocumentRow(const CDocumentItem& item);
CListRow DataItemRow(const CCatalogItem& item);
// The same texts written into an existing row, reusing its storage.
void FillDocumentRow(const CDocumentItem& item, CListRow& row);
void FillDataItemRow(const CCatalogItem& item, CListRow& row);

// The rows of one list, ascending by the first cell's text (byte order); a
// row goes after the rows whose first cell equals its own.
class CRowList
{
public:
    size_t Insert(CListRow row);
    void InsertAll(std::vector<CListRow> rows);
    void RemoveAt(size_t index);
    void Clear() { m_rows.clear(); }

    // Rebuilds every row in place (a refresh): NextRow hands out the rows in
    // turn, reusing their storage; EndRefill drops the rest and sorts.
    void BeginRefill() { m_filled = 0; }
    CListRow& NextRow();
    void EndRefill();

    size_t size() const { return m_rows.size(); }
    bool empty() const { return m_rows.empty(); }
    const CListRow& at(size_t index) const { return m_rows.at(index); }
    CListRow& at(size_t index) { return m_rows.at(index); }
    std::vector<CListRow>::const_iterator begin() const { return m_rows.begin(); }
    std::vector<CListRow>::const_iterator end() const { return m_rows.end(); }

    // The first row whose cell in column equals text, or npos.
    size_t Find(size_t column, const std::string& text) const;
    void SelectAll(bool selected);
    std::vector<size_t> SelectedIndexes() const;

    static constexpr size_t npos = static_cast<size_t>(-1);

private:
    std::vector<CListRow> m_rows;
    size_t m_filled = 0;
};
