// hearthbook-cli load, list, add, remove, move, category and set end to end
// on a catalog in a temporary folder.

#include "tests/support/cli_runner.h"

#include <QDir>
#include <QFile>
#include <QTemporaryDir>
#include <QtTest>

namespace {

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
    CliResult operator()(const QStringList& arguments) const
    {
        return RunCli(QStringList{QStringLiteral("--home"), Path("home")} + arguments);
    }
    // The cells of the rows printed, without the date column.
    QStringList Rows(const QStringList& arguments) const
    {
        QStringList rows;
        const QString out = QString::fromUtf8((*this)(arguments).out);
        for (const QString& line : out.split('\n', Qt::SkipEmptyParts)) {
            QStringList cells = line.split('\t');
            cells.removeAt(4);
            rows << cells.join('|');
        }
        return rows;
    }

private:
    QTemporaryDir m_dir;
};

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
    QCOMPARE(cli({"init"}).exitCode, 0);
    CliResult run = cli({"load", cli.Path("src"), "--unique", "--keyword1", "tax"});
    QCOMPARE(run.exitCode, 0);
    QCOMPARE(run.out, QByteArray("Loaded 2 documents, found 0 duplicate documents.\n"));
    // The duplicates are found in the catalog as saved and read again.
    run = cli({"load", cli.Path("src"), "--unique"});
    QCOMPARE(run.out, QByteArray("Loaded 0 documents, found 2 duplicate documents.\n"));

    // Pictures are read first, so the picture is 1 and the document 2.
    const QString a = cli.Path("src/a.txt");
    const QString b = cli.Path("src/2002/b.png");
    QCOMPARE(cli.Rows({"list", "managed", "--subcategories"}),
             (QStringList{"        1|b|DOCUMENTS\\2002|" + b, "        2|a|DOCUMENTS|" + a}));
    QCOMPARE(cli.Rows({"list", "managed"}), QStringList{"        2|a|DOCUMENTS|" + a});
    QCOMPARE(
        cli.Rows({"list", "managed", "--subcategories", "--keyword1", "tax", "--to", "2001-01-01"}),
        QStringList());
    QCOMPARE(cli.Rows({"list", "documents", "--folder", cli.Path("src")}),
             QStringList{"        1|a|<File System>|" + a});

    QCOMPARE(cli({"move", "2", "--category", "DOCUMENTS\\2002"}).exitCode, 0);
    QCOMPARE(cli.Rows({"list", "managed", "--category", "DOCUMENTS\\2002"}).size(), 2);
    run = cli({"remove", "1"});
    QCOMPARE(run.exitCode, 0);
    QCOMPARE(run.out, "Removed 1 " + b.toUtf8() + "\n");
    QCOMPARE(cli.Rows({"list", "managed", "--subcategories"}),
             QStringList{"        1|a|DOCUMENTS\\2002|" + a});
    QVERIFY(QFile::exists(b));
}

void TestCliDocuments::addCategoryAndSets()
{
    Cli cli;
    cli.MakeFile("src/a.txt");
    cli.MakeFile("src/c.JPG");
    cli({"init"});
    CliResult run = cli({"category", "add", "DOCUMENTS", "Taxes"});
    QCOMPARE(run.exitCode, 0);
    QCOMPARE(run.out, QByteArray("Added category DOCUMENTS\\Taxes\n"));
    QCOMPARE(cli.Rows({"add", cli.Path("src/a.txt"), cli.Path("src/c.JPG"), "--category",
                       "DOCUMENTS\\Taxes", "--caption", "Return"}),
             (QStringList{"        1|Return|DOCUMENTS\\Taxes|" + cli.Path("src/a.txt"),
                          "        2|Return|DOCUMENTS\\Taxes|" + cli.Path("src/c.JPG")}));

    run = cli({"set", "create", "Taxes 2003", "1", "2"});
    QCOMPARE(run.exitCode, 0);
    QCOMPARE(run.out, QByteArray("Created document set 5 Taxes 2003 with 2 documents\n"));
    QCOMPARE(cli.Rows({"list", "sets"}),
             QStringList{"Taxes 2003|DOCUMENT SETS||DOCUMENT SETS|        5"});
    // Read back: pictures 1 and 2, documents 3 and 4, then the set.
    QCOMPARE(cli({"set", "add", "5", "1"}).out,
             QByteArray("Added 1 documents to document set 5\n"));
    QCOMPARE(cli.Rows({"list", "managed", "--category", "DOCUMENTS\\DOCUMENT SETS"}).size(), 3);

    run = cli({"category", "remove", "DOCUMENTS"});
    QCOMPARE(run.exitCode, 3);
    QVERIFY(run.err.contains("Unable to remove root Category DOCUMENTS!"));
    run = cli({"category", "remove", "DOCUMENTS\\Taxes"});
    QCOMPARE(run.exitCode, 0);
    QCOMPARE(run.out, QByteArray("Category DOCUMENTS\\Taxes has been removed!\n"));
}

void TestCliDocuments::usageAndFailures()
{
    Cli cli;
    cli({"init"});
    QCOMPARE(cli({"load"}).exitCode, 1);
    QCOMPARE(cli({"load", cli.Path("nothing")}).exitCode, 3);
    QCOMPARE(cli({"load", cli.Path("src"), "--category", "DOCUMENTS\\None"}).exitCode, 3);
    QCOMPARE(cli({"list", "pictures"}).exitCode, 1);
    QCOMPARE(cli({"remove", "x"}).exitCode, 1);
    QCOMPARE(cli({"remove", "4"}).exitCode, 3);
    QCOMPARE(cli({"move", "1"}).exitCode, 1);
    QCOMPARE(cli({"category", "add", "DOCUMENTS", ""}).exitCode, 1);
    QCOMPARE(cli({"set", "add", "9", "1"}).exitCode, 3);
}

QTEST_GUILESS_MAIN(TestCliDocuments)
#include "tst_cli_documents.moc"
