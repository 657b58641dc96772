#pragma once
// The files directly in one folder as entries of the "Documents" tab: not
// managed, numbered from 1, filed under "<File System>".

#include "catalog/catalog_items.h"

#include <memory>
#include <vector>

inline constexpr const char* kFileSystemCategory = "<File System>";

// Files whose name holds CR or LF are left out: they cannot be filed.
std::vector<std::shared_ptr<CDocumentItem>> ListFolderFiles(const std::string& folder);
