// The catalog data file: every format version read from hand-written
// fixtures, the reading rules, damaged files, and saving that never loses
// the previous catalog.

#include "catalog/archive.h"
#include "catalog/catalog_json.h"
#include "tests/support/catalog_fixture.h"
#include "tests/support/expectations.h"
#include "tests/support/hex_fixture.h"

#include <QDir>
#include <QFile>
#include <QtTest>

#include <csignal>
#include <sys/resource.h>

namespace {

const std::string kReadData = "Read Data";

QStringList Leftovers(const std::string& folder)
{
    return QDir(QString::fromStdString(folder)).entryList({"*.new*"}, QDir::Files | QDir::Hidden);
}

// Small hand-written headers for the damaged-file cases.
QByteArray FormatOneHeader()
{
    return ParseHexFixture("01 00 00 00  00 00 00 3F 00 00 00 00  00 00 00 00 00 00 00 00"
                           "  00 00 00 00");
}

} // namespace

class TestCatalogFile : public QObject
{
    Q_OBJECT

private slots:
    void readsEveryFormat_data()
    {
        QTest::addColumn<int>("version");
        for (int version = 1; version <= 6; ++version)
            QTest::newRow(qPrintable(QString("format %1").arg(version))) << version;
    }

    void readsEveryFormat()
    {
        QFETCH(int, version);
        CCatalogFixture f;
        f.WriteDataFile(LoadHexFixture(QString("catalog/v%1.hex").arg(version)));
        const qint64 start = CTime::GetCurrentTime().GetTime();
        const auto doc = f.Open();
        QVERIFY(doc);
        const QStringList failures = CheckExpectations(
            DumpCatalog(*doc), QString(HB_TEST_DATA "/catalog/v%1.expected").arg(version), start);
        QVERIFY2(failures.isEmpty(), qPrintable(failures.join('\n')));
        QVERIFY(f.prompt.shown.empty());
    }

    void readingRules()
    {
        CCatalogFixture f;
        f.WriteDataFile(LoadHexFixture("catalog/v6.hex"));
        auto doc = f.Open();
        QVERIFY(doc);
        QCOMPARE(doc->GetSequenceCounter(), 7);
        // Pictures are read before the settings, so they keep the default.
        QCOMPARE(static_cast<const CPictureItem&>(*doc->GetPictures().at(0)).GetDisplayCaption(),
                 1);
        // The views' colour waits for the preferences to be confirmed.
        QCOMPARE(doc->GetBackgroundColor(), 0xD0C0C0u);
        QVERIFY(doc->GetDocumentSets().at(0)->IsAlbum());
        QVERIFY(!doc->GetDocumentSets().at(1)->IsAlbum());

        f.WriteDataFile(LoadHexFixture("catalog/v5.hex"));
        doc = f.Open();
        QVERIFY(doc);
        // Album flag 0: a plain set that keeps the album's members.
        QVERIFY(!doc->GetDocumentSets().at(0)->IsAlbum());
        QCOMPARE(doc->GetDocumentSets().at(0)->GetMembers().at(0)->GetRefCount(), 1);
        // The next save stores the raised counter.
        QVERIFY(doc->SaveCatalog(false));
        const auto again = f.Open();
        QCOMPARE(again->GetDocumentNumberCounter(), 11);
        QCOMPARE(again->GetPictures().at(0)->GetDocumentNumber(), 11);

        f.WriteDataFile(LoadHexFixture("catalog/v3.hex"));
        QVERIFY(f.Open()->GetDocumentSets().at(0)->IsAlbum());
    }

    void writingGivesBackTheFileByteForByte()
    {
        CCatalogFixture f;
        const QByteArray fixture = LoadHexFixture("catalog/v6.hex");
        f.WriteDataFile(fixture);
        const auto doc = f.Open();
        QVERIFY(doc);
        QVERIFY(doc->SaveCatalog(false));
        QCOMPARE(f.ReadDataFile(), fixture);
        QVERIFY(f.prompt.shown.empty());
    }

    void newerFormatReadsLikeSix()
    {
        CCatalogFixture f;
        QByteArray bytes = LoadHexFixture("catalog/v6.hex");
        bytes[0] = 7;
        f.WriteDataFile(bytes);
        const auto doc = f.Open();
        QVERIFY(doc);
        QCOMPARE(doc->GetFormatVersion(), 7);
        QCOMPARE(doc->GetPictures().at(0)->GetIntE(), 5);
        QVERIFY(doc->SaveCatalog(false));
        QCOMPARE(f.ReadDataFile(), LoadHexFixture("catalog/v6.hex"));
    }

