#include "views/document_loader.h"

#include "catalog/file_entry.h"
#include "catalog/progress.h"
#include "catalog/prompt.h"
#include "catalog/tallowmere_doc.h"
#include "catalog/text_util.h"
#include "views/command_env.h"
#include "views/duplicate_index.h"

namespace {

constexpr size_t kMaxCaption = 23;

std::string WithoutTrailingSlash(std::string path)
{
    while (path.size() > 1 && path.back() == '/')
        path.pop_back();
    return path;
}

// The folder below the selected one as a category path tail ("2002\May"), or
// "" when the file lies in the selected folder itself.
std::string RelativeCategory(const std::string& selected, const std::string& folder)
{
    const std::string prefix = selected == "/" ? selected : selected + "/";
    if (folder.size() <= prefix.size() || folder.compare(0, prefix.size(), prefix) != 0)
        return std::string();
    std::string relative = folder.substr(prefix.size());
    for (char& c : relative) {
        if (c == '/')
            c = '\\';
    }
    return relative;
}

// A caption cut to its first bytes without splitting a UTF-8 character.
std::string CutCaption(const std::string& caption)
{
    if (caption.size() <= kMaxCaption)
        return caption;
    size_t end = kMaxCaption;
    while (end > 0 && (static_cast<unsigned char>(caption[end]) & 0xC0) == 0x80)
        --end;
    return caption.substr(0, end);
}

std::string ShownPath(const std::string& path)
{
    std::string shown;
    for (char c : path) {
        if (c == '\r')
            shown += "\\r";
        else if (c == '\n')
            shown += "\\n";
        else
            shown += c;
    }
    return shown;
}

std::vector<std::string> CategoryPathsUnder(const CTallowmereDoc& doc, const char* root)
{
    std::vector<std::string> paths;
    for (const CCategory* category : doc.GetCategoriesUnder(root))
        paths.push_back(category->GetPath());
    return paths;
}

} // namespace

CDocumentLoader::CDocumentLoader(CCommandEnv& env) : m_env(env) {}

CDocumentItem* CDocumentLoader::FindDuplicate(const CDocumentItem& entry) const
{
    return CDuplicateIndex(m_env.Doc()).Find(entry);
}

std::shared_ptr<CDocumentItem> CDocumentLoader::File(std::shared_ptr<CDocumentItem> entry,
                                                     bool picturesOnly)
{
    CTallowmereDoc& doc = m_env.Doc();
    entry->SetSequenceNumber(++doc.LoadCounter());
    std::shared_ptr<CDocumentItem> filed;
    if (CAppFolders::IsPictureFile(entry->GetPathname()) == 1) {
        auto picture = std::make_shared<CPictureItem>(*entry);
        doc.AddPicture(picture);
        filed = picture;
    } else if (!picturesOnly) {
        // The entry is new and nobody else holds it: it becomes the catalog's own.
        filed = std::move(entry);
        doc.AddDocument(filed);
    }
    if (filed)
        m_env.MarkChanged();
    return filed;
}

void CDocumentLoader::ReportSkipped(std::string& message) const
{
    if (m_skipped.empty())
        return;
    message += StrFormat("\nSkipped %d file(s) whose name holds a line break:",
                         static_cast<int>(m_skipped.size()));
    for (const std::string& path : m_skipped)
        message += "\n" + ShownPath(path);
}

bool CDocumentLoader::LoadDocuments(CEntryList& out, bool picturesOnly)
{
    CTallowmereDoc& doc = m_env.Doc();
    CPrompt& prompt = m_env.Prompt();
    const CCatalogSettings& settings = doc.GetSettings();
    CSelectFolderFields fields;
    fields.baseCategory = doc.GetCurrentCategoryPath();
    fields.category = fields.baseCategory;
    fields.archiveMode = settings.archiveOnFixedDisks != 0;
    fields.uniqueEntries = settings.uniqueEntryCheckDefault != 0;
    fields.archiveFixed = settings.archiveOnFixedDisks != 0;
    fields.archiveRemovable = settings.archiveOnRemovableMedia != 0;
    if (!prompt.SelectFolder(fields))
        return false;

    CProgress& progress = m_env.Progress();
    progress.Begin("Loading documents", 0);
    const std::string selected = WithoutTrailingSlash(fields.selectedFolder);
    CFileEntry top(selected, std::string());
    if (!selected.empty()) // an empty folder would be read as the whole file system
        top.Scan(true);
    const std::vector<CFileEntry>& files = top.GetChildren();
    progress.Begin("Loading documents", static_cast<int64_t>(files.size()));

    std::string target = doc.GetCurrentCategoryPath();
    if (!fields.newCategory.empty()) {
        target = fields.category;
        doc.EnsureCategoryPath(target);
        m_env.MarkChanged();
    }
    std::unique_ptr<CDuplicateIndex> index;
    if (fields.uniqueEntries)
        index = std::make_unique<CDuplicateIndex>(doc);
    m_skipped.clear();
    int loaded = 0;
    int duplicates = 0;
    int64_t done = 0;
    for (const CFileEntry& file : files) {
        progress.Advance(done++);
        const std::string& path = file.GetPath();
        if (HasLineBreak(path)) {
            m_skipped.push_back(path);
            continue;
        }
        CFileStatus status;
        if (!CFileStatus::GetStatus(path, status) || status.isDirectory)
            continue;
        auto entry = std::make_shared<CDocumentItem>(path, status);
        std::string category = target;
        const std::string relative =
            fields.createSubCategories ? RelativeCategory(selected, file.GetFolder()) : "";
        if (!relative.empty()) {
            category = target + "\\" + relative;
            doc.EnsureCategoryPath(category);
            m_env.MarkChanged();
        }
        entry->SetCategoryPath(category);
        entry->SetDocumentCategoryPath(category);
        if (index && index->Find(*entry)) {
            ++duplicates;
            continue;
        }
        entry->SetKeyword1(fields.keyword1);
        entry->SetKeyword2(fields.keyword2);
        if (fields.archiveMode) {
            const CFileEntry archive(doc.GetFolders().GetArchiveFolder(category),
                                     entry->GetOriginalPathname());
            const std::string copy = archive.ArchiveFile(prompt, false, m_env.Now());
            if (copy.empty())
                continue; // the user has been told; no entry without its file
            entry->SetPathname(copy);
        }
        const std::shared_ptr<CDocumentItem> filed = File(std::move(entry), picturesOnly);
        if (!filed)
            continue;
        if (index)
            index->Add(*filed);
        ++loaded;
        out.push_back(std::make_unique<CDocumentItem>(*filed));
    }
    progress.End();

    std::string message =
        fields.uniqueEntries
            ? StrFormat("Loaded %d documents, found %d duplicate documents.", loaded, duplicates)
            : StrFormat("Successfully loaded %d documents.", loaded);
    ReportSkipped(message);
    prompt.MessageBox(message, "Load Document(s)", CPrompt::Icon::Information);
    return true;
}

