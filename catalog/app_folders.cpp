#include "catalog/app_folders.h"

#include "catalog/text_util.h"

#include <QDir>
#include <QSettings>

#include <cerrno>
#include <cstdlib>
#include <sys/stat.h>
#include <unistd.h>

namespace {

bool IsDirectory(const std::string& path)
{
    struct stat st;
    return ::stat(path.c_str(), &st) == 0 && S_ISDIR(st.st_mode);
}

std::string WithoutTrailingSlash(std::string path)
{
    while (path.size() > 1 && path.back() == '/')
        path.pop_back();
    return path;
}

std::string EnvValue(const char* name)
{
    const char* value = std::getenv(name);
    return value ? std::string(value) : std::string();
}

} // namespace

CAppFolders::CAppFolders() : m_installFolder(ResolveInstallFolder()) {}

CAppFolders::CAppFolders(std::string installFolder)
    : m_installFolder(WithoutTrailingSlash(std::move(installFolder)))
{}

std::string CAppFolders::ResolveInstallFolder()
{
    std::string folder = EnvValue("HEARTHBOOK_HOME");
    if (folder.empty()) {
        const QSettings settings(QStringLiteral("Veltrano"), QStringLiteral("Hearthbook"));
        folder = settings.value(QStringLiteral("InstallPath")).toString().toStdString();
    }
    if (folder.empty()) {
        std::string data = EnvValue("XDG_DATA_HOME");
        if (data.empty() || data.front() != '/')
            data = EnvValue("HOME") + "/.local/share";
        folder = data + "/Hearthbook";
    }
    return WithoutTrailingSlash(folder);
}

std::string CAppFolders::GetDataFolder() const
{
    return m_installFolder + "/User Data";
}

std::string CAppFolders::GetDataFilePath() const
{
    return GetDataFolder() + "/" + kDataFileName;
}

std::string CAppFolders::GetArchiveRoot() const
{
    return m_installFolder + "/Archive";
}

std::string CAppFolders::GetImagesFolder() const
{
    return m_installFolder + "/Data/Images";
}

std::string CAppFolders::CategoryToFolder(const std::string& categoryPath)
{
    std::string result;
    size_t start = 0;
    for (;;) {
        const size_t end = categoryPath.find('\\', start);
        std::string part = categoryPath.substr(start, end == std::string::npos ? end : end - start);
        for (char& c : part) {
            if (c == '/')
                c = '_';
        }
        if (part.empty() || part == "." || part == "..")
            part = "_";
        if (!result.empty())
            result += '/';
        result += part;
        if (end == std::string::npos)
            break;
        start = end + 1;
    }
    return result;
}

std::string CAppFolders::GetArchiveFolder(const std::string& categoryPath) const
{
    const std::string folder = GetArchiveRoot() + "/" + CategoryToFolder(categoryPath);
    if (!IsDirectory(folder))
        ::mkdir(folder.c_str(), 0777);
    return folder;
}

std::string CAppFolders::GetTempFolder()
{
    // The runtime folder is the user's own; without one, a named folder in /tmp.
    const std::string runtime = EnvValue("XDG_RUNTIME_DIR");
    const std::string folder = !runtime.empty() && runtime.front() == '/' && IsDirectory(runtime)
                                   ? runtime + "/hearthbook"
                                   : WithoutTrailingSlash(QDir::tempPath().toStdString()) +
                                         "/hearthbook-" + std::to_string(::getuid());
    if (::mkdir(folder.c_str(), 0700) != 0 && errno != EEXIST)
        return std::string();
    struct stat st;
    // Never follow a link or use a folder another user made in a shared place.
    if (::lstat(folder.c_str(), &st) != 0 || !S_ISDIR(st.st_mode) || st.st_uid != ::getuid())
        return std::string();
    if ((st.st_mode & 077) != 0 && ::chmod(folder.c_str(), 0700) != 0)
        return std::string();
    return folder;
}

bool CAppFolders::CreateFolders() const
{
    for (const std::string& folder : {GetDataFolder(), GetArchiveRoot()}) {
        if (!IsDirectory(folder) && ::mkdir(folder.c_str(), 0777) != 0)
            return false;
    }
    return true;
}

bool CAppFolders::CreateFolderPath(std::string path)
{
    if (!path.empty() && path.back() == '/')
        path.pop_back();
    if (path.empty())
        return false;
    if (IsDirectory(path) || ::mkdir(path.c_str(), 0777) == 0)
        return true;
    const size_t slash = path.rfind('/');
    if (slash == std::string::npos || slash == 0)
        return false;
    if (!CreateFolderPath(path.substr(0, slash)))
        return false;
    return ::mkdir(path.c_str(), 0777) == 0 || IsDirectory(path);
}

int CAppFolders::IsPictureFile(const std::string& path)
{
    const size_t dot = path.rfind('.');
    const size_t slash = path.rfind('/');
    if (dot == std::string::npos || (slash != std::string::npos && dot < slash))
        return 2;
    const std::string extension = path.substr(dot + 1);
    for (const char* picture : {"jpg", "bmp", "gif", "png", "wmf", "emf", "rle", "dib"}) {
        if (EqualsNoCase(extension, picture))
            return 1;
    }
    return 2;
}

std::string CAppFolders::MakeArchiveName(const std::string& folder, const std::string& fileName,
                                         CTime now)
{
    const size_t dot = fileName.rfind('.');
    if (dot == std::string::npos)
        return std::string();
    return folder + "/" + fileName.substr(0, dot) + "-" + now.Format("%y%m%d%H%M") +
           fileName.substr(dot);
}

std::string CAppFolders::FileErrorText(int code)
{
    static const char* const kTexts[] = {
        "No Error Occurred",
        "An unspecified error occurred",
        "The file could not be located",
        "All or part of the path is invalid",
        "The permitted number of open files was exceeded",
        "The file could not be accessed",
        "There was an attempt to use an invalid file handle",
        "Working directory cannot be removed",
        "Directory Full",
        "Bad Seek",
        "Hard IO Error",
        "Sharing Violation",
        "Lock Violation",
        "Disk Full",
        "End of File",
    };
    if (code < 0 || code >= static_cast<int>(sizeof kTexts / sizeof kTexts[0]))
        return "Unknown Error";
    return kTexts[code];
}

int CAppFolders::FileErrorCode(int osError)
{
    switch (osError) {
    case 0:
        return 0;
    case ENOENT:
        return 2;
    case ENOTDIR:
    case ENAMETOOLONG:
    case ELOOP:
    case EINVAL:
        return 3;
    case EMFILE:
    case ENFILE:
        return 4;
    case EACCES:
    case EPERM:
    case EROFS:
    case EISDIR:
        return 5;
    case EBADF:
        return 6;
    case ESPIPE:
        return 9;
    case EIO:
        return 10;
    case EBUSY:
    case ETXTBSY:
        return 11;
    case ENOLCK:
    case EDEADLK:
        return 12;
    case ENOSPC:
    case EDQUOT:
    case EFBIG:
        return 13;
    default:
        return -1;
    }
}
