// The document handler end to end: command numbers on the list state, the
// dialogs scripted, the texts and captions shown checked.

#include "tests/support/command_fixture.h"
#include "views/data_list_state.h"
#include "views/entry_ops.h"
#include "views/list_commands.h"
#include "views/services.h"

#include <QFile>
#include <QtTest>

#include <set>

namespace {

class RecordingMail : public CMailService
{
public:
    bool IsAvailable() const override { return true; }
    bool SendDocuments(const std::vector<CMailAttachment>& list) override
    {
        attachments = list;
        return true;
    }
    std::vector<CMailAttachment> attachments;
};

// A catalog with the list state and its commands on the "Managed Documents" tab.
struct Fixture : CCommandFixture
{
    Fixture() : state(doc), commands(state, env) { state.SetTab(TabKind::ManagedDocuments); }

    // Loads the files (relative paths) through the load command.
    void Load(const std::vector<std::string>& files, bool archive = false)
    {
        for (const std::string& file : files)
            MakeFile("src/" + file, file);
        ScriptLoad(Root() + "/src", false, archive);
        commands.OnCommand(kCmdLoad);
        prompt.shown.clear();
        state.SwitchSubCategories();
    }
    bool Exists(const std::string& path) const
    {
        return QFile::exists(QString::fromStdString(path));
    }

    CDataListState state;
    CListCommands commands;
};

} // namespace

class TestDocumentCommands : public QObject
{
    Q_OBJECT

private slots:
    void refusals_data();
    void refusals();
    void commandResults();
    void deleteAfterSelectAll();
    void editRewritesRow();
    void moveArchivedFileAlong();
    void cancelledSetKeepsMembers();
    void confirmedSetSharesMembers();
    void addToSetWithoutChoice();
    void addFromDocumentsTab();
    void mail();
};

void TestDocumentCommands::refusals_data()
{
    QTest::addColumn<TabKind>("tab");
    QTest::addColumn<int>("command");
    QTest::addColumn<QString>("text");
    QTest::addColumn<QString>("caption");
    const auto row = [](const char* name, TabKind tab, int command, const char* text,
                        const char* caption) {
        QTest::newRow(name) << tab << command << text << caption;
    };
    const TabKind files = TabKind::Documents, managed = TabKind::ManagedDocuments;
    const char* none = "No item has been selected!";
    row("load in Documents", files, kCmdLoad, "Unable to load documents from this tab!",
        "Load Document(s)");
    row("delete in Documents", files, kCmdDelete, "Unable to delete documents from this tab!",
        "Delete Document(s)");
    row("edit in Documents", files, kCmdEdit, "Unable to move documents from this tab!",
        "Edit Document(s)");
    row("move in Documents", files, kCmdMove, "Unable to load documents from this tab!",
        "Load Document(s)");
    row("mail in Documents, none selected", files, kCmdMail, none, "Selected Document");
    row("delete, none selected", managed, kCmdDelete, none, "Delete Document(s)");
    row("edit, none selected", managed, kCmdEdit, none, "Edit Document(s)");
    row("mail, none selected", managed, kCmdMail, none, "Selected Document");
    row("move, none selected", managed, kCmdMove, none, "Selected Document");
    row("add to set, none selected", managed, kCmdAddToSet, none, "Selected Document");
}

void TestDocumentCommands::refusals()
{
    QFETCH(TabKind, tab);
    QFETCH(int, command);
    QFETCH(QString, text);
    QFETCH(QString, caption);

    Fixture f;
    f.Load({"a.txt"});
    f.state.SetTab(tab);
    QCOMPARE(f.commands.OnCommand(command), 1);
    QCOMPARE(f.prompt.Only().text, text.toStdString());
    QCOMPARE(f.prompt.Only().caption, caption.toStdString());
    QCOMPARE(f.prompt.Only().icon, CPrompt::Icon::Stop);
    QVERIFY(f.prompt.dialogs.size() == 1); // only the load's "Select Folder"
    QCOMPARE(f.doc.GetDocuments().size(), size_t(1));
}

