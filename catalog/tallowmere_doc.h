#pragma once
// The catalog document: the one owner of every item, category, counter and
// setting, and the only reader and writer of the catalog data file.

#include "catalog/app_context.h"
#include "catalog/app_folders.h"
#include "catalog/catalog_items.h"
#include "catalog/catalog_settings.h"
#include "catalog/category.h"
#include "catalog/current_items.h"

#include <functional>
#include <memory>
#include <string>
#include <vector>

class CArchive;
class CPrompt;

class CTallowmereDoc
{
public:
    static constexpr int kFormatVersion = 6;
    static constexpr int kHintUpdate = 1;

    // dataFilePath "" means <install>/User Data/HearthbookInfo.hbi.
    CTallowmereDoc(CPrompt& prompt, const CAppFolders& folders, std::string dataFilePath = {});
    ~CTallowmereDoc();
    CTallowmereDoc(const CTallowmereDoc&) = delete;
    CTallowmereDoc& operator=(const CTallowmereDoc&) = delete;

    // Makes the program's folders and opens the catalog; false means the
    // program cannot go on (the user has been told why).
    bool StartUp();
    // Reads the data file, creating a new catalog first when it is missing and
    // createIfMissing is set. False after telling the user why.
    bool OpenCatalog(bool createIfMissing = true);
    bool CreateCatalog();
    // Writes the whole catalog: a new file beside the old one, flushed, then
    // renamed over it; the previous catalog stays as <file>.bak.
    bool SaveCatalog(bool create = false);
    void Serialize(CArchive& ar);

    // Gives a new item its document number, sequence number, dates and flag B.
    void RegisterItem(CCatalogItem& item);
    // Registers and appends an item that has no document number yet.
    bool AddPicture(const std::shared_ptr<CPictureItem>& item);
    bool AddDocument(const std::shared_ptr<CDocumentItem>& item);
    void AddRecipe(std::unique_ptr<CRecipeItem> item);
    void AddDocumentSet(std::unique_ptr<CDocumentSet> item);
    void AddEvent(std::unique_ptr<CEventItem> item);

    // The user's save command.
    bool SaveCommand();
    // Asks whether to save before the program closes; saves on Yes.
    void OnCloseDocument();
    // Takes back what the preference dialogs confirmed.
    void ApplyDocumentPreferences(const CCatalogSettings& chosen);
    void ApplyAlbumPreferences(const CCatalogSettings& chosen);

    CCategory* AddCategory(const std::string& name, const std::string& parentPath,
                           int32_t parentDepth);
    int EnsureCategoryPath(const std::string& path);
    int RemoveCategory(const std::string& path);
    std::vector<CCategory*> GetCategoriesUnder(const std::string& root) const;
    CCategoryList& GetCategories() { return m_categories; }
    const CCategoryList& GetCategories() const { return m_categories; }
    const std::vector<CCategory>& GetRootCategories() const { return m_rootCategories; }

    CItemList& GetPictures() { return m_pictures; }
    const CItemList& GetPictures() const { return m_pictures; }
    CItemList& GetDocuments() { return m_documents; }
    const CItemList& GetDocuments() const { return m_documents; }
    std::vector<std::unique_ptr<CRecipeItem>>& GetRecipes() { return m_recipes; }
    const std::vector<std::unique_ptr<CRecipeItem>>& GetRecipes() const { return m_recipes; }
    std::vector<std::unique_ptr<CDocumentSet>>& GetDocumentSets() { return m_documentSets; }
    const std::vector<std::unique_ptr<CDocumentSet>>& GetDocumentSets() const
    {
        return m_documentSets;
    }
    std::vector<std::unique_ptr<CEventItem>>& GetEvents() { return m_events; }
    const std::vector<std::unique_ptr<CEventItem>>& GetEvents() const { return m_events; }

    CCatalogSettings& GetSettings() { return m_settings; }
    const CCatalogSettings& GetSettings() const { return m_settings; }
    uint32_t GetBackgroundColor() const { return m_backgroundColor; }
    CTime GetCreationDate() const { return m_creationDate; }
    void SetCreationDate(CTime date) { m_creationDate = date; }
    CTime GetReservedDate() const { return m_reservedDate; }
    void SetReservedDate(CTime date) { m_reservedDate = date; }
    int64_t GetDocumentNumberCounter() const { return m_documentNumberCounter; }
    void SetDocumentNumberCounter(int64_t counter) { m_documentNumberCounter = counter; }
    int32_t GetSequenceCounter() const { return m_sequenceCounter; }
    // Hands out the next sequence number.
    int32_t NextSequenceNumber() { return m_sequenceCounter++; }
    int32_t& LoadCounter() { return m_loadCounter; }
    const std::string& GetCurrentCategoryPath() const { return m_currentCategoryPath; }
    void SetCurrentCategoryPath(const std::string& path) { m_currentCategoryPath = path; }
    // The items the preview panes show (not stored).
    CCurrentItems& GetCurrentItems() { return m_currentItems; }
    // The format version of the file last read (0 before any read).
    int GetFormatVersion() const { return m_formatVersion; }

    const std::string& GetDataFilePath() const { return m_dataFilePath; }
    const CAppFolders& GetFolders() const { return m_folders; }
    CPrompt& GetPrompt() const { return m_prompt; }
    CAppContext& GetContext() { return m_context; }

    // The catalog's own item with that sequence number, in any list; nullptr when none.
    CCatalogItem* FindItemBySequence(int32_t sequenceNumber) const;

    // Views register to be told to update; hint 1 means "everything".
    void AddObserver(std::function<void(int hint)> observer);
    void UpdateAllViews(int hint);

    // Empties the catalog: no items, no categories, default settings, fresh counters.
    void RemoveAll();

    // The read-me text shown when a new catalog is created.
    static std::string ReadMeText();

private:
    bool WriteFile(std::string& error);
    void Load(CArchive& ar);

    CPrompt& m_prompt;
    CAppFolders m_folders;
    CAppContext m_context;
    std::string m_dataFilePath;

    CItemList m_pictures;
    CItemList m_documents;
    std::vector<std::unique_ptr<CRecipeItem>> m_recipes;
    std::vector<std::unique_ptr<CDocumentSet>> m_documentSets;
    std::vector<std::unique_ptr<CEventItem>> m_events;
    std::string m_currentCategoryPath;
    CCategoryList m_categories;
    std::vector<CCategory> m_rootCategories;
    CCatalogSettings m_settings;
    uint32_t m_backgroundColor = 0xD0C0C0;
    CTime m_creationDate;
    CTime m_reservedDate;
    int32_t m_sequenceCounter = 1;
    int64_t m_documentNumberCounter = 0;
    int32_t m_loadCounter = 0;
    int m_formatVersion = 0;
    std::vector<std::function<void(int)>> m_observers;
    CCurrentItems m_currentItems;
};
