#include "catalog/tallowmere_doc.h"

#include "catalog/archive.h"
#include "catalog/file_copy.h"
#include "catalog/prompt.h"
#include "catalog/text_util.h"

#include <QFile>

#include <cerrno>
#include <cstring>
#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

namespace {

// Fewest bytes each kind of record takes, for checking counts against the file.
constexpr int64_t kMinCategoryBytes = 2 + 4;
constexpr int64_t kMinRecipeBytes = 2 + 4 + 4 + CCatalogItem::kMinCommonRecordBytes;
constexpr int64_t kMinSetBytes = 4 + 1 + 4 + CCatalogItem::kMinCommonRecordBytes;
constexpr int64_t kMinEventBytes = 3 + 4 + 2 * 4 + 4 + CCatalogItem::kMinCommonRecordBytes;

std::string FolderOf(const std::string& path)
{
    const size_t slash = path.rfind('/');
    if (slash == std::string::npos)
        return ".";
    return slash == 0 ? std::string("/") : path.substr(0, slash);
}

std::string OsErrorText(int osError)
{
    return CAppFolders::FileErrorText(CAppFolders::FileErrorCode(osError));
}

void SyncFolder(const std::string& folder)
{
    const int fd = ::open(folder.c_str(), O_RDONLY | O_DIRECTORY | O_CLOEXEC);
    if (fd >= 0) {
        ::fsync(fd);
        ::close(fd);
    }
}

} // namespace

CTallowmereDoc::CTallowmereDoc(CPrompt& prompt, const CAppFolders& folders,
                               std::string dataFilePath)
    : m_prompt(prompt), m_folders(folders), m_context(prompt, folders),
      m_dataFilePath(dataFilePath.empty() ? folders.GetDataFilePath() : std::move(dataFilePath))
{
    for (const char* root :
         {kRootDocuments, kRootRecipes, kRootEvents, kRootDocumentSets, kRootPhotoAlbums})
        m_rootCategories.emplace_back(root, std::string(), 0);
}

CTallowmereDoc::~CTallowmereDoc() = default;

bool CTallowmereDoc::StartUp()
{
    m_folders.CreateFolders(); // a failure shows up as a catalog that cannot be made
    return OpenCatalog(true);
}

void CTallowmereDoc::RemoveAll()
{
    m_pictures.RemoveAll();
    m_documents.RemoveAll();
    m_recipes.clear();
    m_documentSets.clear();
    m_events.clear();
    m_categories.RemoveAll();
    m_settings = CCatalogSettings();
    m_creationDate = CTime();
    m_reservedDate = CTime();
    m_formatVersion = 0;
    m_sequenceCounter = 1;
    m_documentNumberCounter = 0;
    m_loadCounter = 0;
}

bool CTallowmereDoc::OpenCatalog(bool createIfMissing)
{
    int fd = ::open(m_dataFilePath.c_str(), O_RDONLY | O_CLOEXEC);
    if (fd < 0 && errno == ENOENT && createIfMissing) {
        if (!CreateCatalog())
            return false;
        fd = ::open(m_dataFilePath.c_str(), O_RDONLY | O_CLOEXEC);
    }
    struct stat st;
    if (fd >= 0 && ::fstat(fd, &st) != 0) {
        const int error = errno;
        ::close(fd);
        fd = -1;
        errno = error;
    }
    if (fd >= 0 && S_ISDIR(st.st_mode)) {
        ::close(fd);
        fd = -1;
        errno = EISDIR;
    }
    if (fd < 0) {
        m_prompt.MessageBox(StrFormat("Unable to open %s file! %s.", m_dataFilePath.c_str(),
                                      OsErrorText(errno).c_str()),
                            "Read Data", CPrompt::Icon::Stop);
        return false;
    }
    try {
        CArchive ar(fd, static_cast<int64_t>(st.st_size));
        Serialize(ar);
    } catch (const CArchiveException& e) {
        ::close(fd);
        m_prompt.MessageBox(
            StrFormat("Unable to read %s file! The file is damaged: %s (at byte %lld of %lld).",
                      m_dataFilePath.c_str(), e.what(), static_cast<long long>(e.GetOffset()),
                      static_cast<long long>(st.st_size)),
            "Read Data", CPrompt::Icon::Stop);
        return false;
    }
    ::close(fd);
    return true;
}

