#include "platform/win32/files/OpenFile.h"

#include "platform/win32/errors/ErrorCodes.h"
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
    const bool truncates =
        request.disposition == CREATE_ALWAYS || request.disposition == TRUNCATE_EXISTING;
    const bool writes = (request.access & GENERIC_WRITE) != 0 || truncates;
    const int access = !writes ? O_RDONLY : reads ? O_RDWR : O_WRONLY;
    return access | O_CLOEXEC | O_NOCTTY | O_NONBLOCK;
}

/// @return a descriptor, or -1 with errno set
int OpenDescriptor(const char* path, const OpenRequest& request, bool& existed) {
    const int flags = OpenFlags(request);
    constexpr mode_t Everybody = 0666; // less what the process's mask takes away
    existed = true;
    if (request.disposition != CREATE_NEW) {
        const int descriptor = open(path, flags);
        const bool mayCreate =
            request.disposition == CREATE_ALWAYS || request.disposition == OPEN_ALWAYS;
        if (descriptor >= 0 || errno != ENOENT || !mayCreate)
            return descriptor;
    }
    existed = false;
    const int exclusive = request.disposition == CREATE_NEW ? O_EXCL : 0;
    return open(path, flags | O_CREAT | exclusive, Everybody);
}

} // namespace

DWORD OpenFile::Open(LPCWSTR name, const OpenRequest& request, std::shared_ptr<OpenFile>& file,
                     bool& existed) {
    if (!name || !*name)
        return ERROR_PATH_NOT_FOUND;
    const std::optional<std::string> path = ToUtf8(name);
    if (!path)
        return ERROR_INVALID_NAME;
    const int descriptor = OpenDescriptor(path->c_str(), request, existed);
    if (descriptor < 0)
        return PathError(errno, *path);

    struct stat status {};
    if (fstat(descriptor, &status) != 0 || !S_ISREG(status.st_mode)) {
        close(descriptor);
        return ERROR_ACCESS_DENIED;
    }
    const FileId id{status.st_dev, status.st_ino};
    const ShareMode mode{(request.access & GENERIC_READ) != 0,
                         (request.access & GENERIC_WRITE) != 0, request.share};
    if (!ShareTable::Instance().Enter(id, mode)) {
        close(descriptor);
        return ERROR_SHARING_VIOLATION;
    }
    auto opened = std::make_shared<OpenFile>(descriptor, id, mode);
    if (!opened->Lock())
        return ERROR_SHARING_VIOLATION;
    const bool truncates =
        request.disposition == CREATE_ALWAYS || request.disposition == TRUNCATE_EXISTING;
    if (truncates && existed && ftruncate(descriptor, 0) != 0)
        return ErrorFromErrno(errno);
    file = std::move(opened);
    return ERROR_SUCCESS;
}

/// Tells other processes: one that shares nothing keeps all others out, any other keeps those out
/// that share nothing.
/// @return false when another process's lock is in the way
bool OpenFile::Lock() const {
    if (!m_mode.reads && !m_mode.writes)
        return true;
    const bool exclusive = (m_mode.share & (FILE_SHARE_READ | FILE_SHARE_WRITE)) == 0;
    const int operation = (exclusive ? LOCK_EX : LOCK_SH) | LOCK_NB;
    return flock(m_descriptor, operation) == 0 || errno != EWOULDBLOCK; // some cannot lock at all
}

OpenFile::~OpenFile() {
    // A process that is being started may hold a copy of the descriptor, and a lock with it.
    flock(m_descriptor, LOCK_UN);
    ShareTable::Instance().Leave(m_id, m_mode);
    close(m_descriptor);
}

HandleTable<OpenFile>& FileHandles() {
    static HandleTable<OpenFile> handles;
    return handles;
}

DWORD PathError(int number, const std::string& path) {
    if (number == ENOENT) {
        const std::filesystem::path folder = std::filesystem::path(path).parent_path();
        std::error_code ignored;
        if (!folder.empty() && !std::filesystem::is_directory(folder, ignored))
            return ERROR_PATH_NOT_FOUND;
    }
    return ErrorFromErrno(number);
}

} // namespace win32
