// The data item handler and the category commands end to end.

#include "tests/support/command_fixture.h"
#include "views/data_list_state.h"
#include "views/list_commands.h"

#include <QtTest>

namespace {

struct Fixture : CCommandFixture
{
    Fixture() : state(doc), commands(state, env) { doc.GetCategories().AddDefaultCategories(); }

    // Adds an event through the add command, as the "Event" dialog returns it.
    void AddEvent(const std::string& name, const std::string& keyword)
    {
        state.SetTab(TabKind::Events);
        prompt.editEvent.push_back([name, keyword](CEventFields& fields) {
            fields.eventName = name;
            fields.keyword1 = keyword;
            return true;
        });
        commands.OnCommand(kCmdAdd);
    }

    CDataListState state;
    CListCommands commands;
};

} // namespace

class TestDataItems : public QObject
{
    Q_OBJECT

private slots:
    void addEventShowsRow();
    void recipeNeedsDish();
    void deleteAndMoveNeedSelection_data();
    void deleteAndMoveNeedSelection();
    void editDeleteMoveSelected();
    void previewPaneAddsPendingItem();
    void newCategory_data();
    void newCategory();
    void removeCategory_data();
    void removeCategory();
};

void TestDataItems::addEventShowsRow()
{
    Fixture f;
    f.state.SetTab(TabKind::Events); // EVENTS is now the current category
    f.state.SelectCategory("EVENTS\\Birthdays");
    f.prompt.editEvent.push_back([](CEventFields& fields) {
        fields.eventName = "Ann's birthday";
        fields.keyword1 = "cake";
        fields.attendees = {CAttendee("Ann"), CAttendee("Bob")};
        return true;
    });
    f.commands.OnCommand(kCmdAdd);
    QCOMPARE(f.doc.GetEvents().size(), size_t(1));
    const CEventItem& event = *f.doc.GetEvents().at(0);
    QCOMPARE(event.GetCategoryPath(), std::string("EVENTS\\Birthdays"));
    QCOMPARE(event.GetAttendees().size(), size_t(2));
    const CRowList& rows = f.state.Rows(TabKind::Events);
    QCOMPARE(rows.size(), size_t(1));
    const std::vector<std::string> cells = {"Ann's birthday",
                                            "EVENTS\\Birthdays",
                                            "cake",
                                            "EVENT",
                                            FormatListDate(event.GetCreateDate()),
                                            "        1"};
    QCOMPARE(rows.at(0).cells, cells);
    QVERIFY(f.env.Changed());
}

void TestDataItems::recipeNeedsDish()
{
    Fixture f;
    f.state.SetTab(TabKind::Recipes);
    f.prompt.editRecipe.push_back([](CRecipeFields& fields) {
        fields.author = "Ann";
        return true;
    });
    f.prompt.editRecipe.push_back([](CRecipeFields& fields) {
        fields.dish = "Stew";
        fields.ingredients = {CIngredient("1/2", "cups", "flour")};
        return true;
    });
    f.commands.OnCommand(kCmdAdd);
    QCOMPARE(f.prompt.Only().text, std::string("Unable to save recipe without a Dish name!"));
    QCOMPARE(f.prompt.Only().caption, std::string("Save Recipe"));
    QCOMPARE(f.doc.GetRecipes().size(), size_t(1));
    QCOMPARE(f.doc.GetRecipes().at(0)->GetName(), std::string("Stew"));
    QCOMPARE(f.doc.GetRecipes().at(0)->GetAuthor(), std::string("Ann"));
    QCOMPARE(f.state.Rows(TabKind::Recipes).at(0).cells.front(), std::string("Stew"));

    f.commands.OnCommand(kCmdAdd); // cancelled
    QCOMPARE(f.doc.GetRecipes().size(), size_t(1));
}

void TestDataItems::deleteAndMoveNeedSelection_data()
{
    QTest::addColumn<int>("command");
    QTest::addColumn<QString>("caption");
    QTest::newRow("delete") << int(kCmdDelete) << "Selected Document";
    QTest::newRow("edit") << int(kCmdEdit) << "Selected Document";
    QTest::newRow("mail") << int(kCmdMail) << "Selected Document";
    QTest::newRow("move") << int(kCmdMove) << "Selected Data Item";
}

void TestDataItems::deleteAndMoveNeedSelection()
{
    QFETCH(int, command);
    QFETCH(QString, caption);
    Fixture f;
    f.AddEvent("Picnic", "park");
    f.commands.OnCommand(command);
    QCOMPARE(f.prompt.Only().text, std::string("No item has been selected!"));
    QCOMPARE(f.prompt.Only().caption, caption.toStdString());
    QCOMPARE(f.prompt.Only().icon, CPrompt::Icon::Stop);
    QCOMPARE(f.doc.GetEvents().size(), size_t(1));
}