bool CTallowmereDoc::CreateCatalog()
{
    CAppFolders::CreateFolderPath(FolderOf(m_dataFilePath));
    const int fd = ::open(m_dataFilePath.c_str(), O_WRONLY | O_CREAT | O_CLOEXEC, 0600);
    if (fd < 0) {
        m_prompt.MessageBox("Unable to create data file", "Create Data File", CPrompt::Icon::Stop);
        return false;
    }
    ::close(fd);
    RemoveAll();
    CFileStatus status;
    m_creationDate = CFileStatus::GetStatus(m_dataFilePath, status) ? status.createTime
                                                                    : CTime::GetCurrentTime();
    m_categories.AddDefaultCategories();
    m_documentNumberCounter = 0;
    m_prompt.ShowReadMe(ReadMeText());
    return SaveCatalog(false);
}

std::string CTallowmereDoc::ReadMeText()
{
    // The resources live in a static library; this pulls them in.
    Q_INIT_RESOURCE(hearthbook);
    QFile file(QStringLiteral(":/hearthbook/README.txt"));
    if (!file.open(QIODevice::ReadOnly))
        return std::string();
    return file.readAll().toStdString();
}

bool CTallowmereDoc::SaveCatalog(bool /*create*/)
{
    std::string error;
    if (WriteFile(error))
        return true;
    m_prompt.MessageBox(
        StrFormat("Unable to open %s file! %s.", m_dataFilePath.c_str(), error.c_str()), "Save",
        CPrompt::Icon::Stop);
    return false;
}

bool CTallowmereDoc::WriteFile(std::string& error)
{
    const std::string folder = FolderOf(m_dataFilePath);
    std::string temp = m_dataFilePath + ".new-XXXXXX";
    const int fd = ::mkostemp(temp.data(), O_CLOEXEC);
    if (fd < 0) {
        error = OsErrorText(errno);
        return false;
    }
    struct stat old;
    const bool hadOld = ::stat(m_dataFilePath.c_str(), &old) == 0 && S_ISREG(old.st_mode);
    if (hadOld)
        ::fchmod(fd, old.st_mode & 07777);
    int osError = 0;
    try {
        CArchive ar(fd);
        Serialize(ar);
        ar.Flush();
    } catch (const CArchiveException& e) {
        osError = e.GetOsError() ? e.GetOsError() : EIO;
    }
    if (!osError && ::fsync(fd) != 0)
        osError = errno;
    if (::close(fd) != 0 && !osError)
        osError = errno;
    if (!osError && hadOld) {
        // Keep the previous catalog: hard-link it (or copy it) to .bak.
        const std::string backup = m_dataFilePath + ".bak";
        const std::string backupTemp = backup + ".new";
        ::unlink(backupTemp.c_str());
        CCopyOptions replace;
        replace.overwrite = true;
        const bool kept = ::link(m_dataFilePath.c_str(), backupTemp.c_str()) == 0 ||
                          CopyFileTo(m_dataFilePath, backupTemp, replace) == 0;
        if (!kept || ::rename(backupTemp.c_str(), backup.c_str()) != 0) {
            osError = errno ? errno : EIO;
            ::unlink(backupTemp.c_str());
        }
    }
    if (!osError && ::rename(temp.c_str(), m_dataFilePath.c_str()) != 0)
        osError = errno;
    if (osError) {
        ::unlink(temp.c_str());
        error = OsErrorText(osError);
        return false;
    }
    SyncFolder(folder);
    return true;
}

void CTallowmereDoc::Serialize(CArchive& ar)
{
    if (ar.IsStoring()) {
        ar.WriteInt(kFormatVersion);
        ar.WriteInt(1);
        ar.WriteInt(2);
        ar.WriteTime(m_creationDate);
        ar.WriteTime(m_reservedDate);
        ar.WriteInt64(m_documentNumberCounter);
        ar.WriteInt(static_cast<int32_t>(m_pictures.size()));
        for (const auto& picture : m_pictures)
            picture->SerializeVersioned(ar, kFormatVersion);
        ar.WriteInt(static_cast<int32_t>(m_documents.size()));
        for (const auto& document : m_documents)
            document->SerializeVersioned(ar, kFormatVersion);
        ar.WriteInt(static_cast<int32_t>(m_categories.size()));
        for (const auto& category : m_categories)
            category->Serialize(ar);
        ar.WriteInt(static_cast<int32_t>(m_recipes.size()));
        for (const auto& recipe : m_recipes)
            recipe->Serialize(ar);
        ar.WriteInt(static_cast<int32_t>(m_documentSets.size()));
        for (const auto& set : m_documentSets)
            set->SerializeVersioned(ar, kFormatVersion);
        ar.WriteInt(static_cast<int32_t>(m_events.size()));
        for (const auto& event : m_events)
            event->Serialize(ar);
        m_settings.Serialize(ar, kFormatVersion);
        return;
    }
    RemoveAll();
    try {
        Load(ar);
    } catch (...) {
        RemoveAll(); // nothing half-read stays behind
        throw;
    }
}

