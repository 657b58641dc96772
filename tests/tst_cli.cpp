// hearthbook-cli end to end: creating, inspecting, dumping and rebuilding
// catalogs, and its exit codes.

#include "tests/support/catalog_fixture.h"
#include "tests/support/cli_runner.h"
#include "tests/support/hex_fixture.h"

#include <QFile>
#include <QJsonArray>
#include <QJsonDocument>
#include <QJsonObject>
#include <QProcess>
#include <QtTest>

namespace {

QStringList Home(const CCatalogFixture& f)
{
    return {"--home", QString::fromStdString(f.Home())};
}

void WriteText(const QString& path, const QByteArray& text)
{
    QFile file(path);
    QVERIFY(file.open(QIODevice::WriteOnly));
    file.write(text);
}

} // namespace

class TestCli : public QObject
{
    Q_OBJECT

private slots:
    void initThenInfo()
    {
        CCatalogFixture f;
        CliResult r = RunCli(Home(f) + QStringList{"init"});
        QCOMPARE(r.exitCode, 0);
        QVERIFY(r.out.contains("Created catalog"));
        QVERIFY(QFile::exists(QString::fromStdString(f.DataFile())));
        // init never replaces a catalog.
        const QByteArray before = f.ReadDataFile();
        r = RunCli(Home(f) + QStringList{"init"});
        QCOMPARE(r.exitCode, 3);
        QCOMPARE(f.ReadDataFile(), before);

        r = RunCli(Home(f) + QStringList{"info"});
        QCOMPARE(r.exitCode, 0);
        QVERIFY(r.out.contains("Format version: 6\n"));
        QVERIFY(r.out.contains("Categories: 18\n"));
        QVERIFY(r.out.contains("Pictures: 0\n"));
        QVERIFY(r.out.contains(QByteArray("File size: ") + QByteArray::number(before.size())));
    }

    void dumpThenImportGivesTheSameFile()
    {
        CCatalogFixture f;
        const QByteArray fixture = LoadHexFixture("catalog/v6.hex");
        f.WriteDataFile(fixture);
        const CliResult dump = RunCli(Home(f) + QStringList{"dump"});
        QCOMPARE(dump.exitCode, 0);
        const QString json = f.dir.path() + "/catalog.json";
        WriteText(json, dump.out);
        const QString copy = f.dir.path() + "/copy.hbi";
        const CliResult import = RunCli({"--catalog", copy, "import-json", json});
        QCOMPARE(import.exitCode, 0);
        QFile file(copy);
        QVERIFY(file.open(QIODevice::ReadOnly));
        QCOMPARE(file.readAll(), fixture);
    }

    void oldBytesAreShownAsWindows1252()
    {
        CCatalogFixture f;
        auto doc = f.NewDoc();
        QVERIFY(doc->StartUp());
        doc->AddCategory("Caf\xE9 \x80", "EVENTS", 0);
        QVERIFY(doc->SaveCatalog(false));
        const CliResult r = RunCli(Home(f) + QStringList{"dump"});
        const QJsonArray categories =
            QJsonDocument::fromJson(r.out).object()["categories"].toArray();
        QCOMPARE(categories.last().toObject()["name"].toString(),
                 QString::fromUtf8("Caf\u00e9 \u20ac"));
    }

