#include "views/search_filter.h"

namespace {

bool HasKeyword(const CCatalogRecord& item, const std::string& keyword)
{
    return keyword.empty() || keyword == item.GetKeyword1() || keyword == item.GetKeyword2();
}

} // namespace

bool MatchesFilter(const CCatalogRecord& item, const CSearchFilter& filter)
{
    const std::string& path = item.GetCategoryPath();
    const std::string& wanted = filter.GetCategoryPath();
    const bool inCategory =
        filter.includeSubCategories ? path.compare(0, wanted.size(), wanted) == 0 : path == wanted;
    if (filter.categoryTestOn && !inCategory)
        return false;
    if (!filter.filterOn)
        return true;
    if (!HasKeyword(item, filter.GetKeyword1()) || !HasKeyword(item, filter.GetKeyword2()))
        return false;
    return filter.fromDate <= item.GetUpdateDate() && item.GetUpdateDate() <= filter.toDate;
}

bool MatchesFilter(const CDocumentItem& item, const CSearchFilter& filter)
{
    if (!item.GetManagedFlag())
        return true;
    return MatchesFilter(static_cast<const CCatalogRecord&>(item), filter);
}
