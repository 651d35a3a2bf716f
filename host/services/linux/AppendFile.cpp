#include "host/services/AppendFile.h"

#include <fcntl.h>
#include <unistd.h>

#include <cerrno>
#include <string>

namespace {

/// One call for the whole line, since that is what the kernel keeps together.
void WriteOnce(int descriptor, std::string_view line) {
    ssize_t written = 0;
    do {
        written = write(descriptor, line.data(), line.size());
    } while (written < 0 && errno == EINTR);
}

} // namespace

AppendFile::~AppendFile() {
    if (IsOpen())
        close(static_cast<int>(m_file));
}

bool AppendFile::Open(const std::filesystem::path& path) {
    // A FIFO without a reader would hold the program up; O_NONBLOCK means nothing to a file.
    const int descriptor =
        open(path.c_str(), O_WRONLY | O_CREAT | O_APPEND | O_CLOEXEC | O_NONBLOCK, 0666);
    if (descriptor < 0)
        return false;
    const std::intptr_t before = m_file.exchange(descriptor);
    if (before != None)
        close(static_cast<int>(before));
    return true;
}

void AppendFile::Append(std::string_view line) const {
    if (IsOpen())
        WriteOnce(static_cast<int>(m_file), line);
}

void AppendFile::AppendToStandardError(std::string_view line) {
    static const bool s_terminal = isatty(STDERR_FILENO) != 0;
    if (s_terminal)
        WriteOnce(STDERR_FILENO, "\r\x1b[K" + std::string(line));
    else
        WriteOnce(STDERR_FILENO, line);
}
