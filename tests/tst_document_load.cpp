// Loading folder trees and adding files: duplicates, sub-categories,
// archiving, skipped paths and a file system that changes under the load.

#include "catalog/progress.h"
#include "tests/support/command_fixture.h"
#include "views/document_loader.h"
#include "views/entry_ops.h"

#include <QFile>
#include <QtTest>

#include <unistd.h>

namespace {

std::vector<std::string> CategoriesOf(const CItemList& list)
{
    std::vector<std::string> categories;
    for (const auto& item : list)
        categories.push_back(item->GetCategoryPath());
    std::sort(categories.begin(), categories.end());
    return categories;
}

// Loads a folder below the fixture's root as "Select Folder" returns it.
bool Load(CCommandFixture& f, const std::string& folder, bool unique = false, bool archive = false)
{
    CEntryList out;
    f.ScriptLoad(f.Root() + "/" + folder, unique, archive);
    return CDocumentLoader(f.env).LoadDocuments(out, false);
}

// Deletes a file when the load reports its first step.
class VanishingProgress : public CProgress
{
public:
    explicit VanishingProgress(std::string path) : m_path(std::move(path)) {}
    void Advance(int64_t done) override
    {
        if (done == 0)
            ::unlink(m_path.c_str());
    }

private:
    std::string m_path;
};

} // namespace

class TestDocumentLoad : public QObject
{
    Q_OBJECT

private slots:
    void loadTwiceWithUniqueCheck();
    void picturesCountedWithoutUniqueCheck();
    void subCategoriesFromFolders();
    void newCategoryText();
    void archiveMirrorsSourceTree();
    void lineBreakPathsSkipped();
    void symbolicLinkLoop();
    void fileVanishingDuringLoad();
    void cancelledLoadChangesNothing();
    void duplicateRule_data();
    void duplicateRule();
    void rowsCarryRegisteredSequence();
    void addDocumentsFileKindsAndCaptions();
};

void TestDocumentLoad::loadTwiceWithUniqueCheck()
{
    CCommandFixture f;
    for (const char* name : {"src/a.txt", "src/b.doc", "src/c"})
        f.MakeFile(name);
    CDocumentLoader loader(f.env);
    CEntryList out;
    f.ScriptLoad(f.Root() + "/src", true);
    QVERIFY(loader.LoadDocuments(out, false));
    f.ScriptLoad(f.Root() + "/src", true);
    QVERIFY(loader.LoadDocuments(out, false));
    QCOMPARE(f.prompt.shown.size(), size_t(2));
    QCOMPARE(f.prompt.shown[0].text,
             std::string("Loaded 3 documents, found 0 duplicate documents."));
    QCOMPARE(f.prompt.shown[1].text,
             std::string("Loaded 0 documents, found 3 duplicate documents."));
    QCOMPARE(f.prompt.shown[1].caption, std::string("Load Document(s)"));
    QCOMPARE(f.prompt.shown[1].icon, CPrompt::Icon::Information);
    QCOMPARE(f.doc.GetDocuments().size(), size_t(3));
    QCOMPARE(out.size(), size_t(3));
}

void TestDocumentLoad::picturesCountedWithoutUniqueCheck()
{
    CCommandFixture f;
    for (const char* name : {"src/a.txt", "src/b.JPG", "src/c.png", "src/d.jpeg"})
        f.MakeFile(name);
    Load(f, "src");
    QCOMPARE(f.prompt.Only().text, std::string("Successfully loaded 4 documents."));
    QCOMPARE(f.doc.GetPictures().size(), size_t(2));
    QCOMPARE(f.doc.GetDocuments().size(), size_t(2));

    CCommandFixture g;
    for (const char* name : {"src/a.txt", "src/b.JPG"})
        g.MakeFile(name);
    CEntryList out;
    g.ScriptLoad(g.Root() + "/src", false);
    CDocumentLoader(g.env).LoadDocuments(out, true);
    QCOMPARE(g.prompt.Only().text, std::string("Successfully loaded 1 documents."));
    QCOMPARE(g.doc.GetDocuments().size(), size_t(0));
}

