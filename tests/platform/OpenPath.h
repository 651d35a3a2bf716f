#pragma once

#include "common/UniqueHandle.h"

#include <filesystem>

/// Opens a file by CreateFileW; the last error is the call's.
inline FileHandle OpenPath(const std::filesystem::path& path, DWORD access, DWORD share,
                           DWORD disposition = OPEN_EXISTING) {
    return FileHandle(CreateFileW(path.wstring().c_str(), access, share, nullptr, disposition,
                                  FILE_ATTRIBUTE_NORMAL, nullptr));
}
