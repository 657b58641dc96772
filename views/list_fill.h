#pragma once
// Rebuilding the rows of a tab through the search filter: the document fill
// (pictures, then documents), the data item fill and the summary copies of
// one kind of data item.

#include "views/list_ids.h"
#include "views/list_rows.h"
#include "views/search_filter.h"

#include <memory>
#include <vector>

class CTallowmereDoc;

// What the filter panel holds between refreshes.
struct CFilterControls
{
    CFilterControls();

    bool filterOn = false;
    bool includeSubCategories = false;
    std::string keyword1;
    std::string keyword2;
    CTime fromDate; // 1 January 1970, 00:00 local time
    CTime toDate;   // when the panel was made, plus 24 hours
};

// Summary copies of the catalog's recipes ("RECIPE" or ""), document sets
// ("DOCUMENT SETS") or events ("EVENT"), each named by the item's own name.
std::vector<std::unique_ptr<CCatalogItem>> ItemsOfKind(const CTallowmereDoc& doc,
                                                       const std::string& kindTag);

// The kind tag of a data item tab ("" for the other tabs).
std::string KindTagOfTab(TabKind tab);

// The filter a refresh of categoryPath builds from the panel.
CSearchFilter MakeFilter(const CFilterControls& controls, const std::string& categoryPath);

void FillDocumentRows(const CTallowmereDoc& doc, const CSearchFilter& filter, CRowList& rows);
void FillDataItemRows(const CTallowmereDoc& doc, const std::string& kindTag,
                      const CSearchFilter& filter, CRowList& rows);
// Rows for files of a folder: every one is listed.
void FillFolderRows(const std::vector<std::shared_ptr<CDocumentItem>>& items, CRowList& rows);
