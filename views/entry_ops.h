#pragma once
// Operations on one catalog entry named by a row item (its sequence number
// and pathname): delete, edit, move to another category, and mailing files.

#include "catalog/catalog_items.h"

#include <memory>
#include <vector>

class CCommandEnv;

class CEntryOps
{
public:
    static constexpr int kHintPictureRemoved = 2;

    explicit CEntryOps(CCommandEnv& env);

    // The catalog's entry with the row item's sequence number: in the picture
    // list for a picture file, else in the document list.
    std::shared_ptr<CDocumentItem> FindEntry(const CDocumentItem& item) const;

    // Unlinks the entry (the file stays on disk); false when there is none.
    bool RemoveEntry(const CDocumentItem& item);
    // Runs the entry's dialog; the row item then takes the entry's label,
    // keywords and pathname. True when the dialog was confirmed.
    bool EditEntry(CDocumentItem& item);
    // Gives the entry the row item's category; an archived file moves along
    // to the new category's archive folder. False when there is no entry.
    bool MoveEntry(CDocumentItem& item);
    // Hands the items' files to the mail program.
    bool MailDocuments(const std::vector<const CDocumentItem*>& items);

private:
    bool IsInArchive(const std::string& path) const;
    // Moves an archived file into folder without overwriting; the new path, or
    // "" after telling the user why it failed.
    std::string MoveArchivedFile(const std::string& path, const std::string& folder) const;

    CCommandEnv& m_env;
};
