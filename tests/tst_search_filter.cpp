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
    void documentRowsTexts();
    void managedTabFollowsSubCategoryBox();
    void dataItemTabsShowSubCategories();
    void itemsOfKindNames();
};

void TestSearchFilter::matches_data()
{
    QTest::addColumn<QString>("itemCategory");
    QTest::addColumn<QString>("itemKeyword1");
    QTest::addColumn<QString>("itemKeyword2");
    QTest::addColumn<qint64>("updated");
    QTest::addColumn<QString>("category");
    QTest::addColumn<bool>("subCategories");
    QTest::addColumn<bool>("filterOn");
    QTest::addColumn<QString>("keyword1");
    QTest::addColumn<QString>("keyword2");
    QTest::addColumn<bool>("expected");

    const QString letters = QStringLiteral("DOCUMENTS\\Letters");
    const QString letter = QStringLiteral("DOCUMENTS\\Letter");
    const qint64 mid = kMar05 + kDay; // from kMar05 to kMar05 + 2 days below
    QTest::newRow("keyword 1 found in keyword 2")
        << letters << ""
        << "tax" << mid << letters << false << true << "tax"
        << "" << true;
    QTest::newRow("keyword is whole, not a prefix")
        << letters << "taxes"
        << "" << mid << letters << false << true << "tax"
        << "" << false;
    QTest::newRow("keyword case counts") << letters << "Tax"
                                         << "" << mid << letters << false << true << "tax"
                                         << "" << false;
    QTest::newRow("both keywords, either field")
        << letters << "2003"
        << "tax" << mid << letters << false << true << "tax"
        << "2003" << true;
    QTest::newRow("both keywords, one missing")
        << letters << "tax"
        << "other" << mid << letters << false << true << "tax"
        << "2003" << false;
    QTest::newRow("sub-categories by character prefix")
        << letters << ""
        << "" << mid << letter << true << false << ""
        << "" << true;
    QTest::newRow("without sub-categories the path must be equal")
        << letters << ""
        << "" << mid << letter << false << false << ""
        << "" << false;
    QTest::newRow("category case counts") << letters << ""
                                          << "" << mid << "documents" << true << false << ""
                                          << "" << false;
    QTest::newRow("filter off ignores keywords and dates")
        << letters << "x"
        << "y" << qint64(0) << letters << false << false << "tax"
        << "z" << true;
    QTest::newRow("filter off still tests the category")
        << "RECIPES"
        << ""
        << "" << mid << letters << true << false << ""
        << "" << false;
    QTest::newRow("from date included") << letters << ""
                                        << "" << kMar05 << letters << false << true << ""
                                        << "" << true;
    QTest::newRow("before from date") << letters << ""
                                      << "" << kMar05 - 1 << letters << false << true << ""
                                      << "" << false;
    QTest::newRow("to date included") << letters << ""
                                      << "" << kMar05 + 2 * kDay << letters << false << true << ""
                                      << "" << true;
    QTest::newRow("after to date") << letters << ""
                                   << "" << kMar05 + 2 * kDay + 1 << letters << false << true << ""
                                   << "" << false;
}

void TestSearchFilter::matches()
{
    QFETCH(QString, itemCategory);
    QFETCH(QString, itemKeyword1);
    QFETCH(QString, itemKeyword2);
    QFETCH(qint64, updated);
    QFETCH(QString, category);
    QFETCH(bool, subCategories);
    QFETCH(bool, filterOn);
    QFETCH(QString, keyword1);
    QFETCH(QString, keyword2);
    QFETCH(bool, expected);

    Record item;
    item.SetCategoryPath(itemCategory.toStdString());
    item.SetKeyword1(itemKeyword1.toStdString());
    item.SetKeyword2(itemKeyword2.toStdString());
    item.SetUpdateDate(CTime(updated));
    CSearchFilter filter;
    filter.SetCategoryPath(category.toStdString());
    filter.includeSubCategories = subCategories;
    filter.categoryTestOn = true;
    filter.filterOn = filterOn;
    filter.SetKeyword1(keyword1.toStdString());
    filter.SetKeyword2(keyword2.toStdString());
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

void TestSearchFilter::documentRowsTexts()
{
    CCommandFixture f;
    for (int32_t sequence : {12, 7}) {
        auto item = std::make_shared<CDocumentItem>();
        item->SetLabel("letter");
        item->SetCategoryPath("DOCUMENTS");
        item->SetPathname("/home/ann/letter.doc");
        f.doc.GetDocuments().Append(item);
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
}

void TestSearchFilter::managedTabFollowsSubCategoryBox()
{
    CCommandFixture f;
    for (const char* category : {"DOCUMENTS", "DOCUMENTS\\Letters", "DOCUMENTSX"}) {
        auto item = std::make_shared<CDocumentItem>();
        item->SetCategoryPath(category);
        f.doc.AddDocument(item);
    }
    CDataListState state(f.doc);
    state.SetTab(TabKind::ManagedDocuments);
    QCOMPARE(state.Rows(TabKind::ManagedDocuments).size(), size_t(1));
    state.SwitchSubCategories();
    QCOMPARE(state.Rows(TabKind::ManagedDocuments).size(), size_t(3));
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
}

void TestSearchFilter::itemsOfKindNames()
{
    CCommandFixture f;
    auto event = std::make_unique<CEventItem>();
    event->SetEventName("Ann's birthday");
    f.doc.AddEvent(std::move(event));
    auto set = std::make_unique<CDocumentSet>();
    set->SetLabel("Taxes 2003");
    f.doc.AddDocumentSet(std::move(set));
    auto recipe = std::make_unique<CRecipeItem>();
    recipe->SetDish("Stew");
    f.doc.AddRecipe(std::move(recipe));
    QCOMPARE(ItemsOfKind(f.doc, "EVENT").at(0)->GetName(), std::string("Ann's birthday"));
    QCOMPARE(ItemsOfKind(f.doc, "DOCUMENT SETS").at(0)->GetName(), std::string("Taxes 2003"));
    QCOMPARE(ItemsOfKind(f.doc, "").at(0)->GetName(), std::string("Stew"));
    QCOMPARE(ItemsOfKind(f.doc, "DOCUMENT SETS").at(0)->GetKindTag(), std::string("DOCUMENT SETS"));
}

QTEST_GUILESS_MAIN(TestSearchFilter)
#include "tst_search_filter.moc"
