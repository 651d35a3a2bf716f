#include "host/program/PathText.h"
#include "host/program/commands/CommandLine.h"
#include "host/program/commands/Commands.h"
#include "host/program/machine/Engines.h"
#include "host/program/machine/MachineSetup.h"
#include "host/program/machine/MissingParts.h"
#include "host/program/machine/ProgramFiles.h"
#include "host/program/report/Language.h"
#include "host/program/report/LogRoutes.h"
#include "host/program/system/Console.h"
#include "host/program/system/Interruption.h"
#include "host/services/Log.h"

#include <wx/app.h>
#include <wx/init.h>
#include <wx/intl.h>
#include <wx/utils.h>

#include <exception>

namespace {

/// @return whether the log can be kept as asked for
bool StartLog(const CommandLine& line) {
    if (line.verbose)
        Log::ToStandardError(LevelInformation);
    RouteToolkitLog();
    RouteLayerLog();
    return !line.logFile || Log::ToFile(FromArgument(*line.logFile));
}

/// @return whether the language asked for is in use
bool StartLanguage(const CommandLine& line, Reporter& reporter) {
    wxString fault;
    const auto wanted =
        line.language ? std::optional(wxString::FromUTF8(*line.language)) : std::nullopt;
    if (UseLanguage(wanted, fault))
        return true;
    reporter.Error("there are no texts in the language " + *wanted +
                   "; the languages are: " + fault);
    return false;
}

std::filesystem::path FolderOr(const std::optional<std::string>& given, const char* standard) {
    return given ? std::filesystem::absolute(FromArgument(*given)) : ProgramFolder() / standard;
}

/// Tells what documents are not kept from: whoever has required that they are, or else the log.
/// @return whether documents may be opened, as far as the command opens any
bool IsIsolatedEnough(const CommandLine& line, Reporter& reporter) {
    const bool opensDocuments = line.command == Command::Screen || line.command == Command::Convert;
    const std::optional<MissingPart> missing = FindMissingIsolation();
    if (opensDocuments && line.requireIsolation && missing) {
        reporter.Error(missing->Text());
        return false;
    }
    const std::optional<EngineIsolation> isolation = IsolationOfEngines();
    if (opensDocuments && isolation && !isolation->missing.empty())
        SetLevelAndGetLogger(LevelWarning, __FILE__, __func__, __LINE__)
            << "Documents are not isolated: " << isolation->missing;
    return true;
}

ExitCode Run(const CommandLine& line) {
    Reporter reporter(line.json);
    const bool hasLog = StartLog(line);
    if (!StartLanguage(line, reporter))
        return ExitCode::WrongUsage;
    if (!hasLog) {
        reporter.Error(
            wxString::Format(_("the log file %s cannot be written; choose another one with --log"),
                             Shown(FromArgument(*line.logFile))));
        return ExitCode::WrongUsage;
    }
    Interruption::SetNote(_("finishing what is under way; a second Ctrl-C ends at once"));
    SetUpMachine({FolderOr(line.standInsFolder, "StandIns"), line.stallSeconds, line.limitSeconds,
                  line.memoryMegabytes,
                  line.command == Command::Status && line.engineDocuments != 1U});
    if (!IsIsolatedEnough(line, reporter))
        return ExitCode::MachineAtFault;
    const std::filesystem::path filtersFolder = FolderOr(line.filtersFolder, "Filters");
    switch (line.command) {
    case Command::Status:
        return RunStatus(line, filtersFolder, reporter);
    case Command::Screen:
        return RunScreen(line, filtersFolder, reporter);
    case Command::Convert:
        return RunConvert(line, filtersFolder, reporter);
    case Command::Settings:
        return RunSettings(line, filtersFolder, reporter);
    case Command::Worker:
        return RunWorker(filtersFolder);
    }
    return ExitCode::WrongUsage;
}

ExitCode RunOnConsole(const CommandLine& line) {
    if (line.command == Command::Worker)
        Interruption::LeaveToParent();
    else
        Interruption::Install();
    const wxInitializer toolkit;
    return toolkit.IsOk() ? Run(line) : ExitCode::MachineAtFault;
}

ExitCode TellNoDisplay(const CommandLine& line) {
    wxAppConsole console; // the texts are looked for beside the program, which it knows
    wxApp::SetInstance(&console);
    Reporter reporter(line.json);
    if (StartLanguage(line, reporter))
        reporter.Error(_("there is no display to show the settings on; run it on a desktop, or set "
                         "them with convert --set"));
    wxApp::SetInstance(nullptr);
    return ExitCode::MachineAtFault;
}

ExitCode RunOnDesktop(const CommandLine& line, char* programName) {
    // A scroll bar that hides would leave whoever needs large letters without a hint of the rest.
    wxSetEnv("GTK_OVERLAY_SCROLLING", "0");
    wxApp::SetInstance(new wxApp); // belongs to wxWidgets
    int count = 1;                 // the toolkit would take our options for its own
    char* arguments[] = {programName, nullptr};
    if (!wxEntryStart(count, arguments) || !wxTheApp->CallOnInit()) {
        return TellNoDisplay(line);
    }
    UseUtf8(); // the desktop's toolkit has taken over the environment's word
    const ExitCode exitCode = Run(line);
    wxTheApp->OnExit();
    wxEntryCleanup();
    return exitCode;
}

} // namespace

int main(int argc, char** argv) {
    try {
        UseUtf8();
        int exitCode = 0;
        const std::optional<CommandLine> line = ReadCommandLine(Arguments(argc, argv), exitCode);
        if (!line)
            return exitCode;
        return static_cast<int>(line->command == Command::Settings ? RunOnDesktop(*line, argv[0])
                                                                   : RunOnConsole(*line));
    } catch (const std::exception& error) { // out of memory, above all
        std::fprintf(stderr, "quillon: %s\n", error.what());
        return static_cast<int>(ExitCode::MachineAtFault);
    }
}
