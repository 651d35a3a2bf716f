#include "platform/win32/text/Environment.h"

#include "platform/win32/text/Utf8.h"

#include <cstdlib>

namespace win32 {

std::wstring ExpandEnvironment(const std::wstring& text) {
    std::wstring expanded;
    std::size_t position = 0;
    while (position < text.size()) {
        const std::size_t opening = text.find(L'%', position);
        const std::size_t closing =
            opening == std::wstring::npos ? opening : text.find(L'%', opening + 1);
        if (closing == std::wstring::npos)
            break;
        expanded.append(text, position, opening - position);
        const auto name =
            ToUtf8(std::wstring_view(text).substr(opening + 1, closing - opening - 1));
        const char* value = name && !name->empty() ? std::getenv(name->c_str()) : nullptr;
        if (value) {
            expanded += FromUtf8(value);
            position = closing + 1;
        } else {
            expanded.append(text, opening, closing - opening);
            position = closing; // this sign may open the next name
        }
    }
    return expanded.append(text, position);
}

} // namespace win32
