#include "standins/shared/NewFile.h"

#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

#include <cerrno>
#include <cstdio>
#include <random>

namespace standins {

namespace {

constexpr mode_t EverybodysFile = 0666; // less what the user's mask takes away

std::string FolderOf(const std::string& path) {
    const std::size_t slash = path.rfind('/');
    return slash == std::string::npos ? "." : path.substr(0, slash + 1);
}

std::string HiddenName() {
    char name[20];
    std::snprintf(name, sizeof name, "/.quillon-%08x", std::random_device()());
    return name;
}

/// Whether there is something at the path that must not be replaced: a device, a pipe, a folder.
int CheckTarget(const std::string& path) {
    struct stat status {};
    if (stat(path.c_str(), &status) != 0)
        return errno == ENOENT ? 0 : errno;
    if (S_ISDIR(status.st_mode))
        return EISDIR;
    return S_ISREG(status.st_mode) ? 0 : EEXIST;
}

bool HasNoUnnamedFiles(int error) {
    return error == EOPNOTSUPP || error == EISDIR || error == EINVAL || error == ENOENT;
}

} // namespace

NewFile::NewFile(const std::string& path)
    : m_path(path), m_folder(FolderOf(path)), m_error(CheckTarget(path)) {
    if (m_error != 0)
        return;
    m_file = Descriptor(open(m_folder.c_str(), O_TMPFILE | O_WRONLY | O_CLOEXEC, EverybodysFile));
    if (!m_file.IsOpen() && HasNoUnnamedFiles(errno)) {
        const std::string hidden = m_folder + HiddenName();
        m_file = Descriptor(
            open(hidden.c_str(), O_WRONLY | O_CREAT | O_EXCL | O_CLOEXEC, EverybodysFile));
        if (m_file.IsOpen())
            m_hiddenPath = hidden;
    }
    if (!m_file.IsOpen())
        m_error = errno;
}

NewFile::~NewFile() {
    if (!m_hiddenPath.empty())
        unlink(m_hiddenPath.c_str());
}

int NewFile::Appear() {
    if (m_hiddenPath.empty() && GiveHiddenName() != 0)
        return m_error;
    if (rename(m_hiddenPath.c_str(), m_path.c_str()) != 0)
        return m_error = errno;
    m_hiddenPath.clear();
    return 0;
}

/// linkat cannot replace a file, rename can.
int NewFile::GiveHiddenName() {
    const std::string hidden = m_folder + HiddenName();
    const std::string file = "/proc/self/fd/" + std::to_string(m_file.Get());
    if (linkat(AT_FDCWD, file.c_str(), AT_FDCWD, hidden.c_str(), AT_SYMLINK_FOLLOW) != 0)
        return m_error = errno;
    m_hiddenPath = hidden;
    return 0;
}

} // namespace standins
