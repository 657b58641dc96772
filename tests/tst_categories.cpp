// The category list and the tree a view builds from it.

#include "catalog/category.h"
#include "tests/support/text_tree.h"

#include <QtTest>

namespace {

QStringList Paths(const std::vector<CCategory*>& categories)
{
    QStringList out;
    for (const CCategory* c : categories)
        out << QString::fromStdString(c->GetPath());
    return out;
}

QStringList Paths(const CCategoryList& list)
{
    QStringList out;
    for (const auto& c : list)
        out << QString::fromStdString(c->GetPath()) + ":" + QString::number(c->GetDepth());
    return out;
}

CCategoryList Defaults()
{
    CCategoryList list;
    list.AddDefaultCategories();
    return list;
}

} // namespace

class TestCategories : public QObject
{
    Q_OBJECT

private slots:
    void defaultsInOrder()
    {
        QCOMPARE(Paths(Defaults()),
                 (QStringList{"DOCUMENTS\\RECIPES:1", "DOCUMENTS\\EVENTS:1",
                              "DOCUMENTS\\DOCUMENT SETS:1", "DOCUMENTS\\PHOTO ALBUMS:1",
                              "RECIPES\\Appetizers:1", "RECIPES\\Appetizers\\Salads:2",
                              "RECIPES\\Appetizers\\Soups:2", "RECIPES\\Entrees:1",
                              "RECIPES\\Entrees\\Poultry:2", "RECIPES\\Entrees\\Fish:2",
                              "RECIPES\\Entrees\\Beef:2", "RECIPES\\Entrees\\Eggs:2",
                              "RECIPES\\Entrees\\Vegetables:2", "RECIPES\\Deserts:1",
                              "RECIPES\\Deserts\\Cakes:2", "EVENTS\\Birthdays:1",
                              "EVENTS\\Vacations:1", "EVENTS\\Holidays:1"}));
    }

    void ensureCategoryPathAddsOnlyWhatIsMissing()
    {
        CCategoryList list = Defaults();
        QCOMPARE(list.EnsureCategoryPath("DOCUMENTS\\Work\\2003"), 1);
        QCOMPARE(list.size(), size_t(20));
        QCOMPARE(Paths(list).mid(18),
                 (QStringList{"DOCUMENTS\\Work:1", "DOCUMENTS\\Work\\2003:2"}));
        list.EnsureCategoryPath("DOCUMENTS\\Work\\2003");
        QCOMPARE(list.size(), size_t(20));
        list.EnsureCategoryPath("DOCUMENTS\\Work\\2004");
        QCOMPARE(Paths(list).mid(20), QStringList{"DOCUMENTS\\Work\\2004:2"});
        list.EnsureCategoryPath("RECIPES"); // a root always exists
        QCOMPARE(list.size(), size_t(21));
    }

    void addCategoryDoesNotCheckForTwins()
    {
        CCategoryList list;
        list.AddCategory("Fish", "RECIPES", 0);
        list.AddCategory("Fish", "RECIPES", 0);
        QCOMPARE(Paths(list), (QStringList{"RECIPES\\Fish:1", "RECIPES\\Fish:1"}));
    }

    void removeCategory()
    {
        CCategoryList list = Defaults();
        QCOMPARE(list.RemoveCategory("RECIPES"), 0);
        QCOMPARE(list.size(), size_t(18));
        QCOMPARE(list.RemoveCategory("RECIPES\\Entrees"), 1);
        QCOMPARE(list.size(), size_t(17));
        // The children stay in the list but drop out of the tree.
        QVERIFY(Paths(list).contains("RECIPES\\Entrees\\Fish:2"));
        CTextTree tree;
        BuildCategoryTree(tree, list, "RECIPES");
        QCOMPARE(tree.Dump(), QString("RECIPES\n  Appetizers\n    Salads\n    Soups\n"
                                      "  Deserts\n    Cakes\n"));
        // Adding the category again brings its old children back.
        QVERIFY(!list.Exists("Entrees", "RECIPES"));
        list.EnsureCategoryPath("RECIPES\\Entrees");
        CTextTree again;
        BuildCategoryTree(again, list, "RECIPES");
        QVERIFY(again.Dump().contains("  Entrees\n    Poultry\n"));
    }

