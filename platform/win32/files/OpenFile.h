#pragma once

#include "platform/win32/base/HandleTable.h"

#include <windows.h>

#include <memory>

namespace win32 {

/// How a file is to be opened; the fields are CreateFileW's.
struct OpenRequest {
    DWORD access;
    DWORD share;
    DWORD disposition;
};

/// A regular file that is open, with its share mode as an advisory lock. Closes itself.
class OpenFile {
public:
    /// Never waits: not for a lock, and not for the other end of a FIFO, which is refused.
    /// @param file receives the file
    /// @return a system error code
    static DWORD Open(LPCWSTR name, const OpenRequest& request, std::shared_ptr<OpenFile>& file);

    OpenFile(int descriptor, DWORD access) : m_descriptor(descriptor), m_access(access) {}
    OpenFile(const OpenFile&) = delete;
    OpenFile& operator=(const OpenFile&) = delete;
    ~OpenFile();

    int Descriptor() const { return m_descriptor; }
    bool MayRead() const { return (m_access & GENERIC_READ) != 0; }
    bool MayWrite() const { return (m_access & GENERIC_WRITE) != 0; }

private:
    bool IsRegular() const;
    bool Lock(DWORD share) const;

    int m_descriptor;
    DWORD m_access;
};

/// The file handles of the process.
HandleTable<OpenFile>& FileHandles();

} // namespace win32