void TestDocumentCommands::commandResults()
{
    Fixture f;
    QCOMPARE(f.commands.OnCommand(1399), 0);
    QCOMPARE(f.commands.OnCommand(1400), 1);
    QCOMPARE(f.commands.OnCommand(kCmdCreateSet), 1); // nothing selected: nothing happens
    f.state.SetTab(TabKind::PersonalInformation);
    QCOMPARE(f.commands.OnCommand(kCmdDelete), 0);
    QVERIFY(f.prompt.shown.empty());
    QVERIFY(f.prompt.dialogs.empty());
}

void TestDocumentCommands::deleteAfterSelectAll()
{
    Fixture f;
    f.Load({"a.txt", "b.jpg", "sub/c.doc"});
    QCOMPARE(f.state.Rows(TabKind::ManagedDocuments).size(), size_t(3));
    f.commands.OnCommand(kCmdSelectAll);
    f.commands.OnCommand(kCmdDelete);
    QVERIFY(f.prompt.shown.empty());
    QCOMPARE(f.doc.GetDocuments().size(), size_t(0));
    QCOMPARE(f.doc.GetPictures().size(), size_t(0));
    QCOMPARE(f.state.Rows(TabKind::ManagedDocuments).size(), size_t(0));
    QVERIFY(f.Exists(f.Root() + "/src/b.jpg"));
    QVERIFY(f.Exists(f.Root() + "/src/sub/c.doc"));
}

void TestDocumentCommands::editRewritesRow()
{
    Fixture f;
    f.Load({"a.txt", "b.txt"});
    CRowList& rows = f.state.Rows(TabKind::ManagedDocuments);
    const size_t row = rows.Find(kDocLocation, f.Root() + "/src/b.txt");
    rows.at(row).selected = true;
    CEntryEditFields shown;
    f.prompt.editDocumentEntry.push_back([&shown](CEntryEditFields& fields) {
        shown = fields;
        fields.label = "Letter to Ann";
        fields.keyword1 = "family";
        return true;
    });
    f.commands.OnCommand(kCmdEdit);
    QCOMPARE(shown.label, std::string("b"));
    QCOMPARE(shown.pathname, f.Root() + "/src/b.txt");
    QCOMPARE(rows.at(row).cells[kDocCaption], std::string("Letter to Ann"));
    QCOMPARE(rows.at(1 - row).cells[kDocCaption], std::string("a"));
    const auto entry = CEntryOps(f.env).FindEntry(*f.state.SelectedDocuments().at(0));
    QCOMPARE(entry->GetLabel(), std::string("Letter to Ann"));
    QCOMPARE(entry->GetKeyword1(), std::string("family"));
    QCOMPARE(entry->GetPathname(), f.Root() + "/src/b.txt");
}

