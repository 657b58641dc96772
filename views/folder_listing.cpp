#include "views/folder_listing.h"

#include "catalog/app_folders.h"
#include "catalog/file_entry.h"
#include "catalog/text_util.h"

std::vector<std::shared_ptr<CDocumentItem>> ListFolderFiles(const std::string& folder)
{
    std::vector<std::shared_ptr<CDocumentItem>> items;
    CFileEntry top(folder, std::string());
    if (!top.Scan(false))
        return items;
    int32_t number = 0;
    for (const CFileEntry& file : top.GetChildren()) {
        const std::string& path = file.GetPath();
        CFileStatus status;
        if (HasLineBreak(path) || !CFileStatus::GetStatus(path, status) || status.isDirectory)
            continue;
        std::shared_ptr<CDocumentItem> item = std::make_shared<CDocumentItem>(path, status);
        if (CAppFolders::IsPictureFile(path) == 1)
            item = std::make_shared<CPictureItem>(*item);
        item->SetManagedFlag(0);
        item->SetSequenceNumber(++number);
        item->SetCreateDate(status.createTime);
        item->SetCategoryPath(kFileSystemCategory);
        item->SetDocumentCategoryPath(kFileSystemCategory);
        items.push_back(std::move(item));
    }
    return items;
}
