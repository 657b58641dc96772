#pragma once
// The list view's command entry: a command number goes to the document
// handler (tabs 0 and 1) or the data item handler (tabs 2 to 4).

#include "views/data_item_commands.h"
#include "views/document_commands.h"

class CListCommands
{
public:
    CListCommands(CDataListState& state, CCommandEnv& env);

    // 1 when handled (or a number of 1400 and above), 0 when not.
    int OnCommand(int number);

    CDocumentCommands& Documents() { return m_documents; }
    CDataItemCommands& DataItems() { return m_dataItems; }

private:
    CDataListState& m_state;
    CDocumentCommands m_documents;
    CDataItemCommands m_dataItems;
};
