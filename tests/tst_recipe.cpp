// A recipe as text lines, mail text and HTML page.

#include "catalog/app_context.h"
#include "catalog/recipe_item.h"
#include "tests/support/scripted_prompt.h"

#include <QDir>
#include <QFile>
#include <QTemporaryDir>
#include <QtTest>

namespace {

std::unique_ptr<CRecipeItem> Stew(const std::string& directions)
{
    auto r = std::make_unique<CRecipeItem>();
    r->SetDish("Stew");
    r->SetAuthor("Ann");
    r->SetDirections(directions);
    r->GetIngredients().emplace_back("1/2", "cups", "flour");
    r->GetIngredients().emplace_back("2", "", "carrots");
    return r;
}

QByteArray ReadAll(const std::string& path)
{
    QFile file(QString::fromStdString(path));
    return file.open(QIODevice::ReadOnly) ? file.readAll() : QByteArray("<missing>");
}

const QByteArray kPad28(28, ' ');

} // namespace

class TestRecipe : public QObject
{
    Q_OBJECT

private slots:
    void ingredientLine()
    {
        QCOMPARE(CRecipeItem::IngredientLine(CIngredient("1/2", "cups", "flour")),
                 std::string("   1/2   cups            flour"));
        QCOMPARE(CRecipeItem::IngredientLine(CIngredient("1234567", "a-very-long-measure", "x")),
                 std::string("1234567   a-very-long-measurex"));
    }

    void textLines_data()
    {
        QTest::addColumn<QString>("directions");
        QTest::addColumn<QStringList>("tail");
        QTest::newRow("two lines") << "Mix.\r\nBake." << QStringList{"Mix.", "Bake.", " "};
        QTest::newRow("no directions") << "" << QStringList{"", " "};
        QTest::newRow("ends with a pair") << "Mix.\r\n" << QStringList{"Mix.", "", " "};
    }

    void textLines()
    {
        QFETCH(QString, directions);
        QFETCH(QStringList, tail);
        const auto r = Stew(directions.toStdString());
        std::vector<std::string> lines{"left over"};
        r->AppendTextLines(lines);
        QStringList got;
        for (const auto& line : lines)
            got << QString::fromStdString(line);
        QCOMPARE(got, QStringList({"Recipe for Stew" + QString(kPad28) + " Author:Ann", "", " ",
                                   "   1/2   cups            flour",
                                   "     2                   carrots", " "}) +
                          tail);
    }

    void mailText()
    {
        const auto r = Stew("Mix.\r\nBake.");
        QCOMPARE(QByteArray::fromStdString(r->GetMailText()),
                 "Recipe for Stew" + kPad28 +
                     " Author:Ann\n\n   1/2   cups            flour\n"
                     "     2                   carrots\n\n\nMix.\r\nBake.");
    }

    void page()
    {
        QTemporaryDir dir;
        const auto r = Stew("Mix.\r\nBake.");
        QVERIFY(r->WriteRecipePage(dir.path().toStdString()));
        QCOMPARE(QString::fromStdString(r->GetWebPagePath()), dir.path() + "/Stew_Recipe.html");
        const QByteArray html = ReadAll(r->GetWebPagePath());
        QVERIFY(html.contains("\n<BODY bgcolor=#33CCCC text = black>"));
        QVERIFY(html.contains("\n<table align=center width=500 height=\"5%\" cellspacing=0 "
                              "border=0 cellpadding=0>\n<tr>\n<td align=\"left\" >\n<Font "
                              "color=\"Blue\", face=\"Arial\" size=4>Recipe for Stew" +
                              kPad28 +
                              "\n\n</font></td>\n<td align=\"right\" >Author Ann\n\n\n</td>"));
        QVERIFY(html.contains("\n<table align=center width=500  cellspacing=5 border=5 "
                              "cellpadding=5>\n<tr>\n<td align=left >flour\n</td>\n<td "
                              "align=right >1/2\n</td>\n<td align=left >cups\n</td>\n</tr>"));
        // Rows are cut at line feeds; the carriage return stays in its row.
        QVERIFY(html.contains("\n<table align=center width=500  cellspacing=0 border=0 "
                              "cellpadding=0>\n<tr>\n<td align=left >Mix.\r\n</td>\n</tr>\n<tr>\n"
                              "<td align=left >Bake.\n</td>\n</tr>\n</table>"));
    }

    void pageEdgeCases()
    {
        QTemporaryDir dir;
        CRecipeItem r;
        r.SetDish("Soup");
        r.SetDirections("\nStir.\nServe.");
        QVERIFY(r.WriteRecipePage(dir.path().toStdString()));
        const QByteArray html = ReadAll(r.GetWebPagePath());
        // no ingredients: a table without rows
        QVERIFY(html.contains("cellpadding=5>\n</table>"));
        // a leading line feed keeps the whole text in one row
        QVERIFY(html.contains("<td align=left >\nStir.\nServe.\n</td>"));
    }

    void userTextCannotBreakThePage()
    {
        QTemporaryDir dir;
        CRecipeItem r;
        r.SetDish("../../<b>\"Pie\"");
        r.SetAuthor("Tom & Jerry");
        r.GetIngredients().emplace_back("<1>", "", "a \"b\"");
        QVERIFY(r.WriteRecipePage(dir.path().toStdString()));
        QCOMPARE(QString::fromStdString(r.GetWebPagePath()),
                 dir.path() + "/_._.._<b>\"Pie\"_Recipe.html");
        const QByteArray html = ReadAll(r.GetWebPagePath());
        QVERIFY(html.contains("Recipe for ../../&lt;b&gt;&quot;Pie&quot;"));
        QVERIFY(html.contains(">Author Tom &amp; Jerry\n\n\n</td>"));
        QVERIFY(html.contains(">&lt;1&gt;\n</td>"));
        QVERIFY(!html.contains("<b>"));
        CRecipeItem unnamed;
        QVERIFY(unnamed.WriteRecipePage(dir.path().toStdString()));
        QCOMPARE(QString::fromStdString(unnamed.GetWebPagePath()),
                 dir.path() + "/Recipe_Recipe.html");
    }

    void viewAndWritePages()
    {
        QTemporaryDir dir;
        CScriptedPrompt prompt;
        CAppContext ctx(prompt, CAppFolders(dir.path().toStdString()));
        const auto stew = Stew("Mix.");
        CRecipeItem& r = *stew;
        QVERIFY(r.ViewAsWebPage(ctx));
        QCOMPARE(prompt.opened.size(), size_t(1));
        QVERIFY(QFile::exists(QString::fromStdString(prompt.opened[0])));
        QVERIFY(QString::fromStdString(prompt.opened[0]).endsWith("/Stew_Recipe.html"));

        prompt.folderAnswers.push_back(dir.path().toStdString());
        r.WriteWebPages(ctx);
        QVERIFY(QFile::exists(dir.path() + "/Stew_Recipe.html"));
        r.WriteWebPages(ctx); // cancelled: nothing written, nothing said
        prompt.folderAnswers.push_back((dir.path() + "/missing").toStdString());
        r.WriteWebPages(ctx);
        QCOMPARE(prompt.Only().caption, std::string("Save Recipe"));
        QCOMPARE(prompt.Only().icon, CPrompt::Icon::Stop);
    }
};

QTEST_GUILESS_MAIN(TestRecipe)
#include "tst_recipe.moc"
