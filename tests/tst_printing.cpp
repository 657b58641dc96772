// Printing data items (80 lines a page, items back to back), the print
// preview's page count, and the text export.

#include "catalog/catalog_items.h"
#include "output/data_item_print.h"
#include "tests/support/scripted_prompt.h"

#include <QFile>
#include <QProcess>
#include <QTemporaryDir>
#include <QtTest>

namespace {

std::unique_ptr<CEventItem> EventWithLines(const std::string& name, int commentLines)
{
    auto event = std::make_unique<CEventItem>();
    event->SetEventName(name);
    std::string comments;
    for (int i = 1; i <= commentLines; ++i) {
        if (i > 1)
            comments += "\r\n";
        comments += name + " line " + QString::number(i).rightJustified(3, '0').toStdString();
    }
    event->SetComments(comments);
    return event;
}

// An item that claims a given number of print lines.
class LinesItem : public CCatalogItem
{
public:
    explicit LinesItem(int lines) : m_lines(lines) {}
    int GetPrintLineCount() const override { return m_lines; }

private:
    int m_lines;
};

// The text of each page of a PDF, as pdftotext reads it.
QStringList PdfPages(const QString& pdf)
{
    QProcess process;
    process.start("pdftotext", {"-layout", pdf, "-"});
    if (!process.waitForFinished(60000))
        return {"<pdftotext failed>"};
    QStringList pages = QString::fromUtf8(process.readAllStandardOutput()).split('\f');
    if (!pages.isEmpty() && pages.last().trimmed().isEmpty())
        pages.removeLast();
    return pages;
}

QStringList NonEmptyLines(const QString& page)
{
    QStringList lines;
    for (const QString& line : page.split('\n')) {
        if (!line.trimmed().isEmpty())
            lines << line.trimmed();
    }
    return lines;
}

} // namespace

class TestPrinting : public QObject
{
    Q_OBJECT

private slots:
    void linesFlowAcrossPages()
    {
        const auto long85 = EventWithLines("A", 83); // 2 lines of its own + 83 comment lines
        const auto short5 = EventWithLines("B", 3);
        const std::vector<CPrintPage> pages = LayOutDataItemPages({long85.get(), short5.get()});
        QCOMPARE(pages.size(), size_t(2));
        QCOMPARE(pages[0].size(), size_t(80));
        QCOMPARE(pages[1].size(), size_t(10));
        QCOMPARE(pages[0].back(), std::string("A line 078"));
        QCOMPARE(pages[1].front(), std::string("A line 079"));
        QCOMPARE(pages[1][5], std::string("B was for ."));
    }

    void printedPdfHoldsThePages()
    {
        QTemporaryDir dir;
        const auto long85 = EventWithLines("A", 83);
        const auto short5 = EventWithLines("B", 3);
        CScriptedPrompt prompt;
        const QString pdf = dir.path() + "/items.pdf";
        prompt.pdfAnswers.push_back(pdf.toStdString());
        QVERIFY(PrintDataItems(prompt, {long85.get(), short5.get()}));
        QVERIFY(prompt.shown.empty()); // a PDF file has no job number
        const QStringList pages = PdfPages(pdf);
        QCOMPARE(pages.size(), 2);
        const QStringList first = NonEmptyLines(pages[0]);
        const QStringList second = NonEmptyLines(pages[1]);
        // 80 lines on the first page, none lost at the bottom.
        QCOMPARE(first.size(), 80);
        QVERIFY(first.contains("A line 078"));
        QCOMPARE(second.first(), QString("A line 079"));
        QCOMPARE(second.last(), QString("B line 003"));
        QCOMPARE(second.size(), 10);
    }

    void aQueueThatTakesNoJobIsReported()
    {
        qputenv("CUPS_SERVER", "/nonexistent/cups.sock"); // no print system reachable
        CScriptedPrompt prompt;
        prompt.printerAnswers.push_back("NoSuchQueue");
        const auto event = EventWithLines("A", 1);
        QVERIFY(!PrintDataItems(prompt, {event.get()}));
        QCOMPARE(prompt.Only().caption, std::string("Print"));
        QVERIFY(prompt.Only().text.rfind("Unable to print on NoSuchQueue: ", 0) == 0);
    }

    void cancelledPrintDialogPrintsNothing()
    {
        CScriptedPrompt prompt;
        const auto event = EventWithLines("A", 1);
        QVERIFY(!PrintDataItems(prompt, {event.get()}));
        QCOMPARE(prompt.dialogs, std::vector<std::string>{"ChoosePrinter"});
        QVERIFY(prompt.shown.empty());
    }

    void previewPageCount_data()
    {
        QTest::addColumn<QList<int>>("lineCounts");
        QTest::addColumn<QList<int>>("pages");
        QTest::addColumn<int>("pageCount");
        QTest::newRow("three recipes") << QList<int>{30, 30, 30} << QList<int>{1, 1, 2} << 2;
        QTest::newRow("twenty plain items fit") << QList<int>(20, 0) << QList<int>(20, 1) << 1;
        QTest::newRow("the 21st does not") << QList<int>(21, 0) << (QList<int>(20, 1) << 2) << 2;
        QTest::newRow("an item longer than two pages")
            << QList<int>{30, 170, 0} << QList<int>{1, 2, 4} << 4;
    }

    void previewPageCount()
    {
        QFETCH(QList<int>, lineCounts);
        QFETCH(QList<int>, pages);
        QFETCH(int, pageCount);
        std::vector<std::unique_ptr<LinesItem>> owned;
        std::vector<CCatalogItem*> items;
        for (int n : lineCounts) {
            owned.push_back(std::make_unique<LinesItem>(n));
            items.push_back(owned.back().get());
        }
        QCOMPARE(AssignPrintPages(items), pageCount);
        QList<int> got;
        for (const CCatalogItem* item : items)
            got << item->GetPrintPage();
        QCOMPARE(got, pages);
    }

    void textExport()
    {
        QTemporaryDir dir;
        std::vector<std::unique_ptr<CRecipeItem>> recipes;
        std::vector<const CCatalogItem*> items;
        std::string expected;
        for (const char* dish : {"Soup", "Stew", "Pie"}) {
            recipes.push_back(std::make_unique<CRecipeItem>());
            recipes.back()->SetDish(dish);
            recipes.back()->SetDirections("Cook.");
            items.push_back(recipes.back().get());
            expected += recipes.back()->GetMailText();
        }
        CScriptedPrompt prompt;
        const QString path = dir.path() + "/recipes.txt";
        prompt.saveFileAnswers.push_back(path.toStdString());
        QVERIFY(SaveDataItemsToFile(prompt, items));
        QCOMPARE(prompt.dialogs,
                 std::vector<std::string>{"GetSaveFileName txt Files(*.txt;)|*.txt;|"});
        QFile file(path);
        QVERIFY(file.open(QIODevice::ReadOnly));
        QCOMPARE(file.readAll().toStdString(), expected);
        QVERIFY(expected.find("Cook.Recipe for Stew") != std::string::npos); // back to back

        QVERIFY(!SaveDataItemsToFile(prompt, items)); // cancelled
        QVERIFY(prompt.shown.empty());
        prompt.saveFileAnswers.push_back((dir.path() + "/no/such/folder.txt").toStdString());
        QVERIFY(!SaveDataItemsToFile(prompt, items));
        QCOMPARE(prompt.Only().caption, std::string("Save Data Item(s)"));
    }
};

QTEST_MAIN(TestPrinting)
#include "tst_printing.moc"