void TestDocumentLoad::subCategoriesFromFolders()
{
    CCommandFixture f;
    f.MakeFile("src/top.txt");
    f.MakeFile("src/2002/May/x.txt");
    f.doc.SetCurrentCategoryPath("DOCUMENTS\\Letters");
    Load(f, "src/"); // a trailing '/' changes nothing
    const std::vector<std::string> expected = {"DOCUMENTS\\Letters",
                                               "DOCUMENTS\\Letters\\2002\\May"};
    QCOMPARE(CategoriesOf(f.doc.GetDocuments()), expected);
    for (const auto& item : f.doc.GetDocuments())
        QCOMPARE(item->GetDocumentCategoryPath(), item->GetCategoryPath());
    QVERIFY(f.doc.GetCategories().Exists("Letters", "DOCUMENTS"));
    QVERIFY(f.doc.GetCategories().Exists("2002", "DOCUMENTS\\Letters"));
    QVERIFY(f.doc.GetCategories().Exists("May", "DOCUMENTS\\Letters\\2002"));
    const CCategory& may = f.doc.GetCategories().at(f.doc.GetCategories().size() - 1);
    QCOMPARE(may.GetName(), std::string("May"));
    QCOMPARE(may.GetDepth(), 3);

    CCommandFixture flat;
    flat.MakeFile("src/2002/May/x.txt");
    flat.prompt.selectFolder.push_back([&flat](CSelectFolderFields& fields) {
        fields.selectedFolder = flat.Root() + "/src";
        fields.createSubCategories = false;
        return true;
    });
    CEntryList out;
    CDocumentLoader(flat.env).LoadDocuments(out, false);
    QCOMPARE(CategoriesOf(flat.doc.GetDocuments()), std::vector<std::string>{"DOCUMENTS"});
}

void TestDocumentLoad::newCategoryText()
{
    CCommandFixture f;
    f.MakeFile("src/sub/a.txt");
    std::string shownCategory;
    f.prompt.selectFolder.push_back([&f, &shownCategory](CSelectFolderFields& fields) {
        shownCategory = fields.category;
        fields.selectedFolder = f.Root() + "/src";
        fields.newCategory = "Trip";
        fields.category = "DOCUMENTS\\Trip"; // as the dialog shows it
        fields.keyword1 = "beach";
        return true;
    });
    CEntryList out;
    CDocumentLoader(f.env).LoadDocuments(out, false);
    QCOMPARE(shownCategory, std::string("DOCUMENTS"));
    QCOMPARE(f.doc.GetDocuments().at(0)->GetCategoryPath(), std::string("DOCUMENTS\\Trip\\sub"));
    QCOMPARE(f.doc.GetDocuments().at(0)->GetKeyword1(), std::string("beach"));
    QVERIFY(f.doc.GetCategories().Exists("Trip", "DOCUMENTS"));
}

void TestDocumentLoad::archiveMirrorsSourceTree()
{
    CCommandFixture f;
    const std::string source = f.MakeFile("src/a.txt", "letter");
    Load(f, "src", false, true);
    Load(f, "src", false, true);
    const std::string folder = f.ArchiveRoot() + "/DOCUMENTS" + f.Root() + "/src/";
    const std::string first = folder + "a-" + CCommandFixture::kStamp + ".txt";
    const std::string second = folder + "a-" + CCommandFixture::kStamp + "-2.txt";
    QCOMPARE(f.doc.GetDocuments().size(), size_t(2));
    QCOMPARE(f.doc.GetDocuments().at(0)->GetPathname(), first);
    QCOMPARE(f.doc.GetDocuments().at(1)->GetPathname(), second);
    QCOMPARE(f.doc.GetDocuments().at(1)->GetOriginalPathname(), source);
    QFile copy(QString::fromStdString(second));
    QVERIFY(copy.open(QIODevice::ReadOnly));
    QCOMPARE(copy.readAll(), QByteArray("letter"));
    QCOMPARE(f.prompt.shown.back().text, std::string("Successfully loaded 1 documents."));
}

void TestDocumentLoad::lineBreakPathsSkipped()
{
    CCommandFixture f;
    f.MakeFile("src/ok.txt");
    f.MakeFile("src/bad\nname.txt");
    Load(f, "src");
    QCOMPARE(f.prompt.Only().text,
             "Successfully loaded 1 documents.\nSkipped 1 file(s) whose name holds a line "
             "break:\n" +
                 f.Root() + "/src/bad\\nname.txt");
    QCOMPARE(f.doc.GetDocuments().size(), size_t(1));

    CScriptedPrompt& prompt = f.prompt;
    prompt.shown.clear();
    prompt.documentFiles.push_back([&f](CDocumentFileFields& fields) {
        fields.files = {f.Root() + "/src/bad\nname.txt"};
        return true;
    });
    CEntryList out;
    QVERIFY(!CDocumentLoader(f.env).AddDocuments(out));
    QCOMPARE(prompt.Only().text, "Skipped 1 file(s) whose name holds a line break:\n" + f.Root() +
                                     "/src/bad\\nname.txt");
    QCOMPARE(prompt.Only().caption, std::string("Add Document(s)"));
    QCOMPARE(f.doc.GetDocuments().size(), size_t(1));
}

