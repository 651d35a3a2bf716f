#include "host/program/printserver/ServerParts.h"

#include "host/program/base/PathText.h"
#include "host/program/printserver/DocumentTypes.h"
#include "host/program/system/DurableMove.h"

#include <wx/intl.h>
#include <wx/tokenzr.h>

#include <cctype>
#include <cerrno>
#include <fstream>
#include <iterator>

namespace fs = std::filesystem;

namespace {

/// The line by which a file is known as one of these.
constexpr const char* Mark =
    "# Made by `quillon print-server install`, and taken out by `quillon print-server remove`.\n";

/// The rules for names with an ending as people write it. CUPS has sets of letters for this,
/// but 2.4 does not take them.
std::string RulesFor(const std::string& ending) {
    std::string capital = ending;
    std::string first = ending;
    for (char& letter : capital)
        letter = static_cast<char>(std::toupper(static_cast<unsigned char>(letter)));
    first.front() = capital.front();
    return ending + ' ' + capital + ' ' + first;
}

/// What is called an Office document goes through this program, whatever it is: it says why when
/// it is something else. Somebody else's rule for plain text would have it printed as that.
std::string TypesText() {
    std::string text = Mark;
    for (const DocumentType& type : DocumentTypes) {
        text += std::string(type.name) + " priority(120)";
        for (const wxString& ending : wxStringTokenize(type.endings))
            text += " " + RulesFor(ending.utf8_string());
        if (type.content)
            text += std::string(" (") + type.content + ")";
        text += '\n';
    }
    return text;
}

std::string ConversionsText() {
    std::string text = Mark;
    for (const DocumentType& type : DocumentTypes)
        text += std::string(type.name) + " application/postscript 40 quillon\n";
    return text;
}

std::string FilterText(const fs::path& program) {
    wxString quoted = ToText(program);
    quoted.Replace("'", R"('\'')");
    return std::string("#!/bin/sh\n") + Mark + "exec '" + quoted.utf8_string() +
           "' filter \"$@\"\n";
}

Fault NotWritten(const fs::path& path, const std::error_code& error) {
    return {wxString::Format(_("%s cannot be written: %s"), Shown(path), Because(error)),
            Blame::Machine, ConversionFailed,
            error == std::errc::permission_denied ? _("Run it as root") : wxString()};
}

std::error_code Write(const fs::path& path, const std::string& text) {
    std::ofstream file(path, std::ios::binary | std::ios::trunc);
    file << text;
    file.close();
    return file ? std::error_code() : std::error_code(errno, std::generic_category());
}

} // namespace

ServerPart::State ServerPart::Look() const {
    std::error_code error;
    const fs::file_type type = fs::symlink_status(path, error).type();
    if (type == fs::file_type::not_found)
        return State::Missing;
    std::ifstream file(path, std::ios::binary);
    const std::string found(std::istreambuf_iterator<char>(file), {});
    if (type != fs::file_type::regular || found.find(Mark) == std::string::npos)
        return State::Foreign;
    return found == text ? State::InPlace : State::Outdated;
}

std::optional<Fault> ServerPart::PutIn() const {
    using fs::perms;
    const fs::path written = path.parent_path() / ("." + path.filename().string() + ".new");
    const perms forAll =
        perms::owner_read | perms::owner_write | perms::group_read | perms::others_read;
    const perms toRun = perms::owner_exec | perms::group_exec | perms::others_exec;
    std::error_code error = Write(written, text);
    if (!error)
        fs::permissions(written, isProgram ? forAll | toRun : forAll, error);
    if (!error)
        error = MoveDurably(written, path);
    if (!error)
        return std::nullopt;
    std::error_code ignored;
    fs::remove(written, ignored);
    return NotWritten(path, error);
}

std::optional<Fault> ServerPart::TakeOut() const {
    std::error_code error;
    fs::remove(path, error);
    return error ? std::optional(NotWritten(path, error)) : std::nullopt;
}

std::vector<ServerPart> PartsFor(const PrintServer::Folders& folders, const fs::path& program) {
    return {
        // the types come last, with which it begins, and go first
        {wxTRANSLATE("the filter"), folders.bin / "filter" / "quillon", FilterText(program), true},
        {wxTRANSLATE("the conversions"), folders.root / "quillon.convs", ConversionsText()},
        {wxTRANSLATE("the types of documents"), folders.root / "quillon.types", TypesText()},
    };
}
