#pragma once
// A recipe: dish, author, directions and ingredients.

#include "catalog/catalog_item.h"

class CIngredient
{
public:
    CIngredient() = default;
    CIngredient(const std::string& amount, const std::string& measurement,
                const std::string& ingredient);
    const std::string& GetIngredient() const { return m_ingredient; }
    void SetIngredient(const std::string& text);
    const std::string& GetMeasurement() const { return m_measurement; }
    void SetMeasurement(const std::string& text);
    const std::string& GetAmount() const { return m_amount; }
    void SetAmount(const std::string& text);

private:
    std::string m_ingredient;
    std::string m_measurement;
    std::string m_amount;
};

class CRecipeItem : public CCatalogItem
{
public:
    CRecipeItem();

    // The recipe record, then the common item record.
    void Serialize(CArchive& ar) override;
    int GetPrintLineCount() const override { return 30; }
    // The recipe as printed and exported: title line, ingredients, directions.
    void AppendTextLines(std::vector<std::string>& lines) const override;
    std::string GetMailText() const override;
    void Mail(CAppContext& context) override;
    // Writes the page into the temporary folder and opens it.
    bool ViewAsWebPage(CAppContext& context) override;
    // Asks for a folder and writes the page there.
    void WriteWebPages(CAppContext& context) override;

    // Writes <folder>/<dish>_Recipe.html; false when it cannot be written.
    bool WriteRecipePage(const std::string& folder);
    const std::string& GetWebPagePath() const { return m_webPagePath; }
    // "%6s   %-16s%s": amount, measurement, ingredient.
    static std::string IngredientLine(const CIngredient& ingredient);
    // The "Recipe" dialog; a recipe without a dish name is not taken.
    bool Edit(CAppContext& context) override;

    const std::string& GetDirections() const { return m_directions; }
    void SetDirections(const std::string& text) { m_directions = text; }
    std::vector<CIngredient>& GetIngredients() { return m_ingredients; }
    const std::vector<CIngredient>& GetIngredients() const { return m_ingredients; }
    const std::string& GetDish() const { return m_dish; }
    void SetDish(const std::string& dish);
    const std::string& GetAuthor() const { return m_author; }
    void SetAuthor(const std::string& author);
    int32_t GetDialogMode() const { return m_dialogMode; }
    void SetDialogMode(int32_t mode) { m_dialogMode = mode; }

private:
    std::string m_directions;
    std::vector<CIngredient> m_ingredients;
    std::string m_dish;
    std::string m_author;
    int32_t m_dialogMode = 1; // set by the recipe dialog
    std::string m_webPagePath;
};