void TestDocumentCommands::moveArchivedFileAlong()
{
    Fixture f;
    f.Load({"a.txt"}, true);
    const std::string outside = f.MakeFile("other/b.txt");
    f.prompt.documentFiles.push_back([&](CDocumentFileFields& fields) {
        fields.files = {outside};
        return true;
    });
    f.commands.OnCommand(kCmdAdd);
    f.state.SwitchSubCategories();
    f.state.SwitchSubCategories();
    // Something with the archived file's name already waits in the new folder.
    const std::string name = std::string("a-") + CCommandFixture::kStamp + ".txt";
    const std::string taken = f.MakeFile("home/Archive/DOCUMENTS/Taxes/" + name, "older");
    const std::string archived = f.doc.GetDocuments().at(0)->GetPathname();
    QVERIFY(f.Exists(archived));

    f.commands.OnCommand(kCmdSelectAll);
    CCategoryChooserFields shown;
    f.prompt.chooseCategory.push_back([&shown](CCategoryChooserFields& fields) {
        shown = fields;
        fields.category = "DOCUMENTS\\Taxes";
        return true;
    });
    f.commands.OnCommand(kCmdMove);
    QCOMPARE(shown.caption, std::string("Destination Category"));
    QCOMPARE(shown.roots, std::vector<std::string>{"DOCUMENTS"});
    const auto& moved = f.doc.GetDocuments().at(0);
    const auto& kept = f.doc.GetDocuments().at(1);
    const std::string expected =
        f.ArchiveRoot() + "/DOCUMENTS/Taxes/a-" + CCommandFixture::kStamp + "-2.txt";
    QCOMPARE(moved->GetCategoryPath(), std::string("DOCUMENTS\\Taxes"));
    QCOMPARE(moved->GetDocumentCategoryPath(), std::string("DOCUMENTS\\Taxes"));
    QCOMPARE(moved->GetPathname(), expected);
    QVERIFY(f.Exists(expected));
    QVERIFY(!f.Exists(archived));
    QFile older(QString::fromStdString(taken));
    QVERIFY(older.open(QIODevice::ReadOnly));
    QCOMPARE(older.readAll(), QByteArray("older"));
    QCOMPARE(kept->GetCategoryPath(), std::string("DOCUMENTS\\Taxes"));
    QCOMPARE(kept->GetPathname(), outside);
    QVERIFY(f.prompt.shown.empty());
}

void TestDocumentCommands::cancelledSetKeepsMembers()
{
    Fixture f;
    f.Load({"a.txt", "b.png"});
    f.commands.OnCommand(kCmdSelectAll);
    f.commands.OnCommand(kCmdCreateSet); // the set dialog is cancelled
    QCOMPARE(f.prompt.dialogs.back(), std::string("Document Sets"));
    QCOMPARE(f.doc.GetDocumentSets().size(), size_t(0));
    QCOMPARE(f.doc.GetDocuments().size(), size_t(2));
    QCOMPARE(f.doc.GetPictures().size(), size_t(2));
    QCOMPARE(f.doc.GetDocuments().at(1)->GetCategoryPath(),
             std::string("DOCUMENTS\\DOCUMENT SETS"));
    QCOMPARE(f.doc.GetPictures().at(1)->GetCategoryPath(), std::string("DOCUMENTS\\DOCUMENT SETS"));
}

void TestDocumentCommands::confirmedSetSharesMembers()
{
    Fixture f;
    f.Load({"a.txt", "b.png"});
    f.commands.OnCommand(kCmdSelectAll);
    f.prompt.editDocumentSet.push_back([](CDocumentSetFields&) { return true; });
    f.prompt.editDocumentSet.push_back([](CDocumentSetFields& fields) {
        fields.label = "Taxes 2003";
        return true;
    });
    f.commands.OnCommand(kCmdCreateSet);
    QCOMPARE(f.prompt.Only().text,
             std::string("The label  edit box cannot be empty, please update the box!"));
    QCOMPARE(f.prompt.Only().caption, std::string("Doc Set Dialog"));
    QCOMPARE(f.doc.GetDocumentSets().size(), size_t(1));
    const CDocumentSet& set = *f.doc.GetDocumentSets().at(0);
    QCOMPARE(set.GetName(), std::string("Taxes 2003"));
    QCOMPARE(set.GetCategoryPath(), std::string("DOCUMENT SETS"));
    QCOMPARE(set.GetMembers().size(), size_t(2));
    // Each member is the catalog's new entry itself.
    const std::set<const CDocumentItem*> members = {set.GetMembers().at(0).get(),
                                                    set.GetMembers().at(1).get()};
    const std::set<const CDocumentItem*> added = {f.doc.GetPictures().at(1).get(),
                                                  f.doc.GetDocuments().at(1).get()};
    QCOMPARE(members, added);
    QCOMPARE(set.GetMembers().at(1)->GetRefCount(), 2);
    QCOMPARE(f.doc.GetCurrentCategoryPath(), std::string("DOCUMENT SETS"));
}

