#include "system/storage/FileSystemKind.h"

#include <algorithm>
#include <array>

namespace cimomd {
namespace {

constexpr std::array<std::string_view, 26> kLocalOfTheKernel{
    "bcachefs", "btrfs", "exfat", "ext2",  "ext3",  "ext4",   "f2fs", "hfs",   "hfsplus",
    "iso9660",  "jffs2", "jfs",   "minix", "msdos", "nilfs2", "ntfs", "ntfs3", "ramfs",
    "reiserfs", "tmpfs", "ubifs", "udf",   "ufs",   "vfat",   "xfs",  "zfs"};

// On a device of this machine, but a program, or other machines of a cluster, take part.
constexpr std::array<std::string_view, 3> kLocalOfOthers{"fuseblk", "gfs2", "ocfs2"};

constexpr std::array<std::string_view, 2> kNfs{"nfs", "nfs4"};

constexpr std::array<std::string_view, 14> kRemote{"9p",    "afs",   "beegfs", "ceph",    "cifs",
                                                   "coda",  "davfs", "gpfs",   "lustre",  "ncpfs",
                                                   "panfs", "smb3",  "smbfs",  "virtiofs"};

constexpr std::array<std::string_view, 16> kRemoteOfFuse{
    "fuse.blobfuse",  "fuse.blobfuse2", "fuse.ceph",     "fuse.ceph-fuse",
    "fuse.curlftpfs", "fuse.davfs2",    "fuse.gcsfuse",  "fuse.glusterfs",
    "fuse.goofys",    "fuse.juicefs",   "fuse.mfs",      "fuse.rclone",
    "fuse.s3fs",      "fuse.s3fs-fuse", "fuse.smbnetfs", "fuse.sshfs"};

// Not listed, but often on the way to what is.
constexpr std::array<std::string_view, 8> kPassed{"cramfs", "devtmpfs", "erofs",    "overlay",
                                                  "proc",   "rootfs",   "squashfs", "sysfs"};

template <typename Types>
bool isAmong(const Types& types, std::string_view type) {
    return std::find(types.begin(), types.end(), type) != types.end();
}

}  // namespace

FileSystemKind fileSystemKindOf(std::string_view type) {
    if (isAmong(kLocalOfTheKernel, type) || isAmong(kLocalOfOthers, type))
        return FileSystemKind::Local;
    if (isAmong(kNfs, type))
        return FileSystemKind::Nfs;
    if (isAmong(kRemote, type) || isAmong(kRemoteOfFuse, type))
        return FileSystemKind::Remote;
    return FileSystemKind::Other;
}

bool answersAtOnce(std::string_view type) {
    return isAmong(kLocalOfTheKernel, type) || isAmong(kPassed, type);
}

bool isTemporary(std::string_view type) {
    return type == "tmpfs" || type == "ramfs";
}

}  // namespace cimomd
