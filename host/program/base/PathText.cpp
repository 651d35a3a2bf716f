#include "host/program/base/PathText.h"

#include "host/services/OneLine.h"

#include <algorithm>

namespace fs = std::filesystem;

namespace {

bool IsSurrogate(wxUniChar c) {
    return c >= 0xD800 && c <= 0xDFFF;
}

wxString EscapeBytes(const std::string& bytes) {
    wxString text;
    for (const char byte : bytes) {
        const auto value = static_cast<unsigned char>(byte);
        if (value >= 0x20 && value < 0x7F)
            text += byte;
        else
            text += wxString::Format("\\x%02x", static_cast<unsigned>(value));
    }
    return text;
}

} // namespace

fs::path FromArgument(const std::string& utf8) {
    return fs::u8path(utf8);
}

fs::path FromText(const wxString& text) {
    return fs::u8path(text.utf8_string());
}

bool IsText(const fs::path& path) {
    return path.empty() || !ToText(path).empty();
}

wxString ToText(const fs::path& path) {
    const wxString text = wxString::FromUTF8(path.u8string());
    // Three bytes can spell half a surrogate pair, which the conversion above lets through where
    // a wchar_t has 32 bits; UTF-8 has no such letters.
    const bool hasHalves =
        sizeof(wchar_t) == 4 && std::any_of(text.begin(), text.end(), IsSurrogate);
    return hasHalves ? wxString() : text;
}

wxString Shown(const fs::path& path) {
    return IsText(path) ? OneLine(ToText(path)) : EscapeBytes(path.u8string());
}
