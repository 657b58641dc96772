// The edit operations of events, recipes and document sets: each dialog works
// on copies of the fields, which are taken back only on OK.

#include "catalog/app_context.h"
#include "catalog/document_set.h"
#include "catalog/event_item.h"
#include "catalog/prompt.h"
#include "catalog/recipe_item.h"

bool CEventItem::Edit(CAppContext& context)
{
    CEventFields fields;
    fields.eventName = m_eventName;
    fields.nameEditable = GetFlagB() != 0; // not yet registered
    fields.occasion = m_occasion;
    fields.startDate = m_startDate;
    fields.endDate = m_endDate;
    fields.location = m_location;
    fields.keyword1 = GetKeyword1();
    fields.keyword2 = GetKeyword2();
    fields.comments = m_comments;
    fields.attendees = m_attendees;
    if (!context.GetPrompt().EditEvent(fields))
        return false;
    SetKeyword1(fields.keyword1);
    SetKeyword2(fields.keyword2);
    if (fields.nameEditable)
        SetEventName(fields.eventName);
    SetName(m_eventName);
    SetOccasion(fields.occasion);
    SetLocation(fields.location);
    m_comments = fields.comments;
    m_startDate = fields.startDate;
    m_endDate = fields.endDate;
    m_attendees.clear();
    for (const CAttendee& attendee : fields.attendees)
        m_attendees.emplace_back(attendee.GetName());
    return true;
}

bool CRecipeItem::Edit(CAppContext& context)
{
    CRecipeFields fields;
    fields.dish = m_dish;
    fields.author = m_author;
    fields.ingredients = m_ingredients;
    fields.directions = m_directions;
    fields.keyword1 = GetKeyword1();
    fields.keyword2 = GetKeyword2();
    fields.displayType = m_dialogMode;
    CPrompt& prompt = context.GetPrompt();
    // The dialog stays open until it has a dish name or is cancelled.
    while (prompt.EditRecipe(fields)) {
        if (fields.dish.empty()) {
            prompt.MessageBox("Unable to save recipe without a Dish name!", "Save Recipe",
                              CPrompt::Icon::Stop);
            continue;
        }
        SetDish(fields.dish);
        SetName(m_dish);
        SetAuthor(fields.author);
        m_directions = fields.directions;
        m_ingredients.clear();
        for (const CIngredient& i : fields.ingredients)
            m_ingredients.emplace_back(i.GetAmount(), i.GetMeasurement(), i.GetIngredient());
        SetKeyword1(fields.keyword1);
        SetKeyword2(fields.keyword2);
        m_dialogMode = fields.displayType;
        return true;
    }
    return false;
}

bool CDocumentSet::Edit(CAppContext& context)
{
    CDocumentSetFields fields;
    fields.label = m_label;
    fields.description = m_description;
    fields.keyword1 = GetKeyword1();
    fields.keyword2 = GetKeyword2();
    for (const auto& member : m_members)
        fields.members.push_back(member);
    CPrompt& prompt = context.GetPrompt();
    while (prompt.EditDocumentSet(fields)) {
        if (fields.label.empty()) {
            prompt.MessageBox("The label  edit box cannot be empty, please update the box!",
                              "Doc Set Dialog", CPrompt::Icon::Stop);
            continue;
        }
        m_description = fields.description;
        SetKeyword1(fields.keyword1);
        SetKeyword2(fields.keyword2);
        SetLabel(fields.label);
        SetName(m_label);
        m_members.RemoveAll();
        for (const auto& member : fields.members)
            m_members.Append(member);
        return true;
    }
    return false;
}
