#include "host/program/system/FileSystemKind.h"

#include <fcntl.h>
#include <linux/capability.h>
#include <linux/magic.h>
#include <sys/stat.h>
#include <sys/syscall.h>
#include <sys/sysmacros.h>
#include <sys/vfs.h>
#include <unistd.h>

#include <algorithm>
#include <cerrno>
#include <csignal>
#include <iterator>
#include <string>

namespace {

constexpr std::uint32_t Shares[] = {
    NFS_SUPER_MAGIC,  SMB_SUPER_MAGIC, CIFS_SUPER_MAGIC,  SMB2_SUPER_MAGIC,
    AFS_SUPER_MAGIC,  AFS_FS_MAGIC,    V9FS_MAGIC,        CEPH_SUPER_MAGIC,
    CODA_SUPER_MAGIC, NCP_SUPER_MAGIC, OCFS2_SUPER_MAGIC,
    0x01161970, // GFS2
    0x0bd00bd0, // Lustre
    0x47504653, // GPFS
    0x19830326, // BeeGFS
    0x20030528, // OrangeFS
    0x786f4256, // a virtual machine's folder of its host, by three makers
    0xbacbacbc,       0x7c7c6673,
};

/// A file system of a program's is a share, unless it has a disk of this machine.
bool HasDisk(const std::filesystem::path& folder) {
    struct stat found = {};
    return stat(folder.c_str(), &found) == 0 && major(found.st_dev) != 0;
}

bool IsRegular(int descriptor) {
    struct stat found = {};
    return fstat(descriptor, &found) == 0 && S_ISREG(found.st_mode);
}

/// Asks for a lease, which the system gives only while nobody writes, and gives it back.
Writers AskForLease(int descriptor) {
    // Whoever opens the file in that moment waits until it is given back, and this process is told
    // by a signal: one that does nothing unless somebody wants it to.
    fcntl(descriptor, F_SETSIG, SIGURG);
    if (fcntl(descriptor, F_SETLEASE, F_RDLCK) == 0) {
        fcntl(descriptor, F_SETLEASE, F_UNLCK);
        return Writers::None;
    }
    return errno == EAGAIN ? Writers::Some : Writers::Unknown;
}

/// Whether this process may ask for a lease on what is not its user's.
bool MayAskOfAll() {
    __user_cap_header_struct header = {_LINUX_CAPABILITY_VERSION_3, 0};
    __user_cap_data_struct sets[_LINUX_CAPABILITY_U32S_3] = {};
    return syscall(SYS_capget, &header, sets) == 0 &&
           (sets[CAP_TO_INDEX(CAP_LEASE)].effective & CAP_TO_MASK(CAP_LEASE)) != 0;
}

/// Asks for a lease on a file in the folder that has no name.
Writers AskForLeaseIn(const std::filesystem::path& folder) {
    const int written = open(folder.c_str(), O_TMPFILE | O_RDWR | O_CLOEXEC, 0600);
    if (written < 0) // where there are none, there are leases mostly
        return errno == EOPNOTSUPP ? Writers::None : Writers::Unknown;
    const std::string path = "/proc/self/fd/" + std::to_string(written);
    const int descriptor = open(path.c_str(), O_RDONLY | O_CLOEXEC);
    close(written);
    const Writers writers = descriptor < 0 ? Writers::Unknown : AskForLease(descriptor);
    if (descriptor >= 0)
        close(descriptor);
    return writers;
}

} // namespace

bool IsShare(const std::filesystem::path& folder) {
    struct statfs found = {};
    if (statfs(folder.c_str(), &found) != 0)
        return false;
    const auto kind = static_cast<std::uint32_t>(found.f_type);
    return kind == FUSE_SUPER_MAGIC
               ? !HasDisk(folder)
               : std::find(std::begin(Shares), std::end(Shares), kind) != std::end(Shares);
}

Writers AskForWriters(const std::filesystem::path& file) {
    const int descriptor = open(file.c_str(), O_RDONLY | O_NONBLOCK | O_NOFOLLOW | O_CLOEXEC);
    if (descriptor < 0) // somebody else has a lease, to write
        return errno == EWOULDBLOCK ? Writers::Some : Writers::Unknown;
    const Writers writers = IsRegular(descriptor) ? AskForLease(descriptor) : Writers::Unknown;
    close(descriptor);
    return writers;
}

WritersKnown WritersKnownIn(const std::filesystem::path& folder) {
    if (IsShare(folder) || AskForLeaseIn(folder) == Writers::Unknown)
        return WritersKnown::OfNone;
    return MayAskOfAll() ? WritersKnown::OfAll : WritersKnown::OfOwn;
}
