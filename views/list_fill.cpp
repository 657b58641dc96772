#include "views/list_fill.h"

#include "catalog/tallowmere_doc.h"

#include <ctime>

namespace {

CTime LocalEpoch()
{
    struct tm start = {};
    start.tm_year = 70;
    start.tm_mday = 1;
    start.tm_isdst = -1;
    return CTime(static_cast<int64_t>(mktime(&start)));
}

template <typename Item>
std::unique_ptr<CCatalogItem> SummaryOf(const Item& item, const std::string& name)
{
    auto copy = std::make_unique<CCatalogItem>();
    copy->CopyBaseFrom(item);
    copy->SetName(name);
    return copy;
}

} // namespace

CFilterControls::CFilterControls()
    : fromDate(LocalEpoch()), toDate(CTime(CTime::GetCurrentTime().GetTime() + 24 * 3600))
{}

std::vector<std::unique_ptr<CCatalogItem>> ItemsOfKind(const CTallowmereDoc& doc,
                                                       const std::string& kindTag)
{
    std::vector<std::unique_ptr<CCatalogItem>> items;
    if (kindTag == kKindDocumentSets) {
        for (const auto& set : doc.GetDocumentSets())
            items.push_back(SummaryOf(*set, set->GetLabel()));
    } else if (kindTag == kKindEvent) {
        for (const auto& event : doc.GetEvents())
            items.push_back(SummaryOf(*event, event->GetEventName()));
    } else {
        for (const auto& recipe : doc.GetRecipes())
            items.push_back(SummaryOf(*recipe, recipe->GetDish()));
    }
    return items;
}

std::string KindTagOfTab(TabKind tab)
{
    switch (tab) {
    case TabKind::DocumentSets:
        return kKindDocumentSets;
    case TabKind::Events:
        return kKindEvent;
    case TabKind::Recipes:
        return kKindRecipe;
    default:
        return std::string();
    }
}

CSearchFilter MakeFilter(const CFilterControls& controls, const std::string& categoryPath)
{
    CSearchFilter filter;
    if (controls.filterOn) {
        filter.SetKeyword1(controls.keyword1);
        filter.SetKeyword2(controls.keyword2);
        filter.fromDate = controls.fromDate;
        filter.toDate = controls.toDate;
    }
    filter.SetCategoryPath(categoryPath);
    filter.categoryTestOn = true;
    filter.filterOn = controls.filterOn;
    return filter;
}

void FillDocumentRows(const CTallowmereDoc& doc, const CSearchFilter& filter, CRowList& rows)
{
    rows.BeginRefill();
    for (const CItemList* list : {&doc.GetPictures(), &doc.GetDocuments()}) {
        for (const auto& item : *list) {
            if (MatchesFilter(*item, filter))
                FillDocumentRow(*item, rows.NextRow());
        }
    }
    rows.EndRefill();
}

void FillDataItemRows(const CTallowmereDoc& doc, const std::string& kindTag,
                      const CSearchFilter& filter, CRowList& rows)
{
    rows.BeginRefill();
    for (const auto& item : ItemsOfKind(doc, kindTag)) {
        if (MatchesFilter(static_cast<const CCatalogRecord&>(*item), filter))
            FillDataItemRow(*item, rows.NextRow());
    }
    rows.EndRefill();
}

void FillFolderRows(const std::vector<std::shared_ptr<CDocumentItem>>& items, CRowList& rows)
{
    rows.BeginRefill();
    for (const auto& item : items)
        FillDocumentRow(*item, rows.NextRow());
    rows.EndRefill();
}
