#pragma once
// What must hold for any bytes given to the catalog reader: it either reads
// them or raises its own error, and what it read writes out the same way twice.

#include "catalog/archive.h"
#include "catalog/prompt.h"
#include "catalog/tallowmere_doc.h"

#include <cstdlib>
#include <string>
#include <string_view>

namespace fuzzing {

class SilentPrompt : public CPrompt
{
public:
    Answer MessageBox(const std::string&, const std::string&, Icon, Buttons) override
    {
        return Answer::No;
    }
};

// Returns true when the bytes were read as a catalog; aborts when a property fails.
inline bool CheckCatalogBytes(std::string_view bytes)
{
    SilentPrompt prompt;
    const CAppFolders folders("/nonexistent-hearthbook-home");
    CTallowmereDoc doc(prompt, folders, "/nonexistent-hearthbook-home/catalog.hbi");
    try {
        CArchive in(bytes);
        doc.Serialize(in);
    } catch (const CArchiveException&) {
        if (!doc.GetPictures().empty() || !doc.GetCategories().empty())
            std::abort(); // a failed read leaves nothing half-loaded
        return false;
    }
    std::string first;
    {
        CArchive out(&first);
        doc.Serialize(out);
    }
    CTallowmereDoc again(prompt, folders, "/nonexistent-hearthbook-home/catalog.hbi");
    try {
        CArchive in{std::string_view(first)};
        again.Serialize(in);
    } catch (const CArchiveException&) {
        std::abort(); // what the writer wrote must read back
    }
    std::string second;
    {
        CArchive out(&second);
        again.Serialize(out);
    }
    if (first != second)
        std::abort();
    return true;
}

} // namespace fuzzing
