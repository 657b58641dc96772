#pragma once
// One file named by folder and name: the unit of folder scans and of the
// time-stamped archive copy.

#include "catalog/ctime.h"

#include <string>
#include <vector>

class CPrompt;

class CFileEntry
{
public:
    CFileEntry() = default;
    CFileEntry(const std::string& folder, const std::string& name);
    explicit CFileEntry(const std::string& path);

    const std::string& GetFolder() const { return m_folder; }
    const std::string& GetName() const { return m_name; }
    const std::string& GetPath() const { return m_path; }
    bool IsValid() const { return m_valid; }

    // The entry's folder is the archive root and its name the full path of the
    // file to copy; the source folder tree is mirrored below the root. Returns
    // the copy's path, or "" after telling the user why it failed.
    std::string ArchiveFile(CPrompt& prompt, bool showMessage,
                            CTime now = CTime::GetCurrentTime()) const;

    // Reads the whole file into GetData(); false when it cannot be read.
    bool ReadWholeFile(CPrompt& prompt);
    const std::string& GetData() const { return m_data; }

    // Lists the files of the folder (of its sub-folders too when recursive,
    // interleaved as found). Links to folders are not followed and folders that
    // cannot be read are skipped; false only when the folder itself cannot be read.
    bool Scan(bool recursive);
    const std::vector<CFileEntry>& GetChildren() const { return m_children; }

private:
    static std::string Join(const std::string& folder, const std::string& name);

    std::string m_folder;
    std::string m_name;
    std::string m_path;
    std::vector<CFileEntry> m_children;
    std::string m_data;
    bool m_valid = false;
};
