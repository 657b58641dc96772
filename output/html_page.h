#pragma once
// An HTML page (a header table, body tables, a footer table, or a frameset)
// and the web site that writes a set of pages into one folder.

#include "output/html_elements.h"

#include <memory>
#include <string>
#include <vector>

class CHtmlPage
{
public:
    CHtmlPage();

    CHtmlTable* AddTable(CHtmlTable* table);
    // Writes the file at path; false when it cannot be opened or written.
    bool Write();

    std::string name;
    std::string title;
    std::string subtitle;
    std::string path;
    std::string textColor;
    std::string bgColor;
    bool isFrameset = false;
    std::string frameSrc;
    CHtmlTable headerTable;
    CHtmlTable footerTable;
    CHtmlCell* headerCell = nullptr; // owned by headerTable
    CHtmlRow* headerRow = nullptr;   // owned by headerTable

    const std::vector<std::unique_ptr<CHtmlTable>>& Tables() const { return m_tables; }

private:
    std::vector<std::unique_ptr<CHtmlTable>> m_tables;
};

class CWebSite
{
public:
    // A site in the per-user temporary WebSite folder, master page "Master".
    CWebSite();
    explicit CWebSite(const std::string& folder);

    CHtmlPage* AddPage(CHtmlPage* page);
    // The master page first (false at once when it cannot be written), then
    // every page; a page that cannot be written is skipped.
    bool WriteAll();

    CHtmlPage& Master() { return *m_master; }
    const std::vector<std::unique_ptr<CHtmlPage>>& Pages() const { return m_pages; }
    const std::string& GetFolder() const { return m_folder; }

private:
    std::string m_folder;
    std::vector<std::unique_ptr<CHtmlPage>> m_pages;
    std::unique_ptr<CHtmlPage> m_master;
};
