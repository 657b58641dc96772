#pragma once
// What the file system says about one file: create, modify and access
// times and the size.

#include "catalog/ctime.h"

#include <cstdint>
#include <string>

struct CFileStatus
{
    CTime createTime; // birth time where the file system keeps one, else the change time
    CTime modifyTime;
    CTime accessTime;
    uint64_t size = 0;
    bool isDirectory = false;

    // False (with errno set) when the file cannot be examined.
    static bool GetStatus(const std::string& path, CFileStatus& status);
};
