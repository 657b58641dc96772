#include "views/list_commands.h"

#include "views/data_list_state.h"

CListCommands::CListCommands(CDataListState& state, CCommandEnv& env)
    : m_state(state), m_documents(state, env), m_dataItems(state, env)
{}

int CListCommands::OnCommand(int number)
{
    switch (m_state.GetTab()) {
    case TabKind::Documents:
    case TabKind::ManagedDocuments:
        return m_documents.Handle(number);
    case TabKind::DocumentSets:
    case TabKind::Events:
    case TabKind::Recipes:
        return m_dataItems.Handle(number);
    case TabKind::PersonalInformation:
        break;
    }
    return number >= kCmdFirstFrameMessage ? 1 : 0;
}