void CTallowmereDoc::Load(CArchive& ar)
{
    const int version = ar.ReadInt();
    if (version < 1)
        ar.Fail(CArchiveException::BadVersion,
                StrFormat("format version %d is not a catalog format", version));
    m_formatVersion = version;
    if (version > 1) {
        ar.ReadInt();
        ar.ReadInt();
    }
    m_creationDate = ar.ReadTime();
    m_reservedDate = ar.ReadTime();
    m_documentNumberCounter = ar.ReadInt64();
    if (version <= 4)
        ar.ReadInt();

    int32_t count = ar.ReadCount(CDocumentItem::kMinRecordBytes, "picture");
    for (int32_t i = 0; i < count; ++i) {
        auto picture = std::make_shared<CPictureItem>();
        // The settings are read last, so this is still the default.
        picture->SetDisplayCaption(m_settings.albumDisplayCaption);
        picture->SerializeVersioned(ar, version);
        if (picture->GetDocumentNumber() == 0)
            RegisterItem(*picture);
        picture->SetSequenceNumber(NextSequenceNumber());
        m_pictures.Append(std::move(picture));
    }
    count = ar.ReadCount(CDocumentItem::kMinRecordBytes, "document");
    for (int32_t i = 0; i < count; ++i) {
        auto document = std::make_shared<CDocumentItem>();
        document->SerializeVersioned(ar, version);
        document->SetSequenceNumber(NextSequenceNumber());
        m_documents.Append(std::move(document));
    }
    count = ar.ReadCount(kMinCategoryBytes, "category");
    for (int32_t i = 0; i < count; ++i) {
        auto category = std::make_unique<CCategory>();
        category->Serialize(ar);
        m_categories.Append(std::move(category));
    }
    count = ar.ReadCount(kMinRecipeBytes, "recipe");
    for (int32_t i = 0; i < count; ++i) {
        auto recipe = std::make_unique<CRecipeItem>();
        recipe->Serialize(ar);
        recipe->SetSequenceNumber(NextSequenceNumber());
        m_recipes.push_back(std::move(recipe));
    }
    count = ar.ReadCount(kMinSetBytes, "document set");
    for (int32_t i = 0; i < count; ++i) {
        auto album = std::make_unique<CPhotoAlbum>();
        album->SerializeVersioned(ar, version);
        album->SetSequenceNumber(NextSequenceNumber());
        if (album->GetAlbumFlag() == 0) {
            auto set = std::make_unique<CDocumentSet>();
            set->AssignFrom(*album);
            set->SetAlbumFlag(0);
            m_documentSets.push_back(std::move(set));
        } else {
            m_documentSets.push_back(std::move(album));
        }
    }
    count = ar.ReadCount(kMinEventBytes, "event");
    for (int32_t i = 0; i < count; ++i) {
        auto event = std::make_unique<CEventItem>();
        event->Serialize(ar);
        event->SetSequenceNumber(NextSequenceNumber());
        m_events.push_back(std::move(event));
    }
    m_settings.Serialize(ar, version);
}

void CTallowmereDoc::RegisterItem(CCatalogItem& item)
{
    // 0 means "not numbered", so a damaged counter must never hand it out.
    do {
        m_documentNumberCounter =
            static_cast<int64_t>(static_cast<uint64_t>(m_documentNumberCounter) + 1);
    } while (m_documentNumberCounter == 0);
    item.SetDocumentNumber(m_documentNumberCounter);
    item.SetSequenceNumber(NextSequenceNumber());
    item.SetFlagB(0);
    if (item.GetCategoryPath().empty())
        item.SetCategoryPath(m_currentCategoryPath);
    const CTime now = CTime::GetCurrentTime();
    item.SetCreateDate(now);
    item.SetUpdateDate(now);
}

bool CTallowmereDoc::AddPicture(const std::shared_ptr<CPictureItem>& item)
{
    if (item->GetDocumentNumber() != 0)
        return false;
    RegisterItem(*item);
    m_pictures.Append(item);
    return true;
}

bool CTallowmereDoc::AddDocument(const std::shared_ptr<CDocumentItem>& item)
{
    if (item->GetDocumentNumber() != 0)
        return false;
    RegisterItem(*item);
    m_documents.Append(item);
    return true;
}

