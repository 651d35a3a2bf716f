#include "standins/office/inprocess/DocumentFormat.h"

#include "standins/shared/Text.h"

#include <glib.h>

namespace standins {

const DocumentFormat* FindFormat(const std::vector<DocumentFormat>& formats,
                                 const std::wstring& path) {
    const std::wstring name = FileName(path);
    const std::size_t dot = name.rfind(L'.');
    if (dot == std::wstring::npos)
        return nullptr;
    const std::string extension = ToUtf8(name.substr(dot + 1)).value_or(std::string());
    for (const DocumentFormat& format : formats) {
        if (g_ascii_strcasecmp(format.extension, extension.c_str()) == 0)
            return &format;
    }
    return nullptr;
}

} // namespace standins
