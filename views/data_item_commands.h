#pragma once
// The data item handler of the list view: the commands of the "Document
// Sets", "Events" and "Recipes" tabs, with their refusals and messages.

#include "views/category_commands.h"
#include "views/data_item_ops.h"

class CDataListState;

class CDataItemCommands
{
public:
    CDataItemCommands(CDataListState& state, CCommandEnv& env);

    // 1 when handled (or a number of 1400 and above), 0 when not.
    int Handle(int number);

    // Files the new item a preview pane has been editing (its OK): the item
    // gets its row and stays the current item of its kind.
    bool CommitPendingItem();

private:
    bool NothingSelected(const std::vector<std::unique_ptr<CCatalogItem>>& items,
                         const char* caption) const;
    std::vector<CCatalogItem*>
    CatalogItems(const std::vector<std::unique_ptr<CCatalogItem>>& selected) const;
    void Add();
    void Delete();
    void Edit();
    void Mail();
    int Output(int number);
    void Move();
    void WebPages();
    void SetCurrent(const CCatalogItem& item, int32_t sequence);

    CDataListState& m_state;
    CCommandEnv& m_env;
    CDataItemOps m_items;
    CCategoryCommands m_categories;
};
