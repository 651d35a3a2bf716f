#include "host/program/base/PathText.h"
#include "host/program/base/ProgramFiles.h"
#include "host/program/commands/CommandLine.h"
#include "host/program/machine/Engines.h"
#include "host/program/machine/MachineSetup.h"
#include "host/program/machine/MissingParts.h"
#include "host/program/report/Language.h"
#include "host/program/system/Console.h"
#include "host/program/system/Interruption.h"
#include "host/program/system/LogRoutes.h"
#include "host/services/Log.h"

#include <wx/app.h>
#include <wx/init.h>
#include <wx/intl.h>
#include <wx/utils.h>

#include <exception>

namespace {

/// @return whether the log can be kept as asked for
bool StartLog(const CommonOptions& options) {
    if (options.verbose)
        Log::ToStandardError(LevelInformation);
    RouteToolkitLog();
    RouteLayerLog();
    return !options.logFile || Log::ToFile(FromArgument(*options.logFile));
}

/// @return why the language asked for is not in use
std::optional<Fault> StartLanguage(const CommonOptions& options) {
    return UseLanguage(options.language ? std::optional(wxString::FromUTF8(*options.language))
                                        : std::nullopt);
}

/// Tells the log what documents are not kept from, or whoever has required that they are.
/// @return why the command may open no documents
std::optional<Fault> CheckIsolation(const CommonOptions& options) {
    if (options.requireIsolation)
        if (std::optional<Fault> missing = FindMissingIsolation())
            return missing;
    const std::optional<EngineIsolation> isolation = IsolationOfEngines();
    if (isolation && !isolation->missing.empty())
        SetLevelAndGetLogger(LevelWarning, __FILE__, __func__, __LINE__)
            << "Documents are not isolated: " << isolation->missing;
    return std::nullopt;
}

ExitCode Run(const CommandLine& line) {
    const auto& [options, command] = line;
    Reporter reporter(options.json, options.quiet);
    if (command.isFilter)
        reporter.SpeakToSpooler();
    const bool hasLog = StartLog(options);
    if (const auto fault = StartLanguage(options))
        return reporter.Error(*fault);
    if (!hasLog)
        return reporter.Error(
            {wxString::Format(_("the log file %s cannot be written; choose another one with --log"),
                              Shown(FromArgument(*options.logFile))),
             Blame::Usage});
    if (!command.isFilter)
        Interruption::SetNote(_("finishing what is under way; a second Ctrl-C ends at once"));
    if (command.needsMachine)
        SetUpMachine({options.StandInsFolder(), options.stallSeconds, options.limitSeconds,
                      options.memoryMegabytes,
                      command.examinesEngine && options.engineDocuments != 1U});
    if (command.opensDocuments)
        if (const auto fault = CheckIsolation(options))
            return reporter.Error(*fault);
    return command.run(options, reporter);
}

ExitCode RunOnConsole(const CommandLine& line) {
    if (line.command.isWorker)
        Interruption::LeaveToParent();
    else
        Interruption::Install();
    const wxInitializer toolkit;
    return toolkit.IsOk() ? Run(line) : ExitCode::MachineAtFault;
}

ExitCode TellNoDisplay(const CommonOptions& options) {
    wxAppConsole console; // the texts are looked for beside the program, which it knows
    wxApp::SetInstance(&console);
    Reporter reporter(options.json, options.quiet);
    const std::optional<Fault> fault = StartLanguage(options);
    reporter.Error(
        fault ? *fault
              : Fault{_("there is no display to show the settings on; run it on a desktop, or set "
                        "them with convert --set"),
                      Blame::Machine});
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
        return TellNoDisplay(line.options);
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
        return static_cast<int>(line->command.showsWindows ? RunOnDesktop(*line, argv[0])
                                                           : RunOnConsole(*line));
    } catch (const std::exception& error) { // out of memory, above all
        std::fprintf(stderr, "quillon: %s\n", error.what());
        return static_cast<int>(ExitCode::MachineAtFault);
    }
}
