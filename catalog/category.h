#pragma once
// Categories: records naming their parent by path, kept in one flat list,
// and the tree a view builds from that list.

#include <cstdint>
#include <memory>
#include <string>
#include <unordered_map>
#include <vector>

class CArchive;

inline constexpr const char* kRootDocuments = "DOCUMENTS";
inline constexpr const char* kRootRecipes = "RECIPES";
inline constexpr const char* kRootEvents = "EVENTS";
inline constexpr const char* kRootDocumentSets = "DOCUMENT SETS";
inline constexpr const char* kRootPhotoAlbums = "PHOTO ALBUMS";

class CCategory
{
public:
    CCategory() = default;
    CCategory(const std::string& name, const std::string& parentPath, int32_t depth);

    const std::string& GetName() const { return m_name; }
    const std::string& GetParentPath() const { return m_parentPath; }
    int32_t GetDepth() const { return m_depth; }
    // Parent path, a backslash and the name; the name alone for a root.
    std::string GetPath() const;

    // line name, line parent path, int depth
    void Serialize(CArchive& ar);

private:
    std::string m_parentPath;
    std::string m_name;
    int32_t m_depth = 0;
};

// The catalog's categories below the five roots, in creation (or file) order.
class CCategoryList
{
public:
    CCategoryList() = default;
    CCategoryList(CCategoryList&&) = default;
    CCategoryList& operator=(CCategoryList&&) = default;

    CCategory* AddCategory(const std::string& name, const std::string& parentPath,
                           int32_t parentDepth);
    // Appends a record as it stands (the file reader).
    void Append(std::unique_ptr<CCategory> category);
    int EnsureCategoryPath(const std::string& path);
    // 0 for a root (nothing removed), 1 otherwise; sub-categories stay.
    int RemoveCategory(const std::string& path);
    std::vector<CCategory*> GetCategoriesUnder(const std::string& root) const;
    bool Exists(const std::string& name, const std::string& parentPath) const;
    void AddDefaultCategories();
    void RemoveAll();

    size_t size() const { return m_categories.size(); }
    bool empty() const { return m_categories.empty(); }
    const CCategory& at(size_t index) const { return *m_categories.at(index); }
    std::vector<std::unique_ptr<CCategory>>::const_iterator begin() const
    {
        return m_categories.begin();
    }
    std::vector<std::unique_ptr<CCategory>>::const_iterator end() const
    {
        return m_categories.end();
    }

private:
    std::vector<std::unique_ptr<CCategory>> m_categories;
    // How many records have each full path, so lookups stay fast on big trees.
    std::unordered_map<std::string, int> m_pathCounts;
};

// The tree control a category tree is drawn into: a widget in the GUI, a plain
// in-memory tree in tests. Handle 0 stands for the top level.
class CTreeSink
{
public:
    using Handle = std::uintptr_t;
    virtual ~CTreeSink() = default;
    // Inserts an item with text as the last child of parent; returns its handle.
    virtual Handle InsertItem(Handle parent, const std::string& text) = 0;
};

// Fills the tree under a new top-level item rootName and returns that item.
CTreeSink::Handle BuildCategoryTree(CTreeSink& tree, const CCategoryList& categories,
                                    const std::string& rootName);