void TestDocumentCommands::addToSetWithoutChoice()
{
    Fixture f;
    f.Load({"a.txt"});
    auto set = std::make_unique<CDocumentSet>();
    set->SetLabel("Taxes");
    f.doc.RegisterItem(*set);
    const int32_t sequence = set->GetSequenceNumber();
    f.doc.AddDocumentSet(std::move(set));
    f.commands.OnCommand(kCmdSelectAll);
    size_t offered = 0;
    f.prompt.updateDocumentSet.push_back([&offered](CUpdateDocumentSetFields& fields) {
        offered = fields.sets.size();
        return true; // OK without a set chosen
    });
    f.commands.OnCommand(kCmdAddToSet);
    QCOMPARE(offered, size_t(1));
    QCOMPARE(f.doc.GetDocuments().size(), size_t(1));
    QCOMPARE(f.doc.GetDocumentSets().at(0)->GetMembers().size(), size_t(0));

    f.prompt.updateDocumentSet.push_back([sequence](CUpdateDocumentSetFields& fields) {
        fields.chosenSequence = sequence;
        return true;
    });
    f.commands.OnCommand(kCmdAddToSet);
    QCOMPARE(f.doc.GetDocuments().size(), size_t(2));
    QCOMPARE(f.doc.GetDocumentSets().at(0)->GetMembers().size(), size_t(1));
}

void TestDocumentCommands::addFromDocumentsTab()
{
    Fixture f;
    f.MakeFile("folder/photo.gif");
    f.MakeFile("folder/note.txt");
    f.MakeFolder("folder/inner");
    f.state.SetCurrentFolder(f.Root() + "/folder");
    f.state.SetTab(TabKind::Documents);
    CRowList& rows = f.state.Rows(TabKind::Documents);
    QCOMPARE(rows.size(), size_t(2));
    QCOMPARE(rows.at(0).cells[kDocCategory], std::string("<File System>"));
    QCOMPARE(f.state.GetCategoryBoxText(), f.Root() + "/folder");
    f.commands.OnCommand(kCmdSelectAll);
    f.prompt.manageFiles.push_back([](CManageFilesFields& fields) {
        fields.category = "DOCUMENTS\\Letters";
        fields.keyword1 = "k1";
        return true;
    });
    f.commands.OnCommand(kCmdAdd);
    QCOMPARE(f.prompt.dialogs, std::vector<std::string>{"Manage Files Dialog"});
    QCOMPARE(f.doc.GetPictures().size(), size_t(1)); // a picture file is a picture
    QCOMPARE(f.doc.GetDocuments().size(), size_t(1));
    QCOMPARE(f.doc.GetPictures().at(0)->GetCategoryPath(), std::string("DOCUMENTS\\Letters"));
    QCOMPARE(f.doc.GetDocuments().at(0)->GetKeyword1(), std::string("k1"));
    QCOMPARE(f.doc.GetDocuments().at(0)->GetManagedFlag(), 1);
}

void TestDocumentCommands::mail()
{
    Fixture f;
    f.Load({"a.txt", "b.txt"});
    f.commands.OnCommand(kCmdSelectAll);
    f.commands.OnCommand(kCmdMail);
    QCOMPARE(f.prompt.Only().text,
             std::string("Error! The mail system is not available - could not find xdg-email"));
    QCOMPARE(f.prompt.Only().caption, std::string("Send Documents"));
    RecordingMail mail;
    f.env.SetMail(&mail);
    f.commands.OnCommand(kCmdMail);
    QCOMPARE(mail.attachments.size(), size_t(2));
    const size_t b = mail.attachments[0].name == "b.txt" ? 0 : 1;
    QCOMPARE(mail.attachments[b].path, f.Root() + "/src/b.txt");
    QCOMPARE(mail.attachments[b].name, std::string("b.txt"));
    QCOMPARE(mail.attachments[1 - b].name, std::string("a.txt"));
}

QTEST_GUILESS_MAIN(TestDocumentCommands)
#include "tst_document_commands.moc"
