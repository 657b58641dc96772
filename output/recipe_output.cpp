// A recipe as an HTML page, as mail text and as printed lines.

#include "catalog/app_context.h"
#include "catalog/app_folders.h"
#include "catalog/prompt.h"
#include "catalog/recipe_item.h"
#include "catalog/text_util.h"
#include "output/html_page.h"
#include "output/safe_file_name.h"

std::string CRecipeItem::IngredientLine(const CIngredient& ingredient)
{
    return StrFormat("%6s   %-16s%s", ingredient.GetAmount().c_str(),
                     ingredient.GetMeasurement().c_str(), ingredient.GetIngredient().c_str());
}

void CRecipeItem::AppendTextLines(std::vector<std::string>& lines) const
{
    lines.clear();
    lines.push_back(StrFormat("Recipe for %-32s Author:%s", m_dish.c_str(), m_author.c_str()));
    lines.emplace_back();
    lines.emplace_back(" ");
    for (const CIngredient& ingredient : m_ingredients)
        lines.push_back(IngredientLine(ingredient));
    lines.emplace_back(" ");
    for (std::string& line : SplitCrLfLines(m_directions))
        lines.push_back(std::move(line));
    lines.emplace_back(" ");
}

std::string CRecipeItem::GetMailText() const
{
    std::string text =
        StrFormat("Recipe for %-32s Author:%s\n\n", m_dish.c_str(), m_author.c_str());
    for (const CIngredient& ingredient : m_ingredients)
        text += IngredientLine(ingredient) + "\n";
    text += "\n\n";
    text += m_directions;
    return text;
}

bool CRecipeItem::WriteRecipePage(const std::string& folder)
{
    CWebSite site(folder);
    CHtmlPage& page = site.Master();
    page.headerTable.width = "500";
    page.bgColor = "#33CCCC";
    page.textColor = "black";
    page.title = HtmlEscape(StrFormat("Recipe for %-32s", m_dish.c_str()));
    page.subtitle = HtmlEscape(StrFormat("Author %s\n\n", m_author.c_str()));
    page.path = folder + "/" + SafeFileName(m_dish, "Recipe") + "_Recipe.html";
    m_webPagePath = page.path;

    CHtmlTable* ingredients = page.AddTable(new CHtmlTable);
    ingredients->cellSpacing = 5;
    ingredients->cellPadding = 5;
    ingredients->border = 5;
    ingredients->width = "500";
    for (const CIngredient& ingredient : m_ingredients) {
        CHtmlRow* row = ingredients->AddRow(new CHtmlRow);
        const std::pair<const std::string*, const char*> cells[] = {
            {&ingredient.GetIngredient(), "left"},
            {&ingredient.GetAmount(), "right"},
            {&ingredient.GetMeasurement(), "left"}};
        for (const auto& [text, align] : cells) {
            CHtmlCell* cell = row->AddCell(new CHtmlCell);
            cell->text = HtmlEscape(*text);
            cell->align = align;
        }
    }

    CHtmlTable* directions = page.AddTable(new CHtmlTable);
    directions->width = "500";
    std::string rest = m_directions;
    while (!rest.empty()) {
        const size_t feed = rest.find('\n');
        std::string line;
        if (feed != std::string::npos && feed > 0) {
            line = rest.substr(0, feed);
            rest = rest.substr(feed + 1);
        } else {
            line.swap(rest);
        }
        CHtmlCell* cell = directions->AddRow(new CHtmlRow)->AddCell(new CHtmlCell);
        cell->text = HtmlEscape(line);
        cell->align = "left";
    }
    return site.WriteAll();
}

bool CRecipeItem::ViewAsWebPage(CAppContext& context)
{
    const std::string folder = CAppFolders::GetTempFolder();
    if (!folder.empty() && WriteRecipePage(folder))
        context.GetPrompt().OpenWithShell(m_webPagePath);
    return true;
}

void CRecipeItem::WriteWebPages(CAppContext& context)
{
    std::string folder;
    if (!context.GetPrompt().ChooseFolder(folder) || WriteRecipePage(folder))
        return;
    // Silence here would look like success.
    context.GetPrompt().MessageBox(StrFormat("Unable to write %s!", m_webPagePath.c_str()),
                                   "Save Recipe", CPrompt::Icon::Stop);
}
