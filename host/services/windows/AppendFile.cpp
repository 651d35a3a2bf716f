#include "host/services/AppendFile.h"

#include <windows.h>

#include <string>

namespace {

HANDLE HandleOf(std::intptr_t file) {
    return reinterpret_cast<HANDLE>(file); // NOLINT(performance-no-int-to-ptr)
}

/// All of the line or nothing that anybody would miss: the console and pipes may take it in parts.
void Write(HANDLE file, std::string_view line) {
    DWORD written = 0;
    while (!line.empty() &&
           WriteFile(file, line.data(), static_cast<DWORD>(line.size()), &written, nullptr) &&
           written > 0)
        line.remove_prefix(written);
}

bool IsConsole(HANDLE file) {
    DWORD mode = 0;
    return GetConsoleMode(file, &mode) != FALSE;
}

/// Keeps all other writers of the file out, those of other processes too. Only a local disk keeps
/// appended lines whole by itself. The lock stands where no file reaches, so that readers do not
/// meet it.
class WriterLock {
public:
    explicit WriterLock(HANDLE file) : m_file(file) {
        m_locked = LockFileEx(m_file, LOCKFILE_EXCLUSIVE_LOCK, 0, 1, 0, &m_place) != FALSE;
    }
    ~WriterLock() {
        if (m_locked)
            UnlockFileEx(m_file, 0, 1, 0, &m_place);
    }
    WriterLock(const WriterLock&) = delete;
    WriterLock& operator=(const WriterLock&) = delete;

private:
    static OVERLAPPED BehindEverything() {
        OVERLAPPED place = {};
        place.OffsetHigh = 0x7FFFFFFF;
        return place;
    }

    HANDLE m_file;
    OVERLAPPED m_place = BehindEverything();
    bool m_locked = false;
};

} // namespace

AppendFile::~AppendFile() {
    if (IsOpen())
        CloseHandle(HandleOf(m_file));
}

bool AppendFile::Open(const std::filesystem::path& path) {
    HANDLE file = CreateFileW(path.c_str(), FILE_APPEND_DATA | SYNCHRONIZE,
                              FILE_SHARE_READ | FILE_SHARE_WRITE | FILE_SHARE_DELETE, nullptr,
                              OPEN_ALWAYS, FILE_ATTRIBUTE_NORMAL, nullptr);
    if (file == INVALID_HANDLE_VALUE)
        return false;
    const std::intptr_t before = m_file.exchange(reinterpret_cast<std::intptr_t>(file));
    if (before != None)
        CloseHandle(HandleOf(before));
    return true;
}

void AppendFile::Append(std::string_view line) const {
    if (!IsOpen())
        return;
    HANDLE file = HandleOf(m_file);
    const WriterLock lock(file);
    Write(file, line);
}

void AppendFile::AppendToStandardError(std::string_view line) {
    HANDLE file = GetStdHandle(STD_ERROR_HANDLE);
    static const bool s_console = IsConsole(file);
    if (s_console)
        Write(file, "\r\x1b[K" + std::string(line));
    else
        Write(file, line);
}
