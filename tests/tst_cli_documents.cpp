// hearthbook-cli load, list, add, remove, move, category and set end to end
// on a catalog in a temporary folder.

#include <QDir>
#include <QFile>
#include <QProcess>
#include <QTemporaryDir>
#include <QtTest>

namespace {

struct Run
{
    int code;
    QString out;
    QString err;
};

class Cli
{
public:
    Cli() { QDir().mkpath(Path("src/2002")); }

    QString Path(const QString& relative) const { return m_dir.path() + "/" + relative; }
    void MakeFile(const QString& relative)
    {
        QFile file(Path(relative));
        file.open(QIODevice::WriteOnly);
        file.write(relative.toUtf8());
    }
    Run operator()(const QStringList& arguments) const
    {
        QProcess process;
        process.start(QStringLiteral(HB_CLI_PATH),
                      QStringList{QStringLiteral("--home"), Path("home")} + arguments);
        process.waitForFinished(60000);
        return {process.exitCode(), QString::fromUtf8(process.readAllStandardOutput()),
                QString::fromUtf8(process.readAllStandardError())};
    }

private:
    QTemporaryDir m_dir;
};

// The cells of the rows printed, without the date column.
QStringList Rows(const QString& out)
{
    QStringList rows;
    for (const QString& line : out.split('\n', Qt::SkipEmptyParts)) {
        QStringList cells = line.split('\t');
        cells.removeAt(4);
        rows << cells.join('|');
    }
    return rows;
}

} // namespace

class TestCliDocuments : public QObject
{
    Q_OBJECT

private slots:
    void loadListMoveRemove();
    void addCategoryAndSets();
    void usageAndFailures();
};

void TestCliDocuments::loadListMoveRemove()
{
    Cli cli;
    cli.MakeFile("src/a.txt");
    cli.MakeFile("src/2002/b.png");
    QCOMPARE(cli({"init"}).code, 0);
    Run run = cli({"load", cli.Path("src"), "--unique", "--keyword1", "tax"});
    QCOMPARE(run.code, 0);
    QCOMPARE(run.out, QString("Loaded 2 documents, found 0 duplicate documents.\n"));
    run = cli({"load", cli.Path("src"), "--unique"});
    QCOMPARE(run.out, QString("Loaded 0 documents, found 2 duplicate documents.\n"));

    // Pictures are read first, so the picture is 1 and the document 2.
    const QString a = cli.Path("src/a.txt");
    const QString b = cli.Path("src/2002/b.png");
    run = cli({"list", "managed", "--subcategories"});
    QCOMPARE(Rows(run.out),
             (QStringList{"        1|b|DOCUMENTS\\2002|" + b, "        2|a|DOCUMENTS|" + a}));
    QCOMPARE(Rows(cli({"list", "managed"}).out), QStringList{"        2|a|DOCUMENTS|" + a});
    QCOMPARE(
        Rows(cli({"list", "managed", "--subcategories", "--keyword1", "tax", "--to", "2001-01-01"})
                 .out),
        QStringList());
    QCOMPARE(Rows(cli({"list", "managed", "--category", "DOCUMENTS\\2002"}).out).size(), 1);
    QCOMPARE(Rows(cli({"list", "documents", "--folder", cli.Path("src")}).out),
             QStringList{"        1|a|<File System>|" + a});

    QCOMPARE(cli({"move", "2", "--category", "DOCUMENTS\\2002"}).code, 0);
    QCOMPARE(Rows(cli({"list", "managed", "--category", "DOCUMENTS\\2002"}).out).size(), 2);
    run = cli({"remove", "1"});
    QCOMPARE(run.code, 0);
    QCOMPARE(run.out, "Removed 1 " + b + "\n");
    QCOMPARE(Rows(cli({"list", "managed", "--subcategories"}).out),
             QStringList{"        1|a|DOCUMENTS\\2002|" + a});
    QVERIFY(QFile::exists(b));
}

void TestCliDocuments::addCategoryAndSets()
{
    Cli cli;
    cli.MakeFile("src/a.txt");
    cli.MakeFile("src/c.JPG");
    cli({"init"});
    Run run = cli({"category", "add", "DOCUMENTS", "Taxes"});
    QCOMPARE(run.code, 0);
    QCOMPARE(run.out, QString("Added category DOCUMENTS\\Taxes\n"));
    run = cli({"add", cli.Path("src/a.txt"), cli.Path("src/c.JPG"), "--category",
               "DOCUMENTS\\Taxes", "--caption", "Return"});
    QCOMPARE(run.code, 0);
    QCOMPARE(Rows(run.out),
             (QStringList{"        1|Return|DOCUMENTS\\Taxes|" + cli.Path("src/a.txt"),
                          "        2|Return|DOCUMENTS\\Taxes|" + cli.Path("src/c.JPG")}));

    run = cli({"set", "create", "Taxes 2003", "1", "2"});
    QCOMPARE(run.code, 0);
    QCOMPARE(run.out, QString("Created document set 5 Taxes 2003 with 2 documents\n"));
    run = cli({"list", "sets"});
    QCOMPARE(Rows(run.out), QStringList{"Taxes 2003|DOCUMENT SETS||DOCUMENT SETS|        5"});
    // Read back: pictures 1 and 2, documents 3 and 4, then the set.
    QCOMPARE(cli({"set", "add", "5", "1"}).out, QString("Added 1 documents to document set 5\n"));
    QCOMPARE(Rows(cli({"list", "managed", "--category", "DOCUMENTS\\DOCUMENT SETS"}).out).size(),
             3);

    run = cli({"category", "remove", "DOCUMENTS"});
    QCOMPARE(run.code, 3);
    QVERIFY(run.err.contains("Unable to remove root Category DOCUMENTS!"));
    run = cli({"category", "remove", "DOCUMENTS\\Taxes"});
    QCOMPARE(run.code, 0);
    QCOMPARE(run.out, QString("Category DOCUMENTS\\Taxes has been removed!\n"));
}

void TestCliDocuments::usageAndFailures()
{
    Cli cli;
    cli({"init"});
    QCOMPARE(cli({"load"}).code, 1);
    QCOMPARE(cli({"load", cli.Path("nothing")}).code, 3);
    QCOMPARE(cli({"load", cli.Path("src"), "--category", "DOCUMENTS\\None"}).code, 3);
    QCOMPARE(cli({"list", "pictures"}).code, 1);
    QCOMPARE(cli({"remove", "x"}).code, 1);
    QCOMPARE(cli({"remove", "4"}).code, 3);
    QCOMPARE(cli({"move", "1"}).code, 1);
    QCOMPARE(cli({"category", "add", "DOCUMENTS", ""}).code, 1);
    QCOMPARE(cli({"set", "add", "9", "1"}).code, 3);
}

QTEST_GUILESS_MAIN(TestCliDocuments)
#include "tst_cli_documents.moc"