    void outputCommands()
    {
        CCatalogFixture f;
        f.WriteDataFile(LoadHexFixture("catalog/v6.hex"));
        const auto doc = f.Open();
        QVERIFY(doc);
        const std::string expected =
            doc->FindItemBySequence(3)->GetMailText() + doc->FindItemBySequence(6)->GetMailText();
        CliResult r = RunCli(Home(f) + QStringList{"text", "3", "6"});
        QCOMPARE(r.exitCode, 0);
        QCOMPARE(r.out.toStdString(), expected);

        const QString pdf = f.dir.path() + "/items.pdf";
        r = RunCli(Home(f) + QStringList{"print", "3", "--pdf", pdf});
        QCOMPARE(r.exitCode, 0);
        QProcess text;
        text.start("pdftotext", {pdf, "-"});
        QVERIFY(text.waitForFinished());
        QVERIFY(text.readAllStandardOutput().contains("Recipe for Pancakes"));

        r = RunCli(Home(f) + QStringList{"recipe-html", "3", "--folder", f.dir.path() + "/web"});
        QCOMPARE(r.exitCode, 0);
        QVERIFY(QFile::exists(f.dir.path() + "/web/Pancakes_Recipe.html"));
        r = RunCli(Home(f) + QStringList{"recipe-html", "6", "--folder", f.dir.path()});
        QCOMPARE(r.exitCode, 3);
        QVERIFY(r.err.contains("item 6 is not a recipe"));

        qputenv("HEARTHBOOK_MAIL_COMMAND", HB_TEST_DATA "/mail-recorder.sh");
        qputenv("HB_MAIL_RECORD", (f.dir.path() + "/mail").toLocal8Bit());
        r = RunCli(Home(f) + QStringList{"mail", "6"});
        QCOMPARE(r.exitCode, 0);
        QFile record(f.dir.path() + "/mail");
        QVERIFY(record.open(QIODevice::ReadOnly));
        QVERIFY(record.readAll().contains("Birthday was for Ann turns 40."));
        qunsetenv("HEARTHBOOK_MAIL_COMMAND");
    }

    void exitCodes_data()
    {
        QTest::addColumn<QStringList>("arguments");
        QTest::addColumn<QByteArray>("catalog"); // data file contents; empty: none
        QTest::addColumn<QByteArray>("json");    // written to in.json when set
        QTest::addColumn<int>("code");
        QTest::addColumn<QString>("message");
        const QByteArray v6 = LoadHexFixture("catalog/v6.hex");
        QTest::newRow("no command")
            << QStringList{} << QByteArray() << QByteArray() << 1 << "no command given";
        QTest::newRow("unknown command") << QStringList{"frobnicate"} << QByteArray()
                                         << QByteArray() << 1 << "unknown command 'frobnicate'";
        QTest::newRow("unknown option") << QStringList{"info", "--frob"} << QByteArray()
                                        << QByteArray() << 1 << "Unknown option 'frob'";
        QTest::newRow("stray argument")
            << QStringList{"info", "extra"} << v6 << QByteArray() << 1 << "info takes no arguments";
        QTest::newRow("missing catalog") << QStringList{"info"} << QByteArray() << QByteArray() << 2
                                         << "file! The file could not be located.";
        QTest::newRow("damaged catalog") << QStringList{"dump"} << v6.left(300) << QByteArray() << 2
                                         << "Read Data: Unable to read";
        QTest::newRow("not JSON") << QStringList{"import-json", "in.json"} << QByteArray()
                                  << QByteArray("{ nope") << 3 << "is not valid JSON";
        QTest::newRow("line break in a line field")
            << QStringList{"import-json", "in.json"} << QByteArray()
            << QByteArray(R"({"pictures":[{"name":"a\nb"}]})") << 3
            << "catalog.pictures[0].name holds a line break";
        QTest::newRow("wrong type") << QStringList{"import-json", "in.json"} << QByteArray()
                                    << QByteArray(R"({"events":[{"startDate":"today"}]})") << 3
                                    << "catalog.events[0].startDate must be a whole number";
        QTest::newRow("version") << QStringList{"--version"} << QByteArray() << QByteArray() << 0
                                 << "";
    }

    void exitCodes()
    {
        QFETCH(QStringList, arguments);
        QFETCH(QByteArray, catalog);
        QFETCH(QByteArray, json);
        QFETCH(int, code);
        QFETCH(QString, message);
        CCatalogFixture f;
        if (!catalog.isEmpty())
            f.WriteDataFile(catalog);
        if (!json.isEmpty())
            WriteText(f.dir.path() + "/in.json", json);
        for (QString& a : arguments) {
            if (a == "in.json")
                a = f.dir.path() + "/in.json";
        }
        const QByteArray before = f.ReadDataFile();
        const CliResult r = RunCli(Home(f) + arguments);
        QCOMPARE(r.exitCode, code);
        QVERIFY2(r.err.contains(message.toUtf8()), r.err.constData());
        QCOMPARE(f.ReadDataFile(), before); // a refused command writes nothing
    }
};

QTEST_GUILESS_MAIN(TestCli)
#include "tst_cli.moc"
