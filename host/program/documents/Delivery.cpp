#include "host/program/documents/Delivery.h"

#include "host/program/base/PathText.h"
#include "host/program/system/DurableMove.h"

#include <wx/filename.h>
#include <wx/intl.h>

namespace fs = std::filesystem;

bool Product::IsThere() const {
    std::error_code error;
    return fs::is_regular_file(fs::symlink_status(m_output, error));
}

wxString Product::OwnBaseName() const {
    return wxFileName(ToText(m_output.filename())).GetName();
}

/// The output last.
std::vector<fs::path> Product::Files() const {
    const wxString own = ToText(m_output.filename());
    const wxString ownBase = OwnBaseName();
    std::vector<fs::path> files;
    std::error_code error;
    for (fs::directory_iterator entry(m_output.parent_path(), error), end; !error && entry != end;
         entry.increment(error)) {
        const wxString name = ToText(entry->path().filename());
        if (name != own && name.StartsWith(ownBase + '.'))
            files.push_back(entry->path());
    }
    files.push_back(m_output);
    return files;
}

std::error_code Product::Sync() const {
    for (const fs::path& file : Files())
        if (const std::error_code error = SyncFile(file))
            return error;
    return SyncFolder(m_output.parent_path());
}

fs::path Product::PlaceOf(const fs::path& file, const fs::path& folder,
                          const wxString& baseName) const {
    return folder / FromText(baseName + ToText(file.filename()).Mid(OwnBaseName().length()));
}

fs::path Product::PlaceIn(const fs::path& folder, const wxString& baseName) const {
    return PlaceOf(m_output, folder, baseName);
}

bool Product::IsTaken(const fs::path& folder, const wxString& baseName) const {
    std::error_code error;
    for (const fs::path& file : Files())
        if (fs::exists(fs::symlink_status(PlaceOf(file, folder, baseName), error)))
            return true;
    return false;
}

std::optional<Fault> Product::MoveTo(const fs::path& folder, const wxString& baseName,
                                     bool replace) const {
    for (const fs::path& file : Files()) {
        const fs::path place = PlaceOf(file, folder, baseName);
        const std::error_code error =
            replace ? MoveDurably(file, place) : MoveWithoutReplacing(file, place);
        if (error && file == m_output) // nobody asks for the others, should one not be there
            return Fault{wxString::Format(_("the output could not be put in place as %s: %s"),
                                          Shown(place), Because(error)),
                         Blame::Machine};
    }
    if (const std::error_code error = SyncFolder(folder))
        return Fault{
            wxString::Format(_("the output is in %s, but may be lost if the power fails: %s"),
                             Shown(folder), Because(error)),
            Blame::Machine};
    return std::nullopt;
}

void Deliver(const Workplace& workplace, const wxString& baseName, const FilterSet& filters,
             Outcome& outcome) {
    if (outcome.made.empty())
        return;
    const fs::path folder = workplace.Path().parent_path();
    const Product product(outcome.made);
    if (const std::optional<Fault> fault = product.MoveTo(folder, baseName, true))
        outcome.End(State::Failed, *fault, filters.ErrorText(fault->code));
    else
        outcome.output = product.PlaceIn(folder, baseName);
    outcome.made.clear();
}