    void categoriesUnder_data()
    {
        QTest::addColumn<QString>("root");
        QTest::addColumn<QStringList>("paths");
        QTest::newRow("documents")
            << "DOCUMENTS"
            << QStringList{"DOCUMENTS\\RECIPES", "DOCUMENTS\\EVENTS", "DOCUMENTS\\DOCUMENT SETS",
                           "DOCUMENTS\\PHOTO ALBUMS", "DOCUMENTS\\Work"};
        QTest::newRow("events") << "EVENTS"
                                << QStringList{"EVENTS\\Birthdays", "EVENTS\\Vacations",
                                               "EVENTS\\Holidays"};
        QTest::newRow("sets take albums too")
            << "DOCUMENT SETS" << QStringList{"PHOTO ALBUMS\\Trips", "DOCUMENT SETS\\Taxes"};
    }

    void categoriesUnder()
    {
        QFETCH(QString, root);
        QFETCH(QStringList, paths);
        CCategoryList list = Defaults();
        list.AddCategory("Trips", "PHOTO ALBUMS", 0);
        list.AddCategory("Taxes", "DOCUMENT SETS", 0);
        list.AddCategory("Work", "DOCUMENTS", 0);
        QCOMPARE(Paths(list.GetCategoriesUnder(root.toStdString())), paths);
    }

    void recipeTree()
    {
        CTextTree tree;
        const CCategoryList list = Defaults();
        const CTreeSink::Handle root = BuildCategoryTree(tree, list, "RECIPES");
        QCOMPARE(root, CTreeSink::Handle(1));
        QCOMPARE(tree.Dump(),
                 QString("RECIPES\n  Appetizers\n    Salads\n    Soups\n  Entrees\n    Poultry\n"
                         "    Fish\n    Beef\n    Eggs\n    Vegetables\n  Deserts\n    Cakes\n"));
    }

    void treeRules_data()
    {
        QTest::addColumn<QStringList>("categories"); // name|parent|depth, in list order
        QTest::addColumn<QString>("tree");
        QTest::newRow("wrong depth is not shown")
            << QStringList{"A|EVENTS|1", "B|EVENTS\\A|3"} << "EVENTS\n  A\n";
        QTest::newRow("child listed before its parent")
            << QStringList{"B|EVENTS\\A|2", "A|EVENTS|1"} << "EVENTS\n  A\n    B\n";
        QTest::newRow("twins each get the children")
            << QStringList{"A|EVENTS|1", "A|EVENTS|1", "B|EVENTS\\A|2"}
            << "EVENTS\n  A\n    B\n  A\n    B\n";
        QTest::newRow("other roots are left out")
            << QStringList{"A|RECIPES|1", "B|EVENTS|1"} << "EVENTS\n  B\n";
        QTest::newRow("deep chain")
            << QStringList{"A|EVENTS|1", "B|EVENTS\\A|2", "C|EVENTS\\A\\B|3", "D|EVENTS\\A\\B\\C|4"}
            << "EVENTS\n  A\n    B\n      C\n        D\n";
    }

    void treeRules()
    {
        QFETCH(QStringList, categories);
        QFETCH(QString, tree);
        CCategoryList list;
        for (const QString& c : categories) {
            const QStringList f = c.split('|');
            list.Append(
                std::make_unique<CCategory>(f[0].toStdString(), f[1].toStdString(), f[2].toInt()));
        }
        CTextTree built;
        BuildCategoryTree(built, list, "EVENTS");
        QCOMPARE(built.Dump(), tree);
    }
};

QTEST_GUILESS_MAIN(TestCategories)
#include "tst_categories.moc"
