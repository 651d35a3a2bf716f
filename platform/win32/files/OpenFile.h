#pragma once

#include "platform/win32/files/ShareTable.h"
#include "platform/win32/handles/HandleTable.h"

#include <windows.h>

#include <memory>
#include <string>

namespace win32 {

/// How a file is to be opened; the fields are CreateFileW's.
struct OpenRequest {
    DWORD access;
    DWORD share;
    DWORD disposition;
};

/// A regular file that is open, with its share mode: in the table of this process, and as an
/// advisory lock for other processes. Closes itself.
class OpenFile {
public:
    /// Never waits: not for a lock, and not for the other end of a FIFO, which is refused.
    /// @param file receives the file
    /// @param existed whether the file was there before
    /// @return a system error code
    static DWORD Open(LPCWSTR name, const OpenRequest& request, std::shared_ptr<OpenFile>& file,
                      bool& existed);

    OpenFile(int descriptor, const FileId& id, const ShareMode& mode)
        : m_descriptor(descriptor), m_id(id), m_mode(mode) {}
    OpenFile(const OpenFile&) = delete;
    OpenFile& operator=(const OpenFile&) = delete;
    ~OpenFile();

    int Descriptor() const { return m_descriptor; }
    bool MayRead() const { return m_mode.reads; }
    bool MayWrite() const { return m_mode.writes; }

private:
    bool Lock() const;

    int m_descriptor;
    FileId m_id;
    ShareMode m_mode;
};

/// The file handles of the process.
HandleTable<OpenFile>& FileHandles();

/// The error of a system call on the file at `path`: a missing folder is not a missing file.
DWORD PathError(int number, const std::string& path);

} // namespace win32
