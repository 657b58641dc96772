#pragma once
// The program's folders below its install folder (user data, archive,
// images), the picture-file test, archive names and the file error texts.

#include "catalog/ctime.h"

#include <string>

class CAppFolders
{
public:
    // Install folder: $HEARTHBOOK_HOME, else the InstallPath setting, else
    // $XDG_DATA_HOME/Hearthbook.
    CAppFolders();
    explicit CAppFolders(std::string installFolder);

    static std::string ResolveInstallFolder();

    const std::string& GetInstallFolder() const { return m_installFolder; }
    std::string GetDataFolder() const;
    std::string GetDataFilePath() const;
    std::string GetArchiveRoot() const;
    std::string GetImagesFolder() const;
    // The archive folder of a category; creates that one folder when missing.
    std::string GetArchiveFolder(const std::string& categoryPath) const;

    // Makes the data and archive folders; false as soon as one cannot be made.
    bool CreateFolders() const;

    static bool CreateFolderPath(std::string path);
    // The user's own temporary folder (mode 0700): $XDG_RUNTIME_DIR/hearthbook,
    // else <temp>/hearthbook-<uid>. Made when missing; "" when a folder of that
    // name belongs to someone else or is a link.
    static std::string GetTempFolder();
    // 1 for a picture file, 2 for any other file.
    static int IsPictureFile(const std::string& path);
    // folder/base-yymmddHHMM.ext, or "" when the name has no dot.
    static std::string MakeArchiveName(const std::string& folder, const std::string& fileName,
                                       CTime now = CTime::GetCurrentTime());
    static std::string FileErrorText(int code);
    // Maps errno to the code of the file error table.
    static int FileErrorCode(int osError);
    // The category path as a relative folder path: backslashes become '/', and
    // components that would climb or hide ("", ".", "..") become "_".
    static std::string CategoryToFolder(const std::string& categoryPath);

    static constexpr const char* kDataFileName = "HearthbookInfo.hbi";

private:
    std::string m_installFolder;
};
