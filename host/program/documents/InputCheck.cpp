#include "host/program/documents/InputCheck.h"

#include "host/program/base/PathText.h"
#include "plugin/interface/ResultCodes.h"

#include <wx/intl.h>

#include <cerrno>
#include <cstring>
#include <fstream>
#include <string_view>

namespace fs = std::filesystem;

namespace {

using namespace std::string_view_literals;

wxString DescribeKind(fs::file_type type) {
    switch (type) {
    case fs::file_type::directory:
        return _("it is a folder that cannot be read");
    case fs::file_type::fifo:
        return _("it is a named pipe, not a file");
    case fs::file_type::socket:
        return _("it is a socket, not a file");
    default:
        return _("it is a device, not a file");
    }
}

struct Signature {
    std::string_view bytes;
    const char* meaning; ///< in English
};

constexpr std::string_view Zip = "PK\x03\x04"sv;
constexpr std::string_view CompoundFile = "\xD0\xCF\x11\xE0\xA1\xB1\x1A\xE1"sv;

constexpr const char* Markup =
    wxTRANSLATE("it is a web page or XML text; save it from Office in its own format");

constexpr Signature OtherFiles[] = {
    {"%PDF-"sv, wxTRANSLATE("it is a PDF file")},
    {"%!PS"sv, wxTRANSLATE("it is a PostScript file")},
    {"{\\rtf"sv, wxTRANSLATE("it is a Rich Text file; save it as a Word document")},
    {"<"sv, Markup},
    {"\xEF\xBB\xBF<"sv, Markup},
};

bool BeginsWith(std::string_view text, std::string_view beginning) {
    return text.substr(0, beginning.size()) == beginning;
}

std::string FirstBytes(const fs::path& file) {
    std::ifstream stream(file, std::ios::binary);
    char bytes[16] = {};
    stream.read(bytes, sizeof bytes);
    return {bytes, static_cast<std::size_t>(stream.gcount())};
}

Fault Refusal(int code, const wxString& reason) {
    return {reason, Blame::Document, code};
}

Fault Unreadable(const std::error_code& error) {
    const wxString reason = wxString::Format(_("it cannot be read: %s"), Because(error));
    if (error == std::errc::too_many_files_open ||
        error == std::errc::too_many_files_open_in_system ||
        error == std::errc::not_enough_memory || error == std::errc::io_error)
        return {reason, Blame::Machine};
    return Refusal(Result::InputFileNotFound, reason);
}

wxString CouldNotOpen(const wxString& extension, const wxString& toldByEngine) {
    return wxString::Format(
        _("its application could not open it: %s"),
        toldByEngine.empty()
            ? wxString::Format(_("it is damaged, or no .%s document; the log says more"), extension)
            : toldByEngine);
}

} // namespace

std::optional<Fault> CheckInput(const Input& input) {
    const fs::path& file = input.full;
    if (!IsText(file))
        return Refusal(Result::InvalidInputFile, _("its name is not valid UTF-8 text; rename it"));
    std::error_code error;
    const fs::file_status status = fs::status(file, error);
    if (status.type() == fs::file_type::not_found)
        return Refusal(Result::InputFileNotFound, _("there is no such file"));
    if (!fs::status_known(status))
        return Refusal(Result::InputFileNotFound,
                       wxString::Format(_("it cannot be reached: %s"), Because(error)));
    if (!fs::is_regular_file(status))
        return Refusal(fs::is_directory(status) ? Result::InputFileNotFound
                                                : Result::InvalidInputFile,
                       DescribeKind(status.type()));
    errno = 0;
    if (!std::ifstream(file, std::ios::binary).is_open())
        return Unreadable({errno, std::generic_category()});
    if (fs::file_size(file, error) == 0 && !error)
        return Refusal(Result::InvalidInputFile, _("the file is empty"));
    return std::nullopt;
}

wxString DescribeInvalid(const Input& input, const wxString& toldByEngine) {
    const std::string beginning = FirstBytes(input.full);
    const wxString extension = ExtensionOf(input).Lower();
    const bool openXml = extension.EndsWith("x");
    if (BeginsWith(beginning, Zip) && extension == "pub")
        return _("it is a ZIP package, not a publication");
    if (BeginsWith(beginning, Zip))
        return openXml ? CouldNotOpen(extension, toldByEngine)
                       : wxString::Format(_("it is a ZIP package: probably a .%sx renamed to .%s"),
                                          extension, extension);
    if (BeginsWith(beginning, CompoundFile) && !toldByEngine.empty())
        return CouldNotOpen(extension, toldByEngine);
    if (BeginsWith(beginning, CompoundFile))
        return wxString::Format(
            openXml ? _("it is protected by a password, or an older document renamed to .%s")
                    : _("it is damaged, or a document of another application than .%s"),
            extension);
    for (const Signature& other : OtherFiles)
        if (BeginsWith(beginning, other.bytes))
            return wxGetTranslation(other.meaning);
    return _("its content is not an Office document");
}
