#include "catalog/category.h"

#include "catalog/archive.h"
#include "catalog/text_util.h"

#include <algorithm>

namespace {

std::string Key(const std::string& name, const std::string& parentPath)
{
    std::string key = parentPath;
    key += '\0';
    key += name;
    return key;
}

bool StartsWith(const std::string& text, const std::string& prefix)
{
    return text.compare(0, prefix.size(), prefix) == 0;
}

} // namespace

CCategory::CCategory(const std::string& name, const std::string& parentPath, int32_t depth)
    : m_parentPath(OneLine(parentPath)), m_name(OneLine(name)), m_depth(depth)
{}

std::string CCategory::GetPath() const
{
    if (m_parentPath.empty())
        return m_name;
    return m_parentPath + "\\" + m_name;
}

void CCategory::Serialize(CArchive& ar)
{
    ar.Line(m_name);
    ar.Line(m_parentPath);
    ar.Int(m_depth);
}

CCategory* CCategoryList::AddCategory(const std::string& name, const std::string& parentPath,
                                      int32_t parentDepth)
{
    Append(std::make_unique<CCategory>(name, parentPath, parentDepth + 1));
    return m_categories.back().get();
}

void CCategoryList::Append(std::unique_ptr<CCategory> category)
{
    ++m_pathCounts[Key(category->GetName(), category->GetParentPath())];
    m_categories.push_back(std::move(category));
}

bool CCategoryList::Exists(const std::string& name, const std::string& parentPath) const
{
    const auto it = m_pathCounts.find(Key(name, parentPath));
    return it != m_pathCounts.end() && it->second > 0;
}

int CCategoryList::EnsureCategoryPath(const std::string& path)
{
    size_t i = path.find('\\');
    int32_t level = 1;
    while (i != std::string::npos) {
        const std::string prefix = path.substr(0, i);
        const size_t j = path.find('\\', i + 1);
        const std::string name =
            path.substr(i + 1, j == std::string::npos ? std::string::npos : j - i - 1);
        if (!Exists(name, prefix))
            AddCategory(name, prefix, level - 1);
        i = j;
        ++level;
    }
    return 1;
}

int CCategoryList::RemoveCategory(const std::string& path)
{
    const size_t slash = path.rfind('\\');
    if (slash == std::string::npos || slash == 0)
        return 0;
    const std::string parent = path.substr(0, slash);
    const std::string name = path.substr(slash + 1);
    const auto removed =
        std::remove_if(m_categories.begin(), m_categories.end(), [&](const auto& category) {
            return category->GetName() == name && category->GetParentPath() == parent;
        });
    m_categories.erase(removed, m_categories.end());
    m_pathCounts.erase(Key(name, parent));
    return 1;
}

std::vector<CCategory*> CCategoryList::GetCategoriesUnder(const std::string& root) const
{
    std::vector<std::string> prefixes{root};
    if (root == kRootDocumentSets || root == kRootPhotoAlbums)
        prefixes = {kRootDocumentSets, kRootPhotoAlbums};
    std::vector<CCategory*> result;
    for (const auto& category : m_categories) {
        for (const std::string& prefix : prefixes) {
            if (StartsWith(category->GetParentPath(), prefix))
                result.push_back(category.get());
        }
    }
    return result;
}

void CCategoryList::AddDefaultCategories()
{
    static const struct
    {
        const char* name;
        const char* parent;
        int32_t depth;
    } kDefaults[] = {
        {"RECIPES", "DOCUMENTS", 1},
        {"EVENTS", "DOCUMENTS", 1},
        {"DOCUMENT SETS", "DOCUMENTS", 1},
        {"PHOTO ALBUMS", "DOCUMENTS", 1},
        {"Appetizers", "RECIPES", 1},
        {"Salads", "RECIPES\\Appetizers", 2},
        {"Soups", "RECIPES\\Appetizers", 2},
        {"Entrees", "RECIPES", 1},
        {"Poultry", "RECIPES\\Entrees", 2},
        {"Fish", "RECIPES\\Entrees", 2},
        {"Beef", "RECIPES\\Entrees", 2},
        {"Eggs", "RECIPES\\Entrees", 2},
        {"Vegetables", "RECIPES\\Entrees", 2},
        {"Deserts", "RECIPES", 1},
        {"Cakes", "RECIPES\\Deserts", 2},
        {"Birthdays", "EVENTS", 1},
        {"Vacations", "EVENTS", 1},
        {"Holidays", "EVENTS", 1},
    };
    for (const auto& d : kDefaults)
        Append(std::make_unique<CCategory>(d.name, d.parent, d.depth));
}

void CCategoryList::RemoveAll()
{
    m_categories.clear();
    m_pathCounts.clear();
}

CTreeSink::Handle BuildCategoryTree(CTreeSink& tree, const CCategoryList& categories,
                                    const std::string& rootName)
{
    const CTreeSink::Handle root = tree.InsertItem(0, rootName);
    // Placed nodes by path, each path's items in placement order.
    std::unordered_map<std::string, std::vector<CTreeSink::Handle>> placed;
    placed[rootName].push_back(root);
    bool placedSomething = true;
    for (int32_t level = 1; placedSomething && !categories.empty(); ++level) {
        placedSomething = false;
        for (const auto& category : categories) {
            if (category->GetDepth() != level || !StartsWith(category->GetParentPath(), rootName))
                continue;
            const auto parents = placed.find(category->GetParentPath());
            if (parents == placed.end())
                continue;
            const std::vector<CTreeSink::Handle>& items = parents->second;
            const std::string path = category->GetPath();
            for (size_t k = items.size(); k-- > 0;) {
                const CTreeSink::Handle item = tree.InsertItem(items[k], category->GetName());
                placed[path].push_back(item);
                placedSomething = true;
            }
        }
    }
    return root;
}
