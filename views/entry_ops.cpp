#include "views/entry_ops.h"

#include "catalog/prompt.h"
#include "catalog/tallowmere_doc.h"
#include "catalog/text_util.h"
#include "views/command_env.h"
#include "views/list_rows.h"
#include "views/services.h"

#include <cerrno>
#include <cstdio>
#include <fcntl.h>
#include <unistd.h>

namespace {

bool IsPicturePath(const std::string& path)
{
    return CAppFolders::IsPictureFile(path) == 1;
}

std::string FileNameOf(const std::string& path)
{
    const size_t slash = path.rfind('/');
    return slash == std::string::npos ? path : path.substr(slash + 1);
}

std::string FolderOf(const std::string& path)
{
    const size_t slash = path.rfind('/');
    return slash == std::string::npos ? std::string() : path.substr(0, slash);
}

// name-2.ext, name-3.ext ... for the attempts after the first.
std::string Numbered(const std::string& path, int attempt)
{
    if (attempt <= 1)
        return path;
    const size_t slash = path.rfind('/');
    size_t dot = path.rfind('.');
    if (dot == std::string::npos || (slash != std::string::npos && dot < slash))
        dot = path.size();
    return path.substr(0, dot) + "-" + std::to_string(attempt) + path.substr(dot);
}

// rename() that never replaces an existing file.
int RenameNoReplace(const std::string& from, const std::string& to)
{
    if (::renameat2(AT_FDCWD, from.c_str(), AT_FDCWD, to.c_str(), RENAME_NOREPLACE) == 0)
        return 0;
    if (errno != EINVAL && errno != ENOSYS)
        return errno;
    // The file system cannot rename without replacing: link, then unlink.
    if (::link(from.c_str(), to.c_str()) != 0)
        return errno;
    ::unlink(from.c_str());
    return 0;
}

} // namespace

CEntryOps::CEntryOps(CCommandEnv& env) : m_env(env) {}

std::shared_ptr<CDocumentItem> CEntryOps::FindEntry(const CDocumentItem& item) const
{
    CTallowmereDoc& doc = m_env.Doc();
    const CItemList& list =
        IsPicturePath(item.GetPathname()) ? doc.GetPictures() : doc.GetDocuments();
    for (const auto& entry : list) {
        if (entry->GetSequenceNumber() == item.GetSequenceNumber())
            return entry;
    }
    return nullptr;
}

bool CEntryOps::RemoveEntry(const CDocumentItem& item)
{
    CTallowmereDoc& doc = m_env.Doc();
    const std::shared_ptr<CDocumentItem> entry = FindEntry(item);
    if (!entry)
        return false;
    CCurrentItems& current = doc.GetCurrentItems();
    if (IsPicturePath(item.GetPathname())) {
        doc.GetPictures().Remove(entry.get());
        doc.UpdateAllViews(kHintPictureRemoved);
        if (current.picture == entry)
            current.picture.reset();
    } else {
        doc.GetDocuments().Remove(entry.get());
        if (current.document == entry)
            current.document.reset();
    }
    m_env.MarkChanged();
    return true;
}

bool CEntryOps::EditEntry(CDocumentItem& item)
{
    const std::shared_ptr<CDocumentItem> entry = FindEntry(item);
    if (!entry)
        return false;
    CEntryEditFields fields;
    fields.label = entry->GetLabel();
    fields.pathname = entry->GetPathname();
    fields.originalPathname = entry->GetOriginalPathname();
    fields.category = entry->GetCategoryPath();
    fields.creationDate = FormatListDate(entry->GetCreateDate());
    fields.keyword1 = entry->GetKeyword1();
    fields.keyword2 = entry->GetKeyword2();
    fields.searchDate = entry->GetUpdateDate();
    fields.managed = entry->GetManagedFlag() != 0;
    fields.archiveEnabled = fields.managed && entry->GetPathname() == entry->GetOriginalPathname();
    CPrompt& prompt = m_env.Prompt();
    const bool picture = IsPicturePath(item.GetPathname());
    const bool confirmed =
        picture ? prompt.EditPictureEntry(fields) : prompt.EditDocumentEntry(fields);
    if (confirmed && (!picture || fields.managed)) {
        entry->SetLabel(fields.label);
        entry->SetKeyword1(fields.keyword1);
        entry->SetKeyword2(fields.keyword2);
        entry->SetPathname(fields.pathname);
        if (picture)
            entry->SetUpdateDate(fields.searchDate);
        m_env.MarkChanged();
    }
    item.SetLabel(entry->GetLabel());
    item.SetKeyword1(entry->GetKeyword1());
    item.SetKeyword2(entry->GetKeyword2());
    item.SetPathname(entry->GetPathname());
    return confirmed;
}

bool CEntryOps::IsInArchive(const std::string& path) const
{
    const std::string root = m_env.Doc().GetFolders().GetArchiveRoot() + "/";
    return path.compare(0, root.size(), root) == 0;
}

std::string CEntryOps::MoveArchivedFile(const std::string& path, const std::string& folder) const
{
    const std::string target = folder + "/" + FileNameOf(path);
    int error = CAppFolders::CreateFolderPath(folder) ? 0 : errno;
    std::string tried = target;
    for (int attempt = 1; error == 0 && attempt < 100000; ++attempt) {
        tried = Numbered(target, attempt);
        error = RenameNoReplace(path, tried);
        if (error == 0)
            return tried;
        if (error != EEXIST)
            break;
        error = 0;
    }
    m_env.Prompt().MessageBox(
        StrFormat("%s! Failed in moving file %s to %s",
                  CAppFolders::FileErrorText(CAppFolders::FileErrorCode(error)).c_str(),
                  path.c_str(), tried.c_str()),
        "Move Document(s)", CPrompt::Icon::Stop);
    return std::string();
}

bool CEntryOps::MoveEntry(CDocumentItem& item)
{
    const std::shared_ptr<CDocumentItem> entry = FindEntry(item);
    if (!entry)
        return false;
    const bool categoryChanged = entry->GetDocumentCategoryPath() != item.GetDocumentCategoryPath();
    entry->SetCategoryPath(item.GetCategoryPath());
    entry->SetDocumentCategoryPath(item.GetDocumentCategoryPath());
    m_env.MarkChanged();
    // Only a file of the program's own archive follows its entry; any other
    // file stays where the user keeps it.
    if (categoryChanged && IsInArchive(entry->GetPathname())) {
        const std::string folder = m_env.Doc().GetFolders().GetArchiveRoot() + "/" +
                                   CAppFolders::CategoryToFolder(item.GetDocumentCategoryPath());
        if (FolderOf(entry->GetPathname()) != folder) {
            const std::string moved = MoveArchivedFile(entry->GetPathname(), folder);
            if (!moved.empty())
                entry->SetPathname(moved);
        }
    }
    item.SetPathname(entry->GetPathname());
    return true;
}

bool CEntryOps::MailDocuments(const std::vector<const CDocumentItem*>& items)
{
    CMailService* mail = m_env.Mail();
    if (!mail || !mail->IsAvailable()) {
        m_env.Prompt().MessageBox(
            "Error! The mail system is not available - could not find xdg-email", "Send Documents",
            CPrompt::Icon::Stop);
        return false;
    }
    std::vector<CMailAttachment> attachments;
    for (const CDocumentItem* item : items)
        attachments.push_back({item->GetPathname(), FileNameOf(item->GetPathname())});
    return mail->SendDocuments(attachments);
}
