#include "views/category_commands.h"

#include "catalog/prompt.h"
#include "catalog/tallowmere_doc.h"
#include "catalog/text_util.h"
#include "views/command_env.h"
#include "views/data_list_state.h"

#include <algorithm>

namespace {

// The number of ancestors of a tree item: the backslashes of its path.
int32_t LevelOf(const std::string& path)
{
    return static_cast<int32_t>(std::count(path.begin(), path.end(), '\\'));
}

} // namespace

CCategoryCommands::CCategoryCommands(CDataListState& state, CCommandEnv& env)
    : m_state(state), m_env(env)
{}

void CCategoryCommands::NewCategory()
{
    CNewCategoryFields fields;
    fields.parentPath = m_state.GetSelectedCategory();
    if (!m_env.Prompt().NewCategory(fields))
        return;
    const CCategory* added =
        m_env.Doc().AddCategory(fields.name, fields.parentPath, LevelOf(fields.parentPath));
    m_env.MarkChanged();
    m_state.Notify(CDataListState::Change::CategoryTree);
    m_state.SelectCategory(added->GetPath());
}

void CCategoryCommands::RemoveSelectedCategory()
{
    CPrompt& prompt = m_env.Prompt();
    const std::string path = m_state.GetSelectedCategory();
    if (prompt.MessageBox(StrFormat("Are you sure you wish to remove Category %s?", path.c_str()),
                          "Remove Category", CPrompt::Icon::Question,
                          CPrompt::Buttons::YesNo) != CPrompt::Answer::Yes)
        return;
    if (m_env.Doc().RemoveCategory(path) == 0) {
        prompt.MessageBox(StrFormat("Unable to remove root Category %s!", path.c_str()),
                          "Remove Category", CPrompt::Icon::Stop);
    } else {
        m_env.MarkChanged();
        prompt.MessageBox(StrFormat("Category %s has been removed!", path.c_str()),
                          "Remove Category", CPrompt::Icon::Information);
    }
    m_state.RebuildCategoryTree();
}
