#pragma once
// The volumes the folder tree starts from: "/", the home folder and each
// mounted volume that holds real files, each with its type and label.

#include <string>
#include <vector>

// The numbers of the drive types the tree and the folder dialog act on.
enum class DriveType : int
{
    Unknown = 0,
    Removable = 2,
    Fixed = 3,
    Remote = 4,
    CdRom = 5,
    RamDisk = 6,
};

struct CVolume
{
    std::string rootPath;
    std::string label;
    std::string fileSystem;
    DriveType type = DriveType::Fixed;

    // "LABEL mountpoint" for a labelled volume, else the mount point.
    std::string ItemText() const;
};

// CD-ROM for iso9660 and udf, remote for network file systems, RAM disk for
// tmpfs and ramfs, removable when the block device says so or the mount point
// lies under /media or /run/media, fixed otherwise.
DriveType ClassifyVolume(const std::string& fileSystem, const std::string& mountPoint,
                         bool removableDevice);
// Kernel file systems that hold no user files (proc, sysfs, cgroup ...).
bool IsPseudoFileSystem(const std::string& fileSystem);
// Whether /sys/block says the device (or the disk of the partition) is removable.
bool IsRemovableDevice(const std::string& device);

// Every mounted volume with its type, pseudo file systems left out.
std::vector<CVolume> MountedVolumes();
// The tree's top items: "/", the home folder, then every mounted volume that
// holds real files (tmpfs and ramfs left out), each once.
std::vector<CVolume> TreeVolumes(const std::vector<CVolume>& mounted, const std::string& home);
// The type of the volume holding path (the longest mount point containing
// it); fixed when none does.
DriveType VolumeTypeOf(const std::string& path, const std::vector<CVolume>& mounted);
