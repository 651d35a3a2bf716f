#include "platform/win32/log/LogSink.h"
#include "platform/win32/text/Utf8.h"

#include <sys/stat.h>
#include <wchar.h> // NOLINT(modernize-deprecated-headers): Microsoft's wide functions are in it

#include <cerrno>

int _wstat64(const wchar_t* path, struct __stat64* status) {
    if (!path || !status) {
        errno = EINVAL;
        return -1;
    }
    const std::optional<std::string> utf8 = win32::ToUtf8(path);
    if (!utf8) {
        errno = ENOENT; // no file can have such a name
        return -1;
    }
    struct stat found {};
    if (stat(utf8->c_str(), &found) != 0)
        return -1;
    status->st_size = found.st_size;
    return 0;
}

void _wsplitpath(const wchar_t* path, wchar_t* drive, wchar_t* dir, wchar_t* name,
                 wchar_t* extension) {
    if (drive || dir || name)
        win32::Log("_wsplitpath: only the extension can be had");
    const std::wstring_view whole(path ? path : L"");
    const std::wstring_view file = whole.substr(whole.find_last_of(L"/\\") + 1);
    const std::size_t dot = file.find_last_of(L'.');
    const std::wstring_view found = dot == std::wstring_view::npos ? L"" : file.substr(dot);
    const std::size_t length = found.size() < _MAX_EXT ? found.copy(extension, _MAX_EXT) : 0;
    extension[length] = L'\0';
}