    void bytesAfterTheSettingsAreIgnored()
    {
        CCatalogFixture f;
        f.WriteDataFile(LoadHexFixture("catalog/v6.hex") + QByteArray(5000, 'x'));
        const auto doc = f.Open();
        QVERIFY(doc);
        QCOMPARE(doc->GetEvents().size(), size_t(1));
        QCOMPARE(doc->GetSettings().colorScheme, 1);
    }

    void truncatedAnywhereIsAnErrorNotACrash()
    {
        CCatalogFixture f;
        const QByteArray full = LoadHexFixture("catalog/v6.hex");
        for (int length = 0; length < full.size(); ++length) {
            f.WriteDataFile(full.left(length));
            f.prompt.shown.clear();
            auto doc = f.NewDoc();
            if (doc->OpenCatalog(false))
                QFAIL(qPrintable(QString("a file cut at %1 bytes was read").arg(length)));
            QCOMPARE(f.prompt.shown.size(), size_t(1));
            QCOMPARE(f.prompt.shown[0].caption, kReadData);
            QVERIFY(f.prompt.shown[0].text.rfind("Unable to read " + f.DataFile() + " file!", 0) ==
                    0);
            QVERIFY(doc->GetPictures().empty() && doc->GetCategories().empty());
        }
    }

    void absurdCountsAndLengths_data()
    {
        QTest::addColumn<QByteArray>("bytes");
        QTest::addColumn<QString>("reason");
        const QByteArray one = FormatOneHeader();
        QTest::newRow("format 0") << ParseHexFixture("00 00 00 00") << "format version 0";
        QTest::newRow("negative format") << ParseHexFixture("FE FF FF FF") << "format version -2";
        QTest::newRow("negative picture count")
            << one + ParseHexFixture("FF FF FF FF") << "picture count of -1";
        QTest::newRow("two billion pictures")
            << one + ParseHexFixture("FF FF FF 7F") + QByteArray(100, '\n')
            << "picture count of 2147483647";
        QTest::newRow("comments longer than the file")
            << one +
                   ParseHexFixture("00 00 00 00 00 00 00 00 00 00 00 00 00 00 00 00 00 00 00 00"
                                   "01 00 00 00 0A 0A 0A F0 FF FF 7F") +
                   QByteArray(60, '\0')
            << "text length of 2147483632";
    }

    void absurdCountsAndLengths()
    {
        QFETCH(QByteArray, bytes);
        QFETCH(QString, reason);
        CCatalogFixture f;
        f.WriteDataFile(bytes);
        auto doc = f.NewDoc();
        QVERIFY(!doc->OpenCatalog(false));
        QCOMPARE(f.prompt.Only().caption, kReadData);
        QVERIFY2(QString::fromStdString(f.prompt.Only().text).contains(reason),
                 f.prompt.Only().text.c_str());
        QCOMPARE(f.prompt.Only().icon, CPrompt::Icon::Stop);
    }

    void firstStartCreatesTheCatalog()
    {
        CCatalogFixture f;
        QFile::remove(QString::fromStdString(f.DataFile()));
        const CTime before = CTime::GetCurrentTime();
        auto doc = f.NewDoc();
        QVERIFY(doc->StartUp());
        QVERIFY(f.prompt.shown.empty());
        QCOMPARE(f.prompt.readMeShown.size(), size_t(1));
        QVERIFY(f.prompt.readMeShown[0].find("Hearthbook") != std::string::npos);
        QVERIFY(QDir(f.dir.path() + "/Archive").exists());
        QCOMPARE(doc->GetCategories().size(), size_t(18));
        QCOMPARE(doc->GetDocumentNumberCounter(), 0);
        QVERIFY(doc->GetCreationDate() >= before);
        QCOMPARE(doc->GetFormatVersion(), 6);
        const auto again = f.Open();
        QCOMPARE(again->GetCategories().size(), size_t(18));
        QCOMPARE(again->GetCreationDate(), doc->GetCreationDate());
        QVERIFY(again->GetPictures().empty() && again->GetDocumentSets().empty());
        QCOMPARE(f.prompt.readMeShown.size(), size_t(1)); // only when created
    }