bool CDocumentLoader::ChooseDocumentFiles(const std::string& category, CEntryList& entries)
{
    CTallowmereDoc& doc = m_env.Doc();
    CPrompt& prompt = m_env.Prompt();
    CDocumentFileFields fields;
    fields.category = category;
    fields.categories = CategoryPathsUnder(doc, kRootDocuments);
    fields.archive = doc.GetSettings().archiveOnFixedDisks != 0;
    m_skipped.clear();
    if (!prompt.ChooseDocumentFiles(fields)) {
        const char* text = fields.errorCode == 0x3001   ? "Sub Class Failure"
                           : fields.errorCode == 0x3002 ? "Invalid filename"
                           : fields.errorCode == 0x3003 ? "Buffer too small"
                                                        : nullptr;
        if (text)
            prompt.MessageBox(text, "Add Document(s)", CPrompt::Icon::Stop);
        return false;
    }
    const std::string caption = CutCaption(fields.caption);
    for (const std::string& path : fields.files) {
        if (HasLineBreak(path)) {
            m_skipped.push_back(path);
            continue;
        }
        CFileStatus status;
        if (!CFileStatus::GetStatus(path, status) || status.isDirectory)
            continue;
        std::string stored = path;
        if (fields.archive) {
            const CFileEntry archive(doc.GetFolders().GetArchiveFolder(category), path);
            stored = archive.ArchiveFile(prompt, true, m_env.Now());
        }
        if (stored.empty())
            continue;
        auto entry = std::make_unique<CDocumentItem>(path, status);
        entry->SetPathname(stored);
        entry->SetLabel(caption.empty() ? CDocumentItem::LabelFromPath(path) : caption);
        entry->SetCategoryPath(category);
        entry->SetDocumentCategoryPath(category);
        entries.push_back(std::move(entry));
    }
    return true;
}

bool CDocumentLoader::AddDocuments(CEntryList& out)
{
    const std::string target = m_env.Doc().GetCurrentCategoryPath();
    CEntryList entries;
    if (!ChooseDocumentFiles(target, entries))
        return false;
    if (!m_skipped.empty()) {
        std::string message;
        ReportSkipped(message);
        m_env.Prompt().MessageBox(message.substr(1), "Add Document(s)", CPrompt::Icon::Exclamation);
    }
    for (const auto& entry : entries) {
        const std::shared_ptr<CDocumentItem> filed =
            File(std::make_shared<CDocumentItem>(*entry), false);
        out.push_back(std::make_unique<CDocumentItem>(*filed));
    }
    return !entries.empty();
}

int CDocumentLoader::AddManagedFiles(const std::vector<std::string>& paths)
{
    CTallowmereDoc& doc = m_env.Doc();
    CManageFilesFields fields;
    fields.categories = CategoryPathsUnder(doc, kRootDocuments);
    if (!m_env.Prompt().ManageFiles(fields))
        return 0;
    int added = 0;
    for (const std::string& path : paths) {
        CFileStatus status;
        if (HasLineBreak(path) || !CFileStatus::GetStatus(path, status) || status.isDirectory)
            continue;
        std::shared_ptr<CDocumentItem> entry = std::make_shared<CDocumentItem>(path, status);
        entry->SetCategoryPath(fields.category);
        entry->SetDocumentCategoryPath(fields.category);
        entry->SetKeyword1(fields.keyword1);
        entry->SetKeyword2(fields.keyword2);
        entry->SetManagedFlag(1);
        // A picture file is a picture whichever command files it.
        if (CAppFolders::IsPictureFile(path) == 1) {
            auto picture = std::make_shared<CPictureItem>(*entry);
            doc.AddPicture(picture);
        } else {
            doc.AddDocument(entry);
        }
        ++added;
        m_env.MarkChanged();
    }
    return added;
}
