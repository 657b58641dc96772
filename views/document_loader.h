#pragma once
// Files the user's files into the catalog: a folder tree ("Load Document(s)"),
// files chosen in the add-document dialog ("Add Document(s)"), and the
// selected files of the "Documents" tab ("Manage Files Dialog").

#include "catalog/catalog_items.h"

#include <memory>
#include <vector>

class CCommandEnv;

// Row copies of new catalog entries, each with the entry's own sequence number.
using CEntryList = std::vector<std::unique_ptr<CDocumentItem>>;

class CDocumentLoader
{
public:
    explicit CDocumentLoader(CCommandEnv& env);

    // Runs "Select Folder" and loads the folder tree below the chosen folder;
    // false when the dialog was cancelled.
    bool LoadDocuments(CEntryList& out, bool picturesOnly);
    // Runs the add-document dialog and files the chosen files under the
    // current category; false when no file was taken.
    bool AddDocuments(CEntryList& out);
    // The add-document dialog alone: unfiled entries for the chosen files, as
    // the document set dialog's "Add Document" needs them. False on cancel.
    bool ChooseDocumentFiles(const std::string& category, CEntryList& entries);
    // Runs "Manage Files Dialog" and files the given files under the chosen
    // category with its keywords; returns how many were filed.
    int AddManagedFiles(const std::vector<std::string>& paths);

    // The catalog entry equal to entry (same category and file), or nullptr.
    CDocumentItem* FindDuplicate(const CDocumentItem& entry) const;

private:
    // Files one entry: registered as a picture or a document; returns the
    // catalog's item (nullptr when pictures only and it is no picture).
    std::shared_ptr<CDocumentItem> File(std::shared_ptr<CDocumentItem> entry, bool picturesOnly);
    void ReportSkipped(std::string& message) const;

    CCommandEnv& m_env;
    std::vector<std::string> m_skipped; // paths holding CR or LF
};