    void openFailures_data()
    {
        QTest::addColumn<int>("situation");
        QTest::addColumn<QString>("text");
        QTest::addColumn<QString>("caption");
        QTest::newRow("missing, not to be created")
            << 0 << "Unable to open %1 file! The file could not be located."
            << "Read Data";
        QTest::newRow("a folder in its place")
            << 1 << "Unable to open %1 file! The file could not be accessed."
            << "Read Data";
        QTest::newRow("cannot be created") << 2 << "Unable to create data file"
                                           << "Create Data File";
    }

    void openFailures()
    {
        QFETCH(int, situation);
        QFETCH(QString, text);
        QFETCH(QString, caption);
        CCatalogFixture f;
        std::string path = f.DataFile();
        if (situation == 1)
            QDir().mkpath(QString::fromStdString(path));
        if (situation == 2) // a dangling link: missing, and creating it fails
            QVERIFY(
                QFile::link(f.dir.path() + "/no such folder/x.hbi", QString::fromStdString(path)));
        CTallowmereDoc doc(f.prompt, CAppFolders(f.Home()), path);
        QVERIFY(!(situation == 0 ? doc.OpenCatalog(false) : doc.StartUp()));
        if (text.contains("%1"))
            text = text.arg(QString::fromStdString(path));
        QCOMPARE(QString::fromStdString(f.prompt.Only().text), text);
        QCOMPARE(QString::fromStdString(f.prompt.Only().caption), caption);
        QCOMPARE(f.prompt.Only().icon, CPrompt::Icon::Stop);
    }

    void saveKeepsThePreviousCatalogAndNoTail()
    {
        CCatalogFixture f;
        const QByteArray fixture = LoadHexFixture("catalog/v6.hex");
        f.WriteDataFile(fixture + QByteArray(100, 'x'));
        auto doc = f.Open();
        QVERIFY(doc);
        doc->GetPictures().RemoveAll();
        doc->GetEvents().clear();
        QVERIFY(doc->SaveCatalog(false));
        QFile backup(QString::fromStdString(f.DataFile() + ".bak"));
        QVERIFY(backup.open(QIODevice::ReadOnly));
        QCOMPARE(backup.readAll(), fixture + QByteArray(100, 'x'));
        std::string expected;
        CArchive ar(&expected);
        doc->Serialize(ar);
        QCOMPARE(f.ReadDataFile(), QByteArray::fromStdString(expected));
        QVERIFY(Leftovers(f.Home() + "/User Data").isEmpty());
    }

    void failedSaveLeavesTheOldCatalog()
    {
        CCatalogFixture f;
        auto doc = f.NewDoc();
        QVERIFY(doc->StartUp());
        const QByteArray before = f.ReadDataFile();
        for (int i = 0; i < 50; ++i)
            doc->AddCategory("Extra " + std::to_string(i), "EVENTS", 0);
        // Writes beyond 64 bytes fail, as on a full disk.
        struct rlimit old;
        getrlimit(RLIMIT_FSIZE, &old);
        struct rlimit small = old;
        small.rlim_cur = 64;
        const auto oldHandler = std::signal(SIGXFSZ, SIG_IGN);
        setrlimit(RLIMIT_FSIZE, &small);
        const bool saved = doc->SaveCatalog(false);
        setrlimit(RLIMIT_FSIZE, &old);
        std::signal(SIGXFSZ, oldHandler);
        QVERIFY(!saved);
        QCOMPARE(QString::fromStdString(f.prompt.Only().text),
                 QString("Unable to open %1 file! Disk Full.")
                     .arg(QString::fromStdString(f.DataFile())));
        QCOMPARE(f.prompt.Only().caption, std::string("Save"));
        QCOMPARE(f.ReadDataFile(), before);
        QVERIFY(Leftovers(f.Home() + "/User Data").isEmpty());
        QCOMPARE(f.Open()->GetCategories().size(), size_t(18));
    }

