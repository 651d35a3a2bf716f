#include "host/program/Workplace.h"

#include "host/program/PathText.h"

#include <wx/utils.h>

namespace fs = std::filesystem;

namespace {

wxString Because(const std::error_code& error) {
    return wxString::FromUTF8(error.message());
}

} // namespace

std::optional<Workplace> Workplace::Create(const fs::path& outputFolder, wxString& fault) {
    const std::string prefix = ".quillon-" + std::to_string(wxGetProcessId()) + '-';
    std::error_code error;
    for (int number = 0; number < 1000; ++number) { // taken: by a process that was ended
        const fs::path path = outputFolder / (prefix + std::to_string(number));
        if (fs::create_directory(path, error))
            return Workplace(path);
        if (error)
            break;
    }
    fault = "nothing can be written to the output folder: " + Because(error);
    return std::nullopt;
}

Workplace::Workplace(Workplace&& other) noexcept : m_path(std::move(other.m_path)) {
    other.m_path.clear();
}

Workplace::~Workplace() {
    std::error_code ignored;
    if (!m_path.empty())
        fs::remove_all(m_path, ignored);
}

bool Workplace::Deliver(const wxString& name, const wxString& newName, wxString& fault) const {
    const fs::path from = m_path / FromText(name);
    const fs::path to = m_path.parent_path() / FromText(newName);
    std::error_code error;
    fs::rename(from, to, error);
    if (error)
        fault = "the output could not be put in place as " + Shown(to) + ": " + Because(error);
    return !error;
}
