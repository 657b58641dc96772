#include "catalog/recipe_item.h"

#include "catalog/archive.h"
#include "catalog/text_util.h"

CIngredient::CIngredient(const std::string& amount, const std::string& measurement,
                         const std::string& ingredient)
    : m_ingredient(OneLine(ingredient)), m_measurement(OneLine(measurement)),
      m_amount(OneLine(amount))
{}

void CIngredient::SetIngredient(const std::string& text)
{
    m_ingredient = OneLine(text);
}

void CIngredient::SetMeasurement(const std::string& text)
{
    m_measurement = OneLine(text);
}

void CIngredient::SetAmount(const std::string& text)
{
    m_amount = OneLine(text);
}

CRecipeItem::CRecipeItem() : CCatalogItem(kKindRecipe) {}

void CRecipeItem::Serialize(CArchive& ar)
{
    ar.Line(m_dish);
    ar.Line(m_author);
    ar.CountedText(m_directions);
    if (ar.IsStoring()) {
        ar.WriteInt(static_cast<int32_t>(m_ingredients.size()));
        for (const CIngredient& ingredient : m_ingredients) {
            ar.WriteLine(ingredient.GetAmount());
            ar.WriteLine(ingredient.GetMeasurement());
            ar.WriteLine(ingredient.GetIngredient());
        }
    } else {
        m_ingredients.clear();
        const int32_t count = ar.ReadCount(3, "ingredient");
        for (int32_t i = 0; i < count; ++i) {
            std::string amount = ar.ReadLine();
            std::string measurement = ar.ReadLine();
            std::string ingredient = ar.ReadLine();
            m_ingredients.emplace_back(amount, measurement, ingredient);
        }
    }
    CCatalogItem::Serialize(ar);
}

void CRecipeItem::SetDish(const std::string& dish)
{
    m_dish = OneLine(dish);
}

void CRecipeItem::SetAuthor(const std::string& author)
{
    m_author = OneLine(author);
}
