#pragma once
// Copying one file to another, the way archiving and page generation need it.

#include <string>

struct CCopyOptions
{
    bool overwrite = false;    // false: fail with EEXIST rather than replace a file
    bool keepFileTimes = true; // the copy gets the source's access and modification times
    // When set, receives up to headBytes bytes from the start of the file, so a
    // caller can look at a picture's header without opening it again.
    std::string* head = nullptr;
    size_t headBytes = 0;
};

// Copies source to target; a failed copy leaves no partial target behind. Returns 0 or the errno of the failure.
int CopyFileTo(const std::string& source, const std::string& target,
               const CCopyOptions& options = {});
