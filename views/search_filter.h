#pragma once
// The one matching rule of the program's lists: a category test (exact, or by
// character prefix with sub-categories), then, with the filter on, both
// keywords and the update date range.

#include "catalog/catalog_items.h"

class CSearchFilter : public CCatalogRecord
{
public:
    CSearchFilter() = default;

    CTime fromDate;
    CTime toDate;
    bool filterOn = false;
    bool categoryTestOn = false;
    bool includeSubCategories = true;
    std::string filePattern; // never set; names no file type yet
};

bool MatchesFilter(const CCatalogRecord& item, const CSearchFilter& filter);
// An entry that is not managed (a file of the "Documents" tab) always matches.
bool MatchesFilter(const CDocumentItem& item, const CSearchFilter& filter);