void TestDataItems::editDeleteMoveSelected()
{
    Fixture f;
    f.AddEvent("Picnic", "park");
    f.AddEvent("Wedding", "church");
    CRowList& rows = f.state.Rows(TabKind::Events);
    rows.at(rows.Find(kItemName, "Picnic")).selected = true;
    f.doc.GetCurrentItems().eventSequence = 1;
    f.commands.OnCommand(kCmdDelete);
    QCOMPARE(f.doc.GetEvents().size(), size_t(1));
    QCOMPARE(f.doc.GetEvents().at(0)->GetEventName(), std::string("Wedding"));
    QCOMPARE(rows.size(), size_t(1));
    QCOMPARE(f.doc.GetCurrentItems().eventSequence, 0);

    f.commands.OnCommand(kCmdSelectAll);
    bool editable = true;
    f.prompt.editEvent.push_back([&editable](CEventFields& fields) {
        editable = fields.nameEditable;
        fields.eventName = "Renamed";
        fields.keyword1 = "lake";
        return true;
    });
    f.commands.OnCommand(kCmdEdit);
    QVERIFY(!editable);
    QCOMPARE(f.doc.GetEvents().at(0)->GetEventName(), std::string("Wedding"));
    QCOMPARE(rows.at(0).cells[kItemKeyword], std::string("lake"));

    std::vector<std::string> roots;
    f.prompt.chooseCategory.push_back([&roots](CCategoryChooserFields& fields) {
        roots = fields.roots;
        fields.category = "EVENTS\\Holidays";
        return true;
    });
    f.commands.OnCommand(kCmdMove);
    QCOMPARE(roots, std::vector<std::string>{"EVENTS"});
    QCOMPARE(f.doc.GetEvents().at(0)->GetCategoryPath(), std::string("EVENTS\\Holidays"));
    QCOMPARE(rows.at(0).cells[kItemCategory], std::string("EVENTS\\Holidays"));
}

void TestDataItems::previewPaneAddsPendingItem()
{
    Fixture f;
    f.state.SetPreviewOn(true);
    f.state.SetTab(TabKind::DocumentSets);
    f.commands.OnCommand(kCmdAdd);
    QVERIFY(f.prompt.dialogs.empty());
    QVERIFY(f.doc.GetDocumentSets().empty());
    CCurrentItems& current = f.doc.GetCurrentItems();
    QVERIFY(current.pending);
    static_cast<CDocumentSet&>(*current.pending).SetLabel("Trip");
    QVERIFY(f.commands.DataItems().CommitPendingItem());
    QCOMPARE(f.doc.GetDocumentSets().size(), size_t(1));
    QCOMPARE(current.documentSetSequence, f.doc.GetDocumentSets().at(0)->GetSequenceNumber());
    QCOMPARE(f.state.Rows(TabKind::DocumentSets).size(), size_t(1));
}

void TestDataItems::newCategory_data()
{
    QTest::addColumn<QString>("selected");
    QTest::addColumn<int>("depth");
    QTest::newRow("below a root") << "DOCUMENTS" << 1;
    QTest::newRow("below a sub-category") << "DOCUMENTS\\Letters" << 2;
}

void TestDataItems::newCategory()
{
    QFETCH(QString, selected);
    QFETCH(int, depth);
    Fixture f;
    f.state.SetTab(TabKind::ManagedDocuments);
    f.state.SelectCategory(selected.toStdString());
    f.prompt.newCategory.push_back([](CNewCategoryFields& fields) {
        fields.name = "Taxes";
        return true;
    });
    f.commands.OnCommand(kCmdNewCategory);
    const CCategory& added = f.doc.GetCategories().at(f.doc.GetCategories().size() - 1);
    QCOMPARE(added.GetName(), std::string("Taxes"));
    QCOMPARE(added.GetParentPath(), selected.toStdString());
    QCOMPARE(added.GetDepth(), depth);
    QCOMPARE(f.state.GetSelectedCategory(), selected.toStdString() + "\\Taxes");
    QCOMPARE(f.state.GetCategoryBoxText(), selected.toStdString() + "\\Taxes");
}

void TestDataItems::removeCategory_data()
{
    QTest::addColumn<QString>("path");
    QTest::addColumn<bool>("yes");
    QTest::addColumn<QString>("message");
    QTest::addColumn<int>("removed");
    QTest::newRow("root") << "RECIPES" << true << "Unable to remove root Category RECIPES!" << 0;
    QTest::newRow("answer no") << "RECIPES\\Entrees" << false << "" << 0;
    QTest::newRow("only the record")
        << "RECIPES\\Entrees" << true << "Category RECIPES\\Entrees has been removed!" << 1;
    QTest::newRow("no such record")
        << "RECIPES\\Nothing" << true << "Category RECIPES\\Nothing has been removed!" << 0;
}

void TestDataItems::removeCategory()
{
    QFETCH(QString, path);
    QFETCH(bool, yes);
    QFETCH(QString, message);
    QFETCH(int, removed);
    Fixture f;
    f.state.SetTab(TabKind::Recipes);
    f.state.SelectCategory(path.toStdString());
    const size_t before = f.doc.GetCategories().size();
    f.prompt.QueueAnswer(yes ? CPrompt::Answer::Yes : CPrompt::Answer::No);
    f.commands.OnCommand(kCmdRemoveCategory);
    QCOMPARE(f.prompt.shown.at(0).text,
             "Are you sure you wish to remove Category " + path.toStdString() + "?");
    QCOMPARE(f.prompt.shown.at(0).buttons, CPrompt::Buttons::YesNo);
    QCOMPARE(f.prompt.shown.size(), size_t(message.isEmpty() ? 1 : 2));
    if (!message.isEmpty()) {
        QCOMPARE(f.prompt.shown.at(1).text, message.toStdString());
        QCOMPARE(f.prompt.shown.at(1).caption, std::string("Remove Category"));
    }
    QCOMPARE(f.doc.GetCategories().size(), before - removed);
    QVERIFY(f.doc.GetCategories().Exists("Fish", "RECIPES\\Entrees")); // sub-categories stay
}

QTEST_GUILESS_MAIN(TestDataItems)
#include "tst_data_items.moc"
