#include "host/program/PathText.h"
#include "host/program/commands/CommandLine.h"
#include "host/program/commands/Commands.h"
#include "host/program/machine/MachineSetup.h"
#include "host/program/machine/ProgramFiles.h"
#include "host/program/report/LogRoutes.h"
#include "host/program/system/Console.h"
#include "host/program/system/Interruption.h"
#include "host/services/Log.h"

#include <wx/init.h>

#include <exception>

namespace {

/// @return whether the log can be kept as asked for
bool StartLog(const CommandLine& line, Reporter& reporter) {
    if (line.logFile && !Log::ToFile(FromArgument(*line.logFile))) {
        reporter.Error("the log file " + Shown(FromArgument(*line.logFile)) +
                       " cannot be written; choose another one with --log");
        return false;
    }
    if (line.verbose)
        Log::ToStandardError(LevelInformation);
    RouteToolkitLog();
    RouteLayerLog();
    return true;
}

std::filesystem::path FolderOr(const std::optional<std::string>& given, const char* standard) {
    return given ? std::filesystem::absolute(FromArgument(*given)) : ProgramFolder() / standard;
}

ExitCode Run(const CommandLine& line) {
    Reporter reporter(line.json);
    if (!StartLog(line, reporter))
        return ExitCode::WrongUsage;
    SetUpMachine({FolderOr(line.standInsFolder, "StandIns"), line.stallSeconds, line.limitSeconds});
    const std::filesystem::path filtersFolder = FolderOr(line.filtersFolder, "Filters");
    switch (line.command) {
    case Command::Status:
        return RunStatus(filtersFolder, reporter);
    case Command::Screen:
        return RunScreen(line, filtersFolder, reporter);
    case Command::Convert:
        return RunConvert(line, filtersFolder, reporter);
    }
    return ExitCode::WrongUsage;
}

} // namespace

int main(int argc, char** argv) {
    try {
        UseUtf8();
        Interruption::Install();
        int exitCode = 0;
        const std::optional<CommandLine> line = ReadCommandLine(Arguments(argc, argv), exitCode);
        if (!line)
            return exitCode;
        const wxInitializer toolkit;
        return static_cast<int>(toolkit.IsOk() ? Run(*line) : ExitCode::MachineAtFault);
    } catch (const std::exception& error) { // out of memory, above all
        std::fprintf(stderr, "quillon: %s\n", error.what());
        return static_cast<int>(ExitCode::MachineAtFault);
    }
}
