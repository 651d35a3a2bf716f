#pragma once

#include "platform/win32/files/OpenFile.h"

#include <array>
#include <memory>
#include <vector>

namespace win32 {

/// Reads a file through a few buffers: the tables of a compound file are many small pieces close
/// together, in a few places that take turns. Not for two threads at once.
class FileWindow {
public:
    explicit FileWindow(std::shared_ptr<OpenFile> file);

    std::uint64_t Size() const { return m_size; }

    /// @return `size` bytes from `offset` on, until the next call; null when the file has not that
    /// many there or cannot be read
    const BYTE* At(std::uint64_t offset, std::size_t size);

    /// Reads past the buffer.
    bool ReadInto(BYTE* target, std::uint64_t offset, std::size_t size) const;

    /// Lets go of the file; nothing can be read any more.
    void Close() { m_file.reset(); }

private:
    struct Window {
        std::uint64_t start = 0;
        std::size_t length = 0;
        std::vector<BYTE> bytes;
    };

    std::size_t ReadSome(BYTE* target, std::uint64_t offset, std::size_t size) const;

    std::shared_ptr<OpenFile> m_file;
    std::uint64_t m_size;
    std::array<Window, 4> m_windows;
    std::size_t m_oldest = 0;
};

} // namespace win32
