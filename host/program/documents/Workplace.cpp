#include "host/program/documents/Workplace.h"

#include "host/program/base/PathText.h"

#include <windows.h>

#include <wx/intl.h>
#include <wx/regex.h>
#include <wx/utils.h>

#include <chrono>

namespace fs = std::filesystem;
using namespace std::chrono_literals;

namespace {

constexpr const char* MarkName = "in use";

/// How long a workplace may be without its mark. From one to the other is a moment, unless the
/// program is stopped in between: then it makes another workplace.
constexpr std::chrono::hours LongestUnmarked = 1h;

/// Opens the file that marks a workplace as in use; nobody else can while this one has it.
/// @param disposition CREATE_NEW for one's own, OPEN_EXISTING to see whether another is abandoned
/// @return null when it cannot be opened; the file is closed with the last copy
std::shared_ptr<void> OpenMark(const fs::path& workplace, DWORD disposition) {
    const wxString path = ToText(workplace / MarkName);
    HANDLE file = CreateFileW(path.wc_str(), GENERIC_READ | GENERIC_WRITE, 0, nullptr, disposition,
                              FILE_ATTRIBUTE_NORMAL, nullptr);
    return file == INVALID_HANDLE_VALUE ? nullptr : std::shared_ptr<void>(file, CloseHandle);
}

const char* PrefixOf(Workplace::Kind kind) {
    return kind == Workplace::Kind::OfWatch ? ".quillon-watch-" : ".quillon-";
}

/// Whether it is a folder, and no link to one, with a name such as Create gives.
bool IsWorkplace(const fs::directory_entry& entry, Workplace::Kind kind) {
    static const wxRegEx s_ofRuns(R"(^\.quillon-[0-9]+-[0-9]+$)");
    static const wxRegEx s_ofWatches(R"(^\.quillon-watch-[0-9]+-[0-9]+$)");
    const wxRegEx& names = kind == Workplace::Kind::OfWatch ? s_ofWatches : s_ofRuns;
    std::error_code error;
    return names.Matches(ToText(entry.path().filename())) &&
           fs::is_directory(entry.symlink_status(error));
}

/// Whether nobody else can open the mark that this process has opened. Where a file system has no
/// locks, another may have it as well.
bool IsLocked(const fs::path& workplace) {
    return !OpenMark(workplace, OPEN_EXISTING);
}

/// Whether its program was ended between the making of the workplace and of its mark.
bool IsLeftUnmarked(const fs::path& workplace) {
    std::error_code error;
    const bool isMarked = fs::exists(workplace / MarkName, error);
    if (isMarked || error)
        return false;
    const fs::file_time_type changed = fs::last_write_time(workplace, error);
    return !error && fs::file_time_type::clock::now() - changed > LongestUnmarked;
}

/// The mark goes last: what is left when this program is ended meanwhile can still be told.
void Remove(const fs::path& workplace, std::shared_ptr<void> mark) {
    std::error_code ignored;
    for (fs::directory_iterator entry(workplace, ignored), end; !ignored && entry != end;
         entry.increment(ignored)) {
        std::error_code alsoIgnored;
        if (entry->path().filename() != MarkName)
            fs::remove_all(entry->path(), alsoIgnored);
    }
    fs::remove_all(workplace, ignored); // while nobody else can mark it
    mark.reset();
    fs::remove_all(workplace, ignored); // an open file could not be removed everywhere
}

} // namespace

std::optional<Workplace> Workplace::Create(const fs::path& outputFolder, Fault& fault, Kind kind) {
    const std::string prefix = PrefixOf(kind) + std::to_string(wxGetProcessId()) + '-';
    std::error_code error;
    for (int number = 0; number < 1000; ++number) { // taken: by a process that was ended
        const fs::path path = outputFolder / (prefix + std::to_string(number));
        if (fs::create_directory(path, error)) {
            Workplace workplace(path, OpenMark(path, CREATE_NEW));
            if (workplace.IsMarked())
                return workplace;
        }
        if (error)
            break;
    }
    fault = {error ? wxString::Format(_("nothing can be written to the output folder: %s"),
                                      Because(error))
                   : _("nothing can be written to the output folder"),
             Blame::Machine};
    return std::nullopt;
}

void Workplace::RemoveAbandoned(const fs::path& outputFolder, Kind kind) {
    std::error_code error;
    for (fs::directory_iterator entry(outputFolder, error), end; !error && entry != end;
         entry.increment(error)) {
        if (!IsWorkplace(*entry, kind))
            continue;
        std::shared_ptr<void> mark = OpenMark(entry->path(), OPEN_EXISTING);
        std::error_code ignored;
        if (mark ? IsLocked(entry->path()) : IsLeftUnmarked(entry->path()))
            Remove(entry->path(), std::move(mark));
        else if (!mark) // should its maker be about to mark it, it makes another one
            fs::remove(entry->path(), ignored); // unless something is in it
    }
}

std::optional<Workplace> Workplace::CreateTemporary(Fault& fault) {
    std::error_code error;
    const fs::path folder = fs::temp_directory_path(error);
    if (error) {
        fault = {wxString::Format(_("the folder for temporary files cannot be used: %s"),
                                  Because(error)),
                 Blame::Machine};
        return std::nullopt;
    }
    RemoveAbandoned(folder);
    std::optional<Workplace> workplace = Create(folder, fault);
    if (!workplace)
        fault.what = wxString::Format(_("no folder can be made in %s"), Shown(folder));
    else
        fs::permissions(workplace->Path(), fs::perms::owner_all, error);
    return workplace;
}

std::optional<Workplace> Workplace::TakeOver(const fs::path& path) {
    std::shared_ptr<void> mark = OpenMark(path, OPEN_EXISTING);
    return mark ? std::optional(Workplace(path, std::move(mark))) : std::nullopt;
}

void Workplace::Leave() {
    m_path.clear();
    m_mark.reset();
}

Workplace::Workplace(fs::path path, std::shared_ptr<void> mark)
    : m_path(std::move(path)), m_mark(std::move(mark)) {}

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

Workplace& Workplace::operator=(Workplace&& other) noexcept {
    std::swap(m_path, other.m_path);
    std::swap(m_mark, other.m_mark);
    return *this;
}

Workplace::~Workplace() {
    if (!m_path.empty())
        Remove(m_path, std::move(m_mark));
}