    void registerAndAdd()
    {
        CCatalogFixture f;
        f.WriteDataFile(LoadHexFixture("catalog/v6.hex"));
        auto doc = f.Open();
        QVERIFY(doc);
        doc->SetCurrentCategoryPath("DOCUMENTS\\Letters");
        auto filed = std::make_shared<CDocumentItem>();
        filed->SetCategoryPath("DOCUMENTS\\Bills");
        auto unfiled = std::make_shared<CPictureItem>();
        const CTime before = CTime::GetCurrentTime();
        QVERIFY(doc->AddDocument(filed));
        QVERIFY(doc->AddPicture(unfiled));
        QCOMPARE(filed->GetDocumentNumber(), 8);
        QCOMPARE(filed->GetSequenceNumber(), 7);
        QCOMPARE(filed->GetFlagB(), 0);
        QCOMPARE(filed->GetCategoryPath(), std::string("DOCUMENTS\\Bills"));
        QVERIFY(filed->GetCreateDate() >= before && filed->GetUpdateDate() >= before);
        QCOMPARE(unfiled->GetDocumentNumber(), 9);
        QCOMPARE(unfiled->GetSequenceNumber(), 8);
        QCOMPARE(unfiled->GetCategoryPath(), std::string("DOCUMENTS\\Letters"));
        QCOMPARE(doc->GetDocuments().size(), size_t(2));
        QCOMPARE(doc->GetPictures().size(), size_t(2));
        // An item that already has a number is left alone.
        QVERIFY(!doc->AddDocument(filed));
        QCOMPARE(doc->GetDocuments().size(), size_t(2));
        QCOMPARE(doc->GetDocumentNumberCounter(), 9);
    }

    void closePromptAndSaveCommand_data()
    {
        QTest::addColumn<bool>("yes");
        QTest::newRow("yes saves") << true;
        QTest::newRow("no leaves the file") << false;
    }

    void closePromptAndSaveCommand()
    {
        QFETCH(bool, yes);
        CCatalogFixture f;
        auto doc = f.NewDoc();
        QVERIFY(doc->StartUp());
        doc->AddCategory("New", "EVENTS", 0);
        f.prompt.QueueAnswer(yes ? CPrompt::Answer::Yes : CPrompt::Answer::No);
        doc->OnCloseDocument();
        QCOMPARE(f.prompt.Only().text, std::string("Would you like to save your changes?"));
        QCOMPARE(f.prompt.Only().caption, std::string("Exit Application"));
        QCOMPARE(f.prompt.Only().buttons, CPrompt::Buttons::YesNo);
        QCOMPARE(f.prompt.Only().icon, CPrompt::Icon::Question);
        QCOMPARE(f.Open()->GetCategories().size(), size_t(yes ? 19 : 18));

        f.prompt.shown.clear();
        QVERIFY(doc->SaveCommand());
        QCOMPARE(f.prompt.Only().text, std::string("Successfully saved updated information!"));
        QCOMPARE(f.prompt.Only().caption, std::string("Save Information"));
        QCOMPARE(f.prompt.Only().icon, CPrompt::Icon::Information);
    }

    void preferences()
    {
        CCatalogFixture f;
        f.WriteDataFile(LoadHexFixture("catalog/v6.hex"));
        auto doc = f.Open();
        QVERIFY(doc);
        std::vector<int> hints;
        doc->AddObserver([&hints](int hint) { hints.push_back(hint); });
        CCatalogSettings chosen = doc->GetSettings();
        chosen.colorScheme = 0;
        chosen.accentColor = 0x111111;
        chosen.compareFileName = 1;
        doc->ApplyDocumentPreferences(chosen);
        QCOMPARE(doc->GetSettings().accentColor, 0xF0C080u);
        QCOMPARE(doc->GetSettings().backgroundColor, 0xD0C0C0u);
        QCOMPARE(doc->GetSettings().compareFileName, 1);
        chosen.colorScheme = 1;
        doc->ApplyDocumentPreferences(chosen);
        QCOMPARE(doc->GetBackgroundColor(), 0xC0C0C0u);
        QCOMPARE(doc->GetSettings().accentColor, 0xC0C0C0u);

        chosen.albumDisplayCaption = 0;
        chosen.albumPicturesPerPage = 12;
        doc->ApplyAlbumPreferences(chosen);
        QCOMPARE(static_cast<const CPictureItem&>(*doc->GetPictures().at(0)).GetDisplayCaption(),
                 0);
        QCOMPARE(doc->GetSettings().albumPicturesPerPage, 12);
        QCOMPARE(hints, (std::vector<int>{1, 1, 1}));
    }
};

QTEST_GUILESS_MAIN(TestCatalogFile)
#include "tst_catalogfile.moc"
