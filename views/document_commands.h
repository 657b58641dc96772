#pragma once
// The document handler of the list view: the commands of the "Documents" and
// "Managed Documents" tabs, with their refusals and messages.

#include "views/category_commands.h"
#include "views/data_item_ops.h"
#include "views/document_loader.h"
#include "views/entry_ops.h"

class CDataListState;

class CDocumentCommands
{
public:
    CDocumentCommands(CDataListState& state, CCommandEnv& env);

    // 1 when handled (or a number of 1400 and above), 0 when not.
    int Handle(int number);

private:
    void Refuse(const char* text, const char* caption) const;
    bool NothingSelected(const std::vector<std::unique_ptr<CDocumentItem>>& items,
                         const char* caption) const;
    void Load();
    void Add();
    void AddSelectedFiles();
    void Delete();
    void Edit();
    void Mail();
    void Move();
    void CreateSet();
    void AddToSet();
    void SelectAll(bool selected);

    CDataListState& m_state;
    CCommandEnv& m_env;
    CDocumentLoader m_loader;
    CEntryOps m_entries;
    CDataItemOps m_items;
    CCategoryCommands m_categories;
};
