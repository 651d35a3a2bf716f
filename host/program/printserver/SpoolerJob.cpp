#include "host/program/printserver/SpoolerJob.h"

#include "host/program/base/PathText.h"
#include "host/program/printserver/DocumentTypes.h"
#include "host/program/system/Interruption.h"
#include "host/program/system/PrintServer.h"

#include <wx/intl.h>
#include <wx/utils.h>

#include <cerrno>
#include <fstream>

namespace fs = std::filesystem;

namespace {

constexpr std::chrono::milliseconds BetweenLooks{50}; // for a request to end

std::string FromEnvironment(const char* name) {
    wxString value;
    wxGetEnv(name, &value);
    return value.utf8_string();
}

/// Copies what comes in until it ends, or the program is to end.
std::error_code CopyStandardInput(const fs::path& copy) {
    std::ofstream file(copy, std::ios::binary);
    std::error_code error;
    while (!Interruption::Requested() && !error) {
        const std::optional<std::string> bytes = PrintServer::ReadInput(BetweenLooks, error);
        if (bytes && bytes->empty())
            break;
        if (bytes && !file.write(bytes->data(), static_cast<std::streamsize>(bytes->size())))
            break;
    }
    file.close();
    if (!file)
        error = {errno, std::generic_category()}; // of the last write
    return error;
}

} // namespace

std::optional<SpoolerJob> SpoolerJob::Read(const std::vector<std::string>& words) {
    if (words.size() < 5 || words.size() > 6)
        return std::nullopt;
    SpoolerJob job;
    job.title = words[2];
    job.options = words[4];
    job.file = words.size() > 5 ? words[5] : std::string();
    job.contentType = FromEnvironment("CONTENT_TYPE");
    job.ppd = FromEnvironment("PPD");
    return job;
}

std::optional<fs::path> SpoolerJob::CopyDocument(const fs::path& folder, Fault& fault) const {
    fs::path copy = folder / FromText(DocumentName(title, contentType));
    std::error_code error;
    if (file.empty())
        error = CopyStandardInput(copy);
    else
        fs::copy_file(FromArgument(file), copy, error);
    if (!error)
        return copy;
    fault = {wxString::Format(_("the document cannot be copied to %s: %s"), Shown(folder),
                              Because(error)),
             Blame::Machine};
    return std::nullopt;
}