void TestDocumentLoad::symbolicLinkLoop()
{
    CCommandFixture f;
    f.MakeFile("src/a.txt");
    f.MakeFile("src/sub/b.txt");
    QVERIFY(::symlink((f.Root() + "/src").c_str(), (f.Root() + "/src/sub/loop").c_str()) == 0);
    QVERIFY(::symlink((f.Root() + "/self").c_str(), (f.Root() + "/self").c_str()) == 0);
    Load(f, "src");
    Load(f, "self");
    QCOMPARE(f.prompt.shown.at(0).text, std::string("Successfully loaded 2 documents."));
    QCOMPARE(f.prompt.shown.at(1).text, std::string("Successfully loaded 0 documents."));
}

void TestDocumentLoad::fileVanishingDuringLoad()
{
    CCommandFixture f;
    f.MakeFile("src/a.txt");
    f.MakeFile("src/b.txt");
    const std::string gone = f.MakeFile("src/c.txt");
    VanishingProgress progress(gone);
    f.env.SetProgress(&progress);
    Load(f, "src", false, true);
    QCOMPARE(f.prompt.shown.back().text, std::string("Successfully loaded 2 documents."));
    for (const auto& item : f.doc.GetDocuments())
        QVERIFY(item->GetOriginalPathname() != gone);
}

void TestDocumentLoad::cancelledLoadChangesNothing()
{
    CCommandFixture f;
    f.MakeFile("src/a.txt");
    CEntryList out;
    QVERIFY(!CDocumentLoader(f.env).LoadDocuments(out, false));
    QCOMPARE(f.prompt.dialogs, std::vector<std::string>{"Select Folder"});
    QVERIFY(f.prompt.shown.empty());
    QVERIFY(!f.env.Changed());
    f.ScriptLoad(std::string(), true); // OK without a folder reads nothing
    QVERIFY(CDocumentLoader(f.env).LoadDocuments(out, false));
    QCOMPARE(f.prompt.Only().text, std::string("Loaded 0 documents, found 0 duplicate documents."));
}

void TestDocumentLoad::duplicateRule_data()
{
    QTest::addColumn<QString>("file");
    QTest::addColumn<QString>("criteria"); // picture criteria: n(ame) c(reate) m(odify) s(ize)
    QTest::addColumn<QString>("differs");  // what the new entry changes
    QTest::addColumn<bool>("duplicate");

    const auto row = [](const char* name, const char* file, const char* criteria,
                        const char* differs, bool duplicate) {
        QTest::newRow(name) << file << criteria << differs << duplicate;
    };
    row("same document", "a.txt", "ns", "", true);
    row("document in another category", "a.txt", "ns", "category", false);
    row("document, other modify date", "a.txt", "ns", "modify", false);
    row("document, other create date", "a.txt", "", "create", false);
    row("picture, name and size, other create date", "a.jpg", "ns", "create", true);
    row("picture, name and size, other size", "a.jpg", "ns", "size", false);
    row("picture, modify only, other create date", "a.jpg", "m", "create", true);
    row("picture, create only, other modify date", "a.jpg", "c", "modify", true);
    row("picture, create only, other create date", "a.jpg", "c", "create", false);
    row("picture in another category", "a.jpg", "", "category", false);
    row("picture, name, other file", "a.JPG", "n", "name", false);
}

void TestDocumentLoad::duplicateRule()
{
    QFETCH(QString, file);
    QFETCH(QString, criteria);
    QFETCH(QString, differs);
    QFETCH(bool, duplicate);

    CCommandFixture f;
    CCatalogSettings& settings = f.doc.GetSettings();
    settings.compareFileName = criteria.contains('n');
    settings.compareFileCreateDate = criteria.contains('c');
    settings.compareFileModifyDate = criteria.contains('m');
    settings.compareFileSize = criteria.contains('s');
    CFileStatus status;
    status.createTime = CTime(1000);
    status.modifyTime = CTime(2000);
    status.size = 300;
    const std::string path = "/home/ann/" + file.toStdString();
    CDocumentItem existing(path, status);
    existing.SetCategoryPath("DOCUMENTS");
    if (CAppFolders::IsPictureFile(path) == 1)
        f.doc.AddPicture(std::make_shared<CPictureItem>(existing));
    else
        f.doc.AddDocument(std::make_shared<CDocumentItem>(existing));

    CDocumentItem candidate(path, status);
    candidate.SetCategoryPath("DOCUMENTS");
    if (differs == "category")
        candidate.SetCategoryPath("DOCUMENTS\\Letters");
    else if (differs == "create")
        candidate.SetFileCreateDate(CTime(1001));
    else if (differs == "modify")
        candidate.SetFileModifyDate(CTime(2001));
    else if (differs == "size")
        candidate.SetFileSize(301);
    else if (differs == "name")
        candidate.SetOriginalPathname("/home/ann/b.JPG");
    QCOMPARE(CDocumentLoader(f.env).FindDuplicate(candidate) != nullptr, duplicate);
}

