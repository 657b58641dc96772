#pragma once
// "New Category" and "Remove Category" on the category selected in the list
// view's category tree.

class CCommandEnv;
class CDataListState;

class CCategoryCommands
{
public:
    CCategoryCommands(CDataListState& state, CCommandEnv& env);

    // Adds the name the user enters below the selected category and selects it.
    void NewCategory();
    // Asks, then removes the selected category's record (never a root).
    void RemoveSelectedCategory();

private:
    CDataListState& m_state;
    CCommandEnv& m_env;
};
