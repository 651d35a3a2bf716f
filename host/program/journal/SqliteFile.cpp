#include "host/program/journal/SqliteFile.h"

#include "common/WQServices.h"
#include "host/program/base/PathText.h"
#include "host/program/journal/SqliteSchema.h"

#include <wx/datetime.h>
#include <wx/intl.h>

namespace fs = std::filesystem;

namespace {

/// What SQLite keeps beside a file, by the endings of their names.
constexpr const char* Companions[] = {"-wal", "-shm"};

/// Up to here it takes a tenth of a second to read all of a file. Damage to a larger one is found
/// where it is met.
constexpr std::uintmax_t LargestChecked = 64 << 20;

fs::path With(fs::path file, const std::string& ending) {
    return file += ending;
}

/// @return why not
std::error_code SetAside(const fs::path& file) {
    const wxString date = wxDateTime::Now().ToUTC().Format("%Y-%m-%dT%H%M%SZ");
    const fs::path aside = With(file, ".damaged-" + date.utf8_string());
    std::error_code error;
    fs::rename(file, aside, error);
    if (error)
        return error;
    for (const char* const ending : Companions) {
        std::error_code hasNone;
        fs::rename(With(file, ending), With(aside, ending), hasNone);
    }
    SetLevelAndGetLogger(LevelWarning, __FILE__, __func__, __LINE__)
        << "The journal " << Shown(file) << " is damaged. It is set aside as " << Shown(aside)
        << ", and a new one begun; documents that were under way may come out twice";
    return {};
}

/// Makes room for a file where there is none. What lies about of one that was removed would be
/// taken for the new one's.
void Prepare(const fs::path& file) {
    std::error_code error;
    if (fs::exists(file, error) || error)
        return;
    fs::create_directories(file.parent_path(), error);
    for (const char* const ending : Companions)
        fs::remove(With(file, ending), error);
}

void CheckContent(SqliteDatabase& database, const fs::path& file) {
    std::error_code error;
    if (const std::uintmax_t size = fs::file_size(file, error); error || size > LargestChecked)
        return;
    SqliteStatement check(database, "PRAGMA quick_check(1)");
    if (check.Next())
        if (const std::string result = check.Bytes(); result != "ok")
            throw SqliteError::Damage(result);
}

Fault FaultOf(const fs::path& file, const SqliteError& error) {
    if (error.MeansLocked())
        return {wxString::Format(_("the journal %s is locked by another program"), Shown(file)),
                Blame::Machine, ConversionFailed, _("Close that, and try again")};
    if (error.MeansDamage())
        return {wxString::Format(_("the journal %s is damaged, or is none"), Shown(file)),
                Blame::Machine, ConversionFailed,
                _("`quillon watch` sets a damaged one aside and begins a new one")};
    return {wxString::Format(_("the journal %s cannot be opened: %s"), Shown(file),
                             wxString::FromUTF8(error.what())),
            Blame::Machine, ConversionFailed,
            _("It belongs to whoever watches the folders, and its folder must be on a local disk")};
}

/// @return null when there is a fault, or the file is damaged and is to be begun anew
std::unique_ptr<SqliteDatabase> TryToOpen(const fs::path& file, JournalNeed need,
                                          std::chrono::milliseconds patience, Fault& fault,
                                          bool& isDamaged) {
    const bool make = need == JournalNeed::Make;
    std::unique_ptr<SqliteDatabase> database;
    try {
        if (make)
            Prepare(file);
        database = std::make_unique<SqliteDatabase>(file, make, patience);
        if (!EnsureSchema(*database, file, make, fault))
            return nullptr;
        if (make)
            CheckContent(*database, file);
        return database;
    } catch (const SqliteError& error) {
        const bool isGone = database && database->IsGone(); // another program has set it aside
        isDamaged = error.MeansDamage() && make && !isGone;
        fault = FaultOf(file, error);
        return nullptr;
    }
}

} // namespace

std::unique_ptr<SqliteDatabase> OpenJournalFile(const fs::path& file, JournalNeed need,
                                                bool isDamaged, std::chrono::milliseconds patience,
                                                Fault& fault) {
    if (!isDamaged)
        if (auto database = TryToOpen(file, need, patience, fault, isDamaged))
            return database;
    if (!isDamaged)
        return nullptr;
    if (const std::error_code error = SetAside(file)) {
        fault = {wxString::Format(_("the journal %s is damaged, and cannot be set aside: %s"),
                                  Shown(file), Because(error)),
                 Blame::Machine};
        return nullptr;
    }
    return TryToOpen(file, need, patience, fault, isDamaged);
}
