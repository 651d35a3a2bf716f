#include "platform/win32/files/OpenFile.h"

#include "platform/win32/base/Errors.h"
#include "platform/win32/text/Utf8.h"

#include <fcntl.h>
#include <sys/file.h>
#include <sys/stat.h>
#include <unistd.h>

#include <cerrno>
#include <filesystem>

namespace win32 {

namespace {

int OpenFlags(const OpenRequest& request) {
    const bool reads = (request.access & GENERIC_READ) != 0;
    const bool writes = (request.access & GENERIC_WRITE) != 0;
    const int access = !writes ? O_RDONLY : reads ? O_RDWR : O_WRONLY;
    const int creation = request.disposition == CREATE_NEW ? O_CREAT | O_EXCL : 0;
    return access | creation | O_CLOEXEC | O_NOCTTY | O_NONBLOCK;
}

/// The error of an open of the file at `path`: a missing folder is not a missing file.
DWORD OpenError(int number, const std::string& path) {
    if (number == ENOENT) {
        const std::filesystem::path folder = std::filesystem::path(path).parent_path();
        std::error_code ignored;
        if (!folder.empty() && !std::filesystem::is_directory(folder, ignored))
            return ERROR_PATH_NOT_FOUND;
    }
    return ErrorFromErrno(number);
}

} // namespace

DWORD OpenFile::Open(LPCWSTR name, const OpenRequest& request, std::shared_ptr<OpenFile>& file) {
    if (!name || !*name)
        return ERROR_PATH_NOT_FOUND;
    const std::optional<std::string> path = ToUtf8(name);
    if (!path)
        return ERROR_INVALID_NAME;
    constexpr mode_t Everybody = 0666; // less what the process's mask takes away
    const int descriptor = open(path->c_str(), OpenFlags(request), Everybody);
    if (descriptor < 0)
        return OpenError(errno, *path);
    auto opened = std::make_shared<OpenFile>(descriptor, request.access);
    if (!opened->IsRegular())
        return ERROR_ACCESS_DENIED;
    if (!opened->Lock(request.share))
        return ERROR_SHARING_VIOLATION;
    file = std::move(opened);
    return ERROR_SUCCESS;
}

bool OpenFile::IsRegular() const {
    struct stat status {};
    return fstat(m_descriptor, &status) == 0 && S_ISREG(status.st_mode);
}

/// Only handles that read, and let others read, go together. A lock is the descriptor's: it holds
/// against the handles of this process as well.
/// @return false when another handle's lock is in the way
bool OpenFile::Lock(DWORD share) const {
    const bool isShared = !MayWrite() && (share & FILE_SHARE_READ) != 0;
    const int operation = (isShared ? LOCK_SH : LOCK_EX) | LOCK_NB;
    return flock(m_descriptor, operation) == 0 || errno != EWOULDBLOCK; // some cannot lock at all
}

OpenFile::~OpenFile() {
    // A process that is being started may hold a copy of the descriptor, and a lock with it.
    flock(m_descriptor, LOCK_UN);
    close(m_descriptor);
}

HandleTable<OpenFile>& FileHandles() {
    static HandleTable<OpenFile> handles;
    return handles;
}

} // namespace win32
