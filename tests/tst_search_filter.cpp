// The matching rule of the lists and the rows a refresh produces.

#include "tests/support/command_fixture.h"
#include "views/data_list_state.h"
#include "views/search_filter.h"

#include <QtTest>

namespace {

// A record to match: CCatalogRecord cannot be built on its own.
class Record : public CCatalogRecord
{
};

constexpr qint64 kDay = 24 * 3600;
constexpr qint64 kMar05 = 1046822400; // 2003-03-05 00:00:00 UTC

} // namespace

class TestSearchFilter : public QObject
{
    Q_OBJECT

private slots:
    void matches_data();
    void matches();
    void unmanagedEntryAlwaysMatches();
    void documentRows();
    void dataItemTabsShowSubCategories();
};

void TestSearchFilter::matches_data()
{
    QTest::addColumn<QString>("itemCategory");
    QTest::addColumn<QString>("category");
    QTest::addColumn<bool>("subCategories");
    QTest::addColumn<bool>("filterOn");
    QTest::addColumn<QString>("itemKeywords"); // "keyword1|keyword2"
    QTest::addColumn<QString>("keywords");
    QTest::addColumn<qint64>("updated");
    QTest::addColumn<bool>("expected");
    const auto row = [](const char* name, const char* itemCategory, const char* category, bool sub,
                        bool on, const char* itemKeywords, const char* keywords, qint64 updated,
                        bool expected) {
        QTest::newRow(name) << itemCategory << category << sub << on << itemKeywords << keywords
                            << updated << expected;
    };
    const char* L = "DOCUMENTS\\Letters";
    const qint64 mid = kMar05 + kDay; // the filter runs from kMar05 to kMar05 + 2 days
    row("keyword 1 found in keyword 2", L, L, false, true, "|tax", "tax|", mid, true);
    row("keyword is whole, not a prefix", L, L, false, true, "taxes|", "tax|", mid, false);
    row("keyword case counts", L, L, false, true, "Tax|", "tax|", mid, false);
    row("both keywords, either field", L, L, false, true, "2003|tax", "tax|2003", mid, true);
    row("both keywords, one missing", L, L, false, true, "tax|other", "tax|2003", mid, false);
    const char* prefix = "DOCUMENTS\\Letter";
    row("sub-categories by character prefix", L, prefix, true, false, "", "", mid, true);
    row("without sub-categories, equal paths only", L, prefix, false, false, "", "", mid, false);
    row("category case counts", L, "documents", true, false, "", "", mid, false);
    row("filter off ignores keywords and dates", L, L, false, false, "x|y", "tax|z", 0, true);
    row("filter off still tests the category", "RECIPES", L, true, false, "", "", mid, false);
    row("from date included", L, L, false, true, "", "", kMar05, true);
    row("before from date", L, L, false, true, "", "", kMar05 - 1, false);
    row("to date included", L, L, false, true, "", "", kMar05 + 2 * kDay, true);
    row("after to date", L, L, false, true, "", "", kMar05 + 2 * kDay + 1, false);
}

void TestSearchFilter::matches()
{
    QFETCH(QString, itemCategory);
    QFETCH(QString, category);
    QFETCH(bool, subCategories);
    QFETCH(bool, filterOn);
    QFETCH(QString, itemKeywords);
    QFETCH(QString, keywords);
    QFETCH(qint64, updated);
    QFETCH(bool, expected);

    Record item;
    item.SetCategoryPath(itemCategory.toStdString());
    item.SetKeyword1(itemKeywords.section('|', 0, 0).toStdString());
    item.SetKeyword2(itemKeywords.section('|', 1).toStdString());
    item.SetUpdateDate(CTime(updated));
    CSearchFilter filter;
    filter.SetCategoryPath(category.toStdString());
    filter.includeSubCategories = subCategories;
    filter.categoryTestOn = true;
    filter.filterOn = filterOn;
    filter.SetKeyword1(keywords.section('|', 0, 0).toStdString());
    filter.SetKeyword2(keywords.section('|', 1).toStdString());
    filter.fromDate = CTime(kMar05);
    filter.toDate = CTime(kMar05 + 2 * kDay);
    QCOMPARE(MatchesFilter(item, filter), expected);
}

void TestSearchFilter::unmanagedEntryAlwaysMatches()
{
    CPictureItem picture;
    picture.SetCategoryPath("<File System>");
    CSearchFilter filter;
    filter.SetCategoryPath("DOCUMENTS");
    filter.categoryTestOn = true;
    picture.SetManagedFlag(0);
    QVERIFY(MatchesFilter(picture, filter));
    picture.SetManagedFlag(1);
    QVERIFY(!MatchesFilter(picture, filter));
}

void TestSearchFilter::documentRows()
{
    CCommandFixture f;
    const std::vector<std::pair<const char*, int32_t>> documents = {
        {"DOCUMENTS", 12}, {"DOCUMENTS\\Letters", 3}, {"DOCUMENTSX", 5}, {"DOCUMENTS", 7}};
    for (const auto& [category, sequence] : documents) {
        auto item = std::make_shared<CDocumentItem>();
        item->SetLabel("letter");
        item->SetCategoryPath(category);
        item->SetPathname("/home/ann/letter.doc");
        f.doc.AddDocument(item);
        item->SetSequenceNumber(sequence);
        item->SetCreateDate(CTime(kMar05));
    }
    CDataListState state(f.doc);
    state.SetTab(TabKind::ManagedDocuments);
    const CRowList& rows = state.Rows(TabKind::ManagedDocuments);
    QCOMPARE(rows.size(), size_t(2));
    const std::vector<std::string> first = {"        7", "letter", "DOCUMENTS",
                                            "/home/ann/letter.doc", "Mar 05, 2003"};
    QCOMPARE(rows.at(0).cells, first);
    QCOMPARE(rows.at(1).cells.front(), std::string("       12"));
    state.SwitchSubCategories();
    QCOMPARE(rows.size(), size_t(4));
    QCOMPARE(f.doc.GetCurrentCategoryPath(), std::string("DOCUMENTS"));
}

void TestSearchFilter::dataItemTabsShowSubCategories()
{
    CCommandFixture f;
    const std::vector<std::pair<const char*, const char*>> recipes = {
        {"Stew", "RECIPES\\Entrees"}, {"Apple pie", "RECIPES"}, {"Borscht", "RECIPES\\Soups"}};
    for (const auto& [dish, category] : recipes) {
        auto recipe = std::make_unique<CRecipeItem>();
        recipe->SetDish(dish);
        recipe->SetCategoryPath(category);
        f.doc.RegisterItem(*recipe);
        f.doc.AddRecipe(std::move(recipe));
    }
    CDataListState state(f.doc);
    state.SetTab(TabKind::Recipes); // the check box stays off
    const CRowList& rows = state.Rows(TabKind::Recipes);
    QCOMPARE(rows.size(), size_t(3));
    QCOMPARE(rows.at(0).cells.front(), std::string("Apple pie"));
    QCOMPARE(rows.at(2).cells.front(), std::string("Stew"));
    QCOMPARE(rows.at(2).cells[kItemType], std::string("RECIPE"));
    QCOMPARE(rows.at(2).cells[kItemSequence], std::string("        1"));
    state.SelectCategory("RECIPES\\Soups");
    QCOMPARE(rows.size(), size_t(1));
    QCOMPARE(ItemsOfKind(f.doc, "").size(), size_t(3)); // an empty kind tag means recipes
}

QTEST_GUILESS_MAIN(TestSearchFilter)
#include "tst_search_filter.moc"
