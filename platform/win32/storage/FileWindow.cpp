#include "platform/win32/storage/FileWindow.h"

#include <sys/stat.h>
#include <unistd.h>

#include <algorithm>
#include <cerrno>

namespace win32 {

namespace {

constexpr std::size_t UsualLength = 8192;

std::uint64_t SizeOf(const OpenFile& file) {
    struct stat status {};
    return fstat(file.Descriptor(), &status) == 0 ? static_cast<std::uint64_t>(status.st_size) : 0;
}

} // namespace

FileWindow::FileWindow(std::shared_ptr<OpenFile> file)
    : m_file(std::move(file)), m_size(SizeOf(*m_file)) {}

std::size_t FileWindow::ReadSome(BYTE* target, std::uint64_t offset, std::size_t size) const {
    std::size_t done = 0;
    while (m_file && done < size) {
        const ssize_t count = pread(m_file->Descriptor(), target + done, size - done,
                                    static_cast<off_t>(offset + done));
        if (count == 0 || (count < 0 && errno != EINTR))
            break;
        done += count > 0 ? static_cast<std::size_t>(count) : 0;
    }
    return done;
}

const BYTE* FileWindow::At(std::uint64_t offset, std::size_t size) {
    if (offset > m_size || size > m_size - offset)
        return nullptr;
    const auto holds = [=](const Window& window) {
        return offset >= window.start && offset + size <= window.start + window.length;
    };
    auto window = std::find_if(m_windows.begin(), m_windows.end(), holds);
    if (window == m_windows.end()) {
        window = m_windows.begin() + static_cast<std::ptrdiff_t>(m_oldest);
        m_oldest = (m_oldest + 1) % m_windows.size();
        window->start = offset;
        window->bytes.resize(std::min<std::uint64_t>(std::max(size, UsualLength), m_size - offset));
        window->length = ReadSome(window->bytes.data(), offset, window->bytes.size());
    }
    return holds(*window) ? window->bytes.data() + (offset - window->start) : nullptr;
}

bool FileWindow::ReadInto(BYTE* target, std::uint64_t offset, std::size_t size) const {
    return ReadSome(target, offset, size) == size;
}

} // namespace win32
