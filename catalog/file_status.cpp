#include "catalog/file_status.h"

#include <fcntl.h>
#include <sys/stat.h>

bool CFileStatus::GetStatus(const std::string& path, CFileStatus& status)
{
    struct statx stx;
    if (::statx(AT_FDCWD, path.c_str(), 0, STATX_BASIC_STATS | STATX_BTIME, &stx) != 0)
        return false;
    const bool hasBirth = (stx.stx_mask & STATX_BTIME) != 0 && stx.stx_btime.tv_sec != 0;
    status.createTime = CTime(hasBirth ? stx.stx_btime.tv_sec : stx.stx_ctime.tv_sec);
    status.modifyTime = CTime(stx.stx_mtime.tv_sec);
    status.accessTime = CTime(stx.stx_atime.tv_sec);
    status.size = stx.stx_size;
    status.isDirectory = S_ISDIR(stx.stx_mode);
    return true;
}
