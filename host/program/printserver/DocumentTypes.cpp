#include "host/program/printserver/DocumentTypes.h"

#include <wx/tokenzr.h>

#include <algorithm>

namespace {

constexpr std::size_t LongestBaseName = 60; // letters; four bytes each at most
constexpr std::size_t LongestEnding = 10;

/// Whether a letter of a title can be none of a file's name, or not everywhere.
bool IsAwkward(wxUniChar letter) {
    const bool isHalf = letter >= 0xD800 && letter <= 0xDFFF;
    return letter < 0x20 || letter == 0x7F || isHalf ||
           wxString("*?\"<>|:").find(letter) != wxString::npos;
}

/// The title's last part, when it is a path.
wxString Clean(const std::string& title) {
    wxString name = wxString::FromUTF8(title);
    if (name.empty()) // bytes that are something else
        name = wxString::From8BitData(title.data(), title.size());
    name = name.AfterLast('/').AfterLast('\\');
    for (wxUniCharRef letter : name)
        if (IsAwkward(letter))
            letter = '_';
    const std::size_t first = name.find_first_not_of(".~ "); // not a hidden file, nor a lock
    return first == wxString::npos ? wxString() : name.substr(first);
}

/// @return null when the type is none of Office documents
const DocumentType* FindType(const std::string& type) {
    const auto* const found =
        std::find_if(std::begin(DocumentTypes), std::end(DocumentTypes),
                     [&type](const DocumentType& each) { return type == each.name; });
    return found == std::end(DocumentTypes) ? nullptr : found;
}

} // namespace

wxString DocumentName(const std::string& title, const std::string& type) {
    const wxString name = Clean(title);
    wxString ending;
    wxString base = name.BeforeLast('.', &ending);
    if (!name.Contains(".")) {
        base = name;
        ending.clear();
    }
    if (const DocumentType* const known = FindType(type)) {
        const wxArrayString endings = wxStringTokenize(known->endings);
        if (endings.Index(ending, false) == wxNOT_FOUND) {
            base = name;
            ending = endings[0];
        }
    }
    base = base.Left(LongestBaseName).Strip(wxString::both);
    if (base.empty())
        base = "document";
    return ending.empty() ? base : base + "." + ending.Left(LongestEnding);
}
