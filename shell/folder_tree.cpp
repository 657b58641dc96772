#include "shell/folder_tree.h"

#include "catalog/prompt.h"
#include "catalog/text_util.h"

#include <dirent.h>
#include <sys/stat.h>

namespace {

std::string Join(const std::string& folder, const std::string& name)
{
    return !folder.empty() && folder.back() == '/' ? folder + name : folder + "/" + name;
}

// Calls visit(name) for each folder in path (links to folders count) until it
// returns false.
template <typename Visit> void ForEachFolder(const std::string& path, Visit visit)
{
    DIR* dir = ::opendir(path.c_str());
    if (!dir)
        return;
    while (const dirent* entry = ::readdir(dir)) {
        const std::string name = entry->d_name;
        if (name == "." || name == "..")
            continue;
        bool folder = entry->d_type == DT_DIR;
        if (entry->d_type == DT_LNK || entry->d_type == DT_UNKNOWN) {
            struct stat st;
            folder = ::stat(Join(path, name).c_str(), &st) == 0 && S_ISDIR(st.st_mode);
        }
        if (folder && !visit(name))
            break;
    }
    ::closedir(dir);
}

} // namespace

CFolderTree::CFolderTree(CFolderTreeSink& sink, CPrompt& prompt) : m_sink(sink), m_prompt(prompt) {}

int CFolderTree::AddDrives(const std::vector<CVolume>& volumes)
{
    int added = 0;
    for (const CVolume& volume : volumes) {
        if (AddDriveItem(volume))
            ++added;
    }
    return added;
}

bool CFolderTree::AddDriveItem(const CVolume& volume)
{
    int image;
    switch (volume.type) {
    case DriveType::Removable:
    case DriveType::Fixed:
    case DriveType::Remote:
    case DriveType::RamDisk:
        image = kImageDrive;
        break;
    case DriveType::CdRom:
        image = kImageCdRom;
        break;
    default:
        m_prompt.MessageBox(
            StrFormat("Unknown drive item of type %d", static_cast<int>(volume.type)),
            "Add drive item", CPrompt::Icon::Information);
        return false;
    }
    const auto item = m_sink.InsertItem(0, volume.ItemText(), volume.rootPath, image, false);
    AddPlaceholderIfNeeded(item, volume.rootPath);
    return true;
}

bool CFolderTree::HasSubfolder(const std::string& path)
{
    bool found = false;
    ForEachFolder(path, [&found](const std::string&) {
        found = true;
        return false;
    });
    return found;
}

int CFolderTree::AddSubfolders(CFolderTreeSink::Handle item, const std::string& path)
{
    int added = 0;
    ForEachFolder(path, [&](const std::string& name) {
        const std::string childPath = Join(path, name);
        const auto child = m_sink.InsertItem(item, name, childPath, kImageFolder, true);
        AddPlaceholderIfNeeded(child, childPath);
        ++added;
        return true;
    });
    return added;
}

void CFolderTree::AddPlaceholderIfNeeded(CFolderTreeSink::Handle item, const std::string& path)
{
    if (m_sink.Children(item).empty() && HasSubfolder(path))
        m_sink.InsertItem(item, kPlaceholderText, Join(path, kPlaceholderText), kImagePlaceholder,
                          true);
}

std::string CFolderTree::GetItemPath(CFolderTreeSink::Handle item) const
{
    return m_sink.Path(item);
}

void CFolderTree::OnExpanding(CFolderTreeSink::Handle item, bool expand)
{
    const std::string path = GetItemPath(item);
    for (const auto child : m_sink.Children(item)) {
        // A real folder may be called "dummy" too; the placeholder has its own image.
        if (!expand || m_sink.Image(child) == kImagePlaceholder)
            m_sink.DeleteItem(child);
    }
    if (expand) {
        if (m_sink.Image(item) == kImageFolder)
            m_sink.SetImage(item, kImageOpenFolder);
        AddSubfolders(item, path);
    } else {
        if (m_sink.Image(item) == kImageOpenFolder)
            m_sink.SetImage(item, kImageFolder);
        AddPlaceholderIfNeeded(item, path);
    }
}
