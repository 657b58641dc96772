#include "catalog/file_entry.h"

#include "catalog/app_folders.h"
#include "catalog/file_copy.h"
#include "catalog/prompt.h"
#include "catalog/text_util.h"

#include <cerrno>
#include <dirent.h>
#include <fcntl.h>
#include <filesystem>
#include <sys/stat.h>
#include <unistd.h>

namespace {

// The source folder as it is mirrored below the archive root: absolute,
// with nothing that could climb out of the root.
std::string MirrorFolder(const std::string& folder)
{
    std::string result;
    for (const auto& part : std::filesystem::path(folder).lexically_normal()) {
        const std::string s = part.string();
        if (s.empty() || s == "/" || s == "." || s == "..")
            continue;
        result += '/';
        result += s;
    }
    return result;
}

std::string WithAttempt(const std::string& path, int attempt)
{
    if (attempt <= 1)
        return path;
    const size_t slash = path.rfind('/');
    const size_t dot = path.rfind('.');
    const size_t at = (dot == std::string::npos || (slash != std::string::npos && dot < slash))
                          ? path.size()
                          : dot;
    return path.substr(0, at) + "-" + std::to_string(attempt) + path.substr(at);
}

} // namespace

std::string CFileEntry::Join(const std::string& folder, const std::string& name)
{
    if (!folder.empty() && folder.back() == '/')
        return folder + name;
    return folder + "/" + name;
}

CFileEntry::CFileEntry(const std::string& folder, const std::string& name)
    : m_folder(folder), m_name(name), m_valid(true)
{
    if (m_folder.size() > 1 && m_folder.back() == '/')
        m_folder.pop_back();
    m_path = Join(m_folder, m_name);
}

CFileEntry::CFileEntry(const std::string& path) : m_valid(true)
{
    const size_t slash = path.rfind('/');
    if (slash != std::string::npos) {
        m_folder = slash == 0 ? std::string("/") : path.substr(0, slash);
        m_name = path.substr(slash + 1);
        m_path = Join(m_folder, m_name);
    }
}

std::string CFileEntry::ArchiveFile(CPrompt& prompt, bool showMessage, CTime now) const
{
    std::string target = m_folder;
    std::string fileName = m_name;
    if (m_valid) {
        const size_t slash = m_name.rfind('/');
        if (slash != std::string::npos) {
            target = m_folder + MirrorFolder(m_name.substr(0, slash));
            fileName = m_name.substr(slash + 1);
        }
    }
    if (!CAppFolders::CreateFolderPath(target)) {
        prompt.MessageBox(StrFormat("Could not create %s, unable to archive file.", target.c_str()),
                          "Archive File", CPrompt::Icon::Exclamation);
        return std::string();
    }
    const std::string base = CAppFolders::MakeArchiveName(target, fileName, now);
    std::string targetPath = base;
    int error = base.empty() ? ENOENT : 0;
    if (!base.empty()) {
        // A second copy within the same minute gets -2, -3 ... instead of failing.
        for (int attempt = 1; attempt < 100000; ++attempt) {
            targetPath = WithAttempt(base, attempt);
            error = CopyFileTo(m_name, targetPath);
            if (error != EEXIST)
                break;
        }
    }
    if (error) {
        prompt.MessageBox(
            StrFormat("%s! Failed in copying file %s to %s",
                      CAppFolders::FileErrorText(CAppFolders::FileErrorCode(error)).c_str(),
                      m_name.c_str(), targetPath.c_str()),
            "Archive File", CPrompt::Icon::Stop);
        return std::string();
    }
    if (showMessage)
        prompt.MessageBox(StrFormat("Archive picture file to:\r%s", targetPath.c_str()),
                          "Archive File", CPrompt::Icon::Information);
    return targetPath;
}

bool CFileEntry::ReadWholeFile(CPrompt& prompt)
{
    const int fd = ::open(m_path.c_str(), O_RDONLY | O_CLOEXEC);
    if (fd < 0)
        return false;
    struct stat st;
    if (::fstat(fd, &st) != 0 || !S_ISREG(st.st_mode)) {
        ::close(fd);
        return false;
    }
    const auto length = static_cast<size_t>(st.st_size);
    m_data.assign(length, '\0');
    size_t done = 0;
    while (done < length) {
        const ssize_t n = ::read(fd, m_data.data() + done, length - done);
        if (n < 0 && errno == EINTR)
            continue;
        if (n <= 0)
            break;
        done += static_cast<size_t>(n);
    }
    ::close(fd);
    if (done == length)
        return true;
    m_data.resize(done);
    prompt.MessageBox(StrFormat("Tried to read %lld, but read %lld", static_cast<long long>(length),
                                static_cast<long long>(done)),
                      "ReadFile", CPrompt::Icon::Stop);
    return false;
}

bool CFileEntry::Scan(bool recursive)
{
    DIR* dir = ::opendir(m_folder.empty() ? "/" : m_folder.c_str());
    if (!dir)
        return false;
    m_children.clear();
    while (const dirent* entry = ::readdir(dir)) {
        const std::string name = entry->d_name;
        if (name == "." || name == "..")
            continue;
        const std::string path = Join(m_folder, name);
        bool isFile = entry->d_type == DT_REG;
        bool isFolder = entry->d_type == DT_DIR;
        if (entry->d_type == DT_LNK || entry->d_type == DT_UNKNOWN) {
            struct stat st;
            // Links to files count as files; links to folders are never followed.
            if (::lstat(path.c_str(), &st) == 0) {
                isFolder = S_ISDIR(st.st_mode);
                if (S_ISLNK(st.st_mode) && ::stat(path.c_str(), &st) == 0)
                    isFile = S_ISREG(st.st_mode);
                else
                    isFile = S_ISREG(st.st_mode);
            }
        }
        if (isFile) {
            m_children.emplace_back(m_folder, name);
        } else if (isFolder && recursive) {
            CFileEntry sub(path, std::string());
            if (sub.Scan(true)) {
                for (CFileEntry& child : sub.m_children)
                    m_children.push_back(std::move(child));
            }
        }
    }
    ::closedir(dir);
    return true;
}
