#include "host/program/documents/Workplace.h"

#include "host/program/PathText.h"

#include <windows.h>

#include <wx/utils.h>

namespace fs = std::filesystem;

namespace {

constexpr const char* NamePrefix = ".quillon-";
constexpr const char* MarkName = "in use";

/// Opens the file that marks a workplace as in use; nobody else can while this one has it.
/// @param disposition CREATE_NEW for one's own, OPEN_EXISTING to see whether another is abandoned
/// @return null when it cannot be opened; the file is closed with the last copy
std::shared_ptr<void> OpenMark(const fs::path& workplace, DWORD disposition) {
    const wxString path = ToText(workplace / MarkName).value_or(wxString());
    HANDLE file = CreateFileW(path.wc_str(), GENERIC_READ | GENERIC_WRITE, 0, nullptr, disposition,
                              FILE_ATTRIBUTE_NORMAL, nullptr);
    return file == INVALID_HANDLE_VALUE ? nullptr : std::shared_ptr<void>(file, CloseHandle);
}

} // namespace

std::optional<Workplace> Workplace::Create(const fs::path& outputFolder, wxString& fault) {
    const std::string prefix = NamePrefix + std::to_string(wxGetProcessId()) + '-';
    std::error_code error;
    for (int number = 0; number < 1000; ++number) { // taken: by a process that was ended
        const fs::path path = outputFolder / (prefix + std::to_string(number));
        if (fs::create_directory(path, error)) {
            Workplace workplace(path);
            if (workplace.IsMarked())
                return workplace;
        }
        if (error)
            break;
    }
    fault = "nothing can be written to the output folder";
    if (error)
        fault << ": " << Because(error);
    return std::nullopt;
}

void Workplace::RemoveAbandoned(const fs::path& outputFolder) {
    std::error_code error;
    for (fs::directory_iterator entry(outputFolder, error), end; !error && entry != end;
         entry.increment(error)) {
        const bool isWorkplace = entry->path().filename().u8string().rfind(NamePrefix, 0) == 0;
        std::shared_ptr<void> mark = isWorkplace ? OpenMark(entry->path(), OPEN_EXISTING) : nullptr;
        if (!mark)
            continue;
        std::error_code ignored;
        fs::remove_all(entry->path(), ignored); // while nobody else can mark it
        mark.reset();
        fs::remove_all(entry->path(), ignored); // an open file could not be removed everywhere
    }
}

Workplace::Workplace(fs::path path)
    : m_path(std::move(path)), m_mark(OpenMark(m_path, CREATE_NEW)) {}

/// Another process may take a workplace for abandoned in the moment between the making of its mark
/// and the lock on it. Then there is no lock, or the mark is gone.
bool Workplace::IsMarked() const {
    std::error_code ignored;
    return m_mark && fs::exists(m_path / MarkName, ignored);
}

Workplace::Workplace(Workplace&& other) noexcept
    : m_path(std::move(other.m_path)), m_mark(std::move(other.m_mark)) {
    other.m_path.clear();
}

Workplace::~Workplace() {
    m_mark.reset(); // an open file could not be removed everywhere
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