void CTallowmereDoc::AddRecipe(std::unique_ptr<CRecipeItem> item)
{
    m_recipes.push_back(std::move(item));
}

void CTallowmereDoc::AddDocumentSet(std::unique_ptr<CDocumentSet> item)
{
    m_documentSets.push_back(std::move(item));
}

void CTallowmereDoc::AddEvent(std::unique_ptr<CEventItem> item)
{
    m_events.push_back(std::move(item));
}

bool CTallowmereDoc::SaveCommand()
{
    if (!SaveCatalog(false))
        return false;
    m_prompt.MessageBox("Successfully saved updated information!", "Save Information",
                        CPrompt::Icon::Information);
    return true;
}

void CTallowmereDoc::OnCloseDocument()
{
    if (m_prompt.MessageBox("Would you like to save your changes?", "Exit Application",
                            CPrompt::Icon::Question,
                            CPrompt::Buttons::YesNo) == CPrompt::Answer::Yes)
        SaveCatalog(false);
}

void CTallowmereDoc::ApplyDocumentPreferences(const CCatalogSettings& chosen)
{
    m_settings.archiveOnFixedDisks = chosen.archiveOnFixedDisks;
    m_settings.archiveOnRemovableMedia = chosen.archiveOnRemovableMedia;
    m_settings.compareFileCreateDate = chosen.compareFileCreateDate;
    m_settings.compareFileModifyDate = chosen.compareFileModifyDate;
    m_settings.compareFileName = chosen.compareFileName;
    m_settings.compareFileSize = chosen.compareFileSize;
    m_settings.uniqueEntryCheckDefault = chosen.uniqueEntryCheckDefault;
    m_settings.previewWindow = chosen.previewWindow;
    m_settings.colorScheme = chosen.colorScheme;
    if (m_settings.colorScheme == 0) {
        m_settings.backgroundColor = 0xD0C0C0;
        m_settings.accentColor = 0xF0C080;
    } else {
        m_settings.backgroundColor = 0xC0C0C0;
        m_settings.accentColor = 0xC0C0C0;
    }
    m_backgroundColor = m_settings.backgroundColor;
    UpdateAllViews(kHintUpdate);
}

void CTallowmereDoc::ApplyAlbumPreferences(const CCatalogSettings& chosen)
{
    m_settings.albumBackgroundColor = chosen.albumBackgroundColor;
    m_settings.albumPicturesPerPage = chosen.albumPicturesPerPage;
    m_settings.albumThumbnailColumns = chosen.albumThumbnailColumns;
    m_settings.albumDisplayCaption = chosen.albumDisplayCaption;
    m_settings.albumThumbnailSize = chosen.albumThumbnailSize;
    for (const auto& item : m_pictures) {
        if (item->IsPicture())
            static_cast<CPictureItem&>(*item).SetDisplayCaption(m_settings.albumDisplayCaption);
    }
    UpdateAllViews(kHintUpdate);
}

CCategory* CTallowmereDoc::AddCategory(const std::string& name, const std::string& parentPath,
                                       int32_t parentDepth)
{
    return m_categories.AddCategory(name, parentPath, parentDepth);
}

int CTallowmereDoc::EnsureCategoryPath(const std::string& path)
{
    return m_categories.EnsureCategoryPath(path);
}

int CTallowmereDoc::RemoveCategory(const std::string& path)
{
    return m_categories.RemoveCategory(path);
}

std::vector<CCategory*> CTallowmereDoc::GetCategoriesUnder(const std::string& root) const
{
    return m_categories.GetCategoriesUnder(root);
}

CCatalogItem* CTallowmereDoc::FindItemBySequence(int32_t sequenceNumber) const
{
    if (CDocumentItem* item = m_pictures.FindBySequence(sequenceNumber))
        return item;
    if (CDocumentItem* item = m_documents.FindBySequence(sequenceNumber))
        return item;
    const auto find = [sequenceNumber](const auto& list) -> CCatalogItem* {
        for (const auto& item : list) {
            if (item->GetSequenceNumber() == sequenceNumber)
                return item.get();
        }
        return nullptr;
    };
    if (CCatalogItem* item = find(m_recipes))
        return item;
    if (CCatalogItem* item = find(m_documentSets))
        return item;
    return find(m_events);
}

void CTallowmereDoc::AddObserver(std::function<void(int)> observer)
{
    m_observers.push_back(std::move(observer));
}

void CTallowmereDoc::UpdateAllViews(int hint)
{
    for (const auto& observer : m_observers)
        observer(hint);
}
