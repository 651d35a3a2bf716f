#include "host/services/OneLine.h"

#include <string>

namespace {

bool IsHighSurrogate(wchar_t c) {
    return c >= 0xD800 && c <= 0xDBFF;
}

bool IsLowSurrogate(wchar_t c) {
    return c >= 0xDC00 && c <= 0xDFFF;
}

/// Two characters that are one where a wchar_t has 16 bits.
bool IsPair(const std::wstring& text, std::size_t at) {
    return sizeof(wchar_t) == 2 && at + 1 < text.size() && IsHighSurrogate(text[at]) &&
           IsLowSurrogate(text[at + 1]);
}

bool NeedsEscape(wchar_t c) {
    const bool control = c < 0x20 || (c >= 0x7F && c <= 0x9F);
    const bool separator = c == 0x2028 || c == 0x2029;
    const bool direction =
        c == 0x200E || c == 0x200F || (c >= 0x202A && c <= 0x202E) || (c >= 0x2066 && c <= 0x2069);
    return control || separator || direction || IsHighSurrogate(c) || IsLowSurrogate(c);
}

wxString Escape(wchar_t c) {
    switch (c) {
    case L'\n':
        return "\\n";
    case L'\r':
        return "\\r";
    case L'\t':
        return "\\t";
    default:
        const wxUint32 code = wxUniChar(c).GetValue();
        return wxString::Format(code < 0x100 ? "\\x%02x" : "\\u%04x", code);
    }
}

} // namespace

wxString OneLine(const wxString& text) {
    const std::wstring& characters = text.ToStdWstring();
    wxString line;
    line.reserve(characters.size());
    for (std::size_t i = 0; i < characters.size(); ++i) {
        if (IsPair(characters, i)) {
            line += characters[i];
            line += characters[++i];
        } else if (NeedsEscape(characters[i])) {
            line += Escape(characters[i]);
        } else {
            line += characters[i];
        }
    }
    return line;
}
