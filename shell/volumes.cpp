#include "shell/volumes.h"

#include <QStorageInfo>

#include <climits>
#include <cstdlib>
#include <fstream>
#include <set>

namespace {

bool StartsWith(const std::string& text, const std::string& prefix)
{
    return text.compare(0, prefix.size(), prefix) == 0;
}

bool Contains(const std::string& folder, const std::string& path)
{
    if (folder == "/")
        return StartsWith(path, "/");
    return path == folder || StartsWith(path, folder + "/");
}

} // namespace

std::string CVolume::ItemText() const
{
    return label.empty() ? rootPath : label + " " + rootPath;
}

bool IsPseudoFileSystem(const std::string& fileSystem)
{
    static const std::set<std::string> kPseudo = {
        "autofs",  "binfmt_misc", "bpf",         "cgroup",          "cgroup2",    "configfs",
        "debugfs", "devpts",      "devtmpfs",    "efivarfs",        "fusectl",    "hugetlbfs",
        "mqueue",  "nsfs",        "proc",        "pstore",          "rpc_pipefs", "securityfs",
        "sysfs",   "tracefs",     "fuse.portal", "fuse.gvfsd-fuse", "squashfs"};
    return kPseudo.count(fileSystem) > 0;
}

DriveType ClassifyVolume(const std::string& fileSystem, const std::string& mountPoint,
                         bool removableDevice)
{
    static const std::set<std::string> kRemote = {
        "nfs",        "nfs4",        "cifs",           "smb3",  "smbfs",       "sshfs",
        "fuse.sshfs", "fuse.rclone", "fuse.s3fs",      "davfs", "fuse.davfs2", "afs",
        "ceph",       "glusterfs",   "fuse.glusterfs", "9p",    "ncpfs",       "fuse.curlftpfs"};
    if (fileSystem == "iso9660" || fileSystem == "udf")
        return DriveType::CdRom;
    if (kRemote.count(fileSystem))
        return DriveType::Remote;
    if (fileSystem == "tmpfs" || fileSystem == "ramfs")
        return DriveType::RamDisk;
    if (removableDevice || Contains("/media", mountPoint) || Contains("/run/media", mountPoint))
        return DriveType::Removable;
    return DriveType::Fixed;
}

bool IsRemovableDevice(const std::string& device)
{
    const size_t slash = device.rfind('/');
    const std::string name = slash == std::string::npos ? device : device.substr(slash + 1);
    if (name.empty())
        return false;
    char resolved[PATH_MAX];
    if (!::realpath(("/sys/class/block/" + name).c_str(), resolved))
        return false;
    std::string folder = resolved;
    // A partition's own folder has no "removable"; its disk's folder has.
    if (std::ifstream(folder + "/partition").good())
        folder = folder.substr(0, folder.rfind('/'));
    std::ifstream removable(folder + "/removable");
    int flag = 0;
    return (removable >> flag) && flag == 1;
}

std::vector<CVolume> MountedVolumes()
{
    std::vector<CVolume> volumes;
    for (const QStorageInfo& storage : QStorageInfo::mountedVolumes()) {
        CVolume volume;
        volume.rootPath = storage.rootPath().toStdString();
        volume.fileSystem = storage.fileSystemType().toStdString();
        if (IsPseudoFileSystem(volume.fileSystem))
            continue;
        volume.label = storage.name().toStdString();
        volume.type = ClassifyVolume(volume.fileSystem, volume.rootPath,
                                     IsRemovableDevice(storage.device().toStdString()));
        volumes.push_back(std::move(volume));
    }
    return volumes;
}

std::vector<CVolume> TreeVolumes(const std::vector<CVolume>& mounted, const std::string& home)
{
    std::vector<CVolume> volumes;
    std::set<std::string> seen;
    auto add = [&](CVolume volume) {
        if (seen.insert(volume.rootPath).second)
            volumes.push_back(std::move(volume));
    };
    CVolume root;
    root.rootPath = "/";
    root.type = VolumeTypeOf("/", mounted);
    add(root);
    if (!home.empty() && home != "/") {
        CVolume homeFolder;
        homeFolder.rootPath = home;
        homeFolder.type = VolumeTypeOf(home, mounted);
        add(homeFolder);
    }
    for (const CVolume& volume : mounted) {
        if (volume.type != DriveType::RamDisk)
            add(volume);
    }
    return volumes;
}

DriveType VolumeTypeOf(const std::string& path, const std::vector<CVolume>& mounted)
{
    const CVolume* best = nullptr;
    for (const CVolume& volume : mounted) {
        if (Contains(volume.rootPath, path) &&
            (!best || volume.rootPath.size() > best->rootPath.size()))
            best = &volume;
    }
    return best ? best->type : DriveType::Fixed;
}
