#pragma once
// What an item operation may reach besides the item itself: the user (through
// the prompt interface) and the program's folders.

#include "catalog/app_folders.h"

class CPrompt;

class CAppContext
{
public:
    CAppContext(CPrompt& prompt, const CAppFolders& folders) : m_prompt(prompt), m_folders(folders)
    {}

    CPrompt& GetPrompt() const { return m_prompt; }
    const CAppFolders& GetFolders() const { return m_folders; }

private:
    CPrompt& m_prompt;
    CAppFolders m_folders;
};