void TestDocumentLoad::rowsCarryRegisteredSequence()
{
    CCommandFixture f;
    for (int i = 0; i < 3; ++i) {
        auto recipe = std::make_unique<CRecipeItem>();
        f.doc.RegisterItem(*recipe); // uses up sequence numbers 1 to 3
        f.doc.AddRecipe(std::move(recipe));
    }
    f.MakeFile("src/a.txt");
    f.MakeFile("src/b.png");
    CEntryList out;
    f.ScriptLoad(f.Root() + "/src", false);
    CDocumentLoader loader(f.env);
    loader.LoadDocuments(out, false);
    QCOMPARE(f.doc.LoadCounter(), 2);
    QCOMPARE(out.size(), size_t(2));
    CEntryOps entries(f.env);
    std::vector<int32_t> sequences;
    for (const auto& row : out) {
        sequences.push_back(row->GetSequenceNumber());
        const auto entry = entries.FindEntry(*row);
        QVERIFY(entry);
        QCOMPARE(entry->GetPathname(), row->GetPathname());
    }
    std::sort(sequences.begin(), sequences.end());
    QCOMPARE(sequences, (std::vector<int32_t>{4, 5}));
}

void TestDocumentLoad::addDocumentsFileKindsAndCaptions()
{
    CCommandFixture f;
    const std::string picture = f.MakeFile("in/holiday.JPG");
    const std::string archive = f.MakeFile("in/archive.tar.gz");
    const std::string plain = f.MakeFile("in/my.folder/readme");
    f.doc.SetCurrentCategoryPath("DOCUMENTS\\Letters");
    CDocumentFileFields shown;
    f.prompt.documentFiles.push_back([&](CDocumentFileFields& fields) {
        shown = fields;
        fields.files = {picture, archive, plain};
        return true;
    });
    CEntryList out;
    QVERIFY(CDocumentLoader(f.env).AddDocuments(out));
    QCOMPARE(shown.title, std::string("Document Filename"));
    QCOMPARE(shown.filter, std::string("Document Files (*.*)|*.*||"));
    QCOMPARE(shown.category, std::string("DOCUMENTS\\Letters"));
    QCOMPARE(f.doc.GetPictures().size(), size_t(1));
    QCOMPARE(f.doc.GetPictures().at(0)->GetLabel(), std::string("holiday"));
    QCOMPARE(f.doc.GetDocuments().size(), size_t(2));
    QCOMPARE(f.doc.GetDocuments().at(0)->GetLabel(), std::string("archive.ta"));
    QCOMPARE(f.doc.GetDocuments().at(1)->GetLabel(), std::string("re"));
    QCOMPARE(f.doc.GetDocuments().at(1)->GetDocumentCategoryPath(),
             std::string("DOCUMENTS\\Letters"));

    f.prompt.documentFiles.push_back([&](CDocumentFileFields& fields) {
        fields.files = {archive};
        fields.caption = "A caption of more than twenty-three bytes";
        fields.archive = true;
        return true;
    });
    QVERIFY(CDocumentLoader(f.env).AddDocuments(out));
    const std::string copy = f.ArchiveRoot() + "/DOCUMENTS/Letters" + f.Root() +
                             "/in/archive.tar-" + CCommandFixture::kStamp + ".gz";
    QCOMPARE(f.doc.GetDocuments().at(2)->GetLabel(), std::string("A caption of more than "));
    QCOMPARE(f.doc.GetDocuments().at(2)->GetPathname(), copy);
    QCOMPARE(f.doc.GetDocuments().at(2)->GetOriginalPathname(), archive);
    QCOMPARE(f.prompt.Only().text, "Archive picture file to:\r" + copy);
    QCOMPARE(f.prompt.Only().caption, std::string("Archive File"));

    // A name without a dot has no archive name: the copy fails and nothing is added.
    f.prompt.shown.clear();
    f.prompt.documentFiles.push_back([&](CDocumentFileFields& fields) {
        fields.files = {plain};
        fields.archive = true;
        return true;
    });
    QVERIFY(!CDocumentLoader(f.env).AddDocuments(out));
    QCOMPARE(f.prompt.Only().text,
             "The file could not be located! Failed in copying file " + plain + " to ");
    QCOMPARE(f.prompt.Only().icon, CPrompt::Icon::Stop);
    QCOMPARE(f.doc.GetDocuments().size(), size_t(3));
}

QTEST_GUILESS_MAIN(TestDocumentLoad)
#include "tst_document_load.moc"
