#include "platform/win32/text/CaseFold.h"

#include <glib.h>

namespace win32 {

std::wstring CaseFold(std::wstring_view name) {
    std::wstring folded(name);
    for (wchar_t& character : folded)
        character = static_cast<wchar_t>(g_unichar_toupper(static_cast<gunichar>(character)));
    return folded;
}

} // namespace win32
