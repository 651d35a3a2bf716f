#include "platform/win32/text/Utf8.h"

#include <sys/stat.h>
#include <wchar.h> // NOLINT(modernize-deprecated-headers): Microsoft's wide functions are in it

#include <cerrno>
#include <string_view>

namespace {

struct PathPart {
    wchar_t* buffer; // may be null
    std::size_t size;
    std::wstring_view text;
};

} // namespace

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
    std::wstring_view rest(path ? path : L"");
    const std::size_t driveLength = rest.size() > 1 && rest[1] == L':' ? 2 : 0;
    const std::wstring_view driveText = rest.substr(0, driveLength);
    rest.remove_prefix(driveLength);
    const std::wstring_view dirText = rest.substr(0, rest.find_last_of(L"/\\") + 1);
    rest.remove_prefix(dirText.size());
    const std::wstring_view nameText = rest.substr(0, rest.find_last_of(L'.'));
    rest.remove_prefix(nameText.size());

    const PathPart parts[] = {{drive, _MAX_DRIVE, driveText},
                              {dir, _MAX_DIR, dirText},
                              {name, _MAX_FNAME, nameText},
                              {extension, _MAX_EXT, rest}};
    bool allFit = true;
    for (const PathPart& part : parts)
        allFit = allFit && (!part.buffer || part.text.size() < part.size);
    for (const PathPart& part : parts)
        if (part.buffer) // a part that does not fit leaves them all empty
            part.buffer[allFit ? part.text.copy(part.buffer, part.size - 1) : 0] = L'\0';
}
