#include "host/program/commands/CommonOptions.h"

#include "host/program/base/PathText.h"
#include "host/program/base/ProgramFiles.h"
#include "host/program/workers/WorkerCount.h"

#include <CLI/CLI.hpp>

namespace fs = std::filesystem;

namespace {

constexpr unsigned StandardStall = 60; // seconds
constexpr unsigned LongestSeconds = 24 * 60 * 60;
constexpr unsigned MostMegabytes = 1 << 20;
constexpr unsigned MostEngineDocuments = 10'000;

fs::path FolderOr(const std::optional<std::string>& given, const char* standard) {
    return given ? fs::absolute(FromArgument(*given)) : ProgramFolder() / standard;
}

} // namespace

fs::path CommonOptions::FiltersFolder() const {
    return FolderOr(filtersFolder, "Filters");
}

fs::path CommonOptions::StandInsFolder() const {
    return FolderOr(standInsFolder, "StandIns");
}

void AddCommonOptions(CLI::App& program, CommonOptions& options) {
    const CLI::Range seconds(1U, LongestSeconds);
    program
        .add_option("--lang", options.language,
                    "The language of texts and windows: de, fr, es, ja, en")
        ->type_name("LANG");
    program.add_flag("--json", options.json,
                     "Write JSON Lines to stdout, lines for people to stderr");
    program.add_flag("-v,--verbose", options.verbose,
                     "Show the whole log on stderr, not only warnings");
    program.add_flag("-q,--quiet", options.quiet, "Write nothing for people but errors");
    program.add_option("--log", options.logFile, "Append the whole log to a file")
        ->type_name("FILE");
    program
        .add_option("--engine-stall", options.stallSeconds,
                    "How long an engine may show no sign of life, 60 if not given, and the file\n"
                    "that it prints not grow, 120 if not given")
        ->type_name("SECONDS")
        ->check(seconds);
    program
        .add_option("--engine-limit", options.limitSeconds,
                    "How long an engine may take for a document, 600 if not given, and the file\n"
                    "that it prints to be whole, 1800 if not given")
        ->type_name("SECONDS")
        ->check(seconds);
    program
        .add_option("--memory-limit", options.memoryMegabytes,
                    "How much memory engines may take for a document, all of its processes\n"
                    "together, 3584 if not given")
        ->type_name("MB")
        ->check(CLI::Range(256U, MostMegabytes));
    program.add_flag("--require-isolation", options.requireIsolation,
                     "Open no document unless it is kept from the rest of the machine; see status");
    program
        .add_option("--engine-documents", options.engineDocuments,
                    "For how many documents of a run an engine is kept once it is started; 1 to\n"
                    "start it for each; 500 if not given, or 1 where that is faster")
        ->type_name("N")
        ->check(CLI::Range(1U, MostEngineDocuments));
    program
        .add_option("--filters", options.filtersFolder,
                    "The folder of filters, if not Filters beside the program")
        ->type_name("DIR");
    program
        .add_option("--stand-ins", options.standInsFolder,
                    "The folder of Office stand-ins, if not StandIns beside the program")
        ->type_name("DIR");
}

std::chrono::seconds WorkerPatience(const CommonOptions& options) {
    return std::chrono::seconds(options.stallSeconds.value_or(StandardStall));
}

std::vector<std::string> WorkerArguments(const CommonOptions& options) {
    std::vector<std::string> arguments = {"worker"};
    const auto pass = [&arguments](const char* option, const std::optional<std::string>& value) {
        if (value)
            arguments.insert(arguments.end(), {option, *value});
    };
    const auto text = [](const std::optional<unsigned>& number) {
        return number ? std::optional(std::to_string(*number)) : std::nullopt;
    };
    pass("--filters", options.filtersFolder);
    pass("--stand-ins", options.standInsFolder);
    pass("--engine-stall", text(options.stallSeconds));
    pass("--engine-limit", text(options.limitSeconds));
    pass("--memory-limit", std::to_string(options.memoryMegabytes));
    pass("--log", options.logFile);
    pass("--lang", options.language);
    if (options.verbose)
        arguments.emplace_back("--verbose");
    return arguments;
}

CLI::App& AddSubcommand(CLI::App& program, const std::string& name, const std::string& description,
                        std::function<void()> choose) {
    CLI::App* const command = program.add_subcommand(name, description);
    if (description.empty())
        command->group("");
    command->final_callback(std::move(choose));
    return *command;
}

void AddRequired(CLI::App& command, const std::string& name, const std::string& type,
                 const std::string& description, std::string& value) {
    command.add_option(name, value, description)->required()->type_name(type);
}

void AddPaths(CLI::App& command, std::vector<std::string>& paths) {
    command.add_option("PATH", paths, "Files, or folders of files")->required();
}

void AddOption(CLI::App& command, const std::string& name, const std::string& type,
               const std::string& description, std::optional<std::string>& value) {
    command.add_option(name, value, description)->type_name(type);
}

void AddFlag(CLI::App& command, const std::string& name, const std::string& description,
             bool& value) {
    command.add_flag(name, value, description);
}

void AddJobs(CLI::App& command, std::optional<unsigned>& jobs) {
    command
        .add_option("-j,--jobs", jobs,
                    "How many documents to convert at a time; by default as many as pay")
        ->type_name("N")
        ->check(CLI::Range(1U, MostWorkers));
}

void AddOutputOptions(CLI::App& command, std::string& out, PrintOptions& print) {
    CLI::Option* const folder =
        command.add_option("-o,--out", out, "The folder for the output; not needed with --print");
    folder->required()->type_name("DIR");
    CLI::Option* const queue = command.add_option_function<std::string>(
        "--print",
        [&print, folder](const std::string& name) {
            print.queue = name;
            folder->required(false);
        },
        "Have a queue of the print server print the output");
    queue->type_name("QUEUE");
    command.add_flag("--wait", print.waits, "Wait until it is on paper")->needs(queue);
    command
        .add_option("--print-server", print.server,
                    "The print server, if not the one that this user has")
        ->type_name("HOST")
        ->needs(queue);
    command
        .add_option("--print-option", print.assignments,
                    "One of the queue's options; may be given several times")
        ->type_name("NAME=VALUE")
        ->allow_extra_args(false)
        ->needs(queue);
}

void AddSettingsOptions(CLI::App& command, SettingsOptions& options) {
    command.add_option("--printer", options.printer, "The printer to print on")->type_name("NAME");
    command.add_option("--settings", options.file, "A file with settings")->type_name("FILE.xml");
    CLI::Option* const ps = command.add_flag_callback(
        "--ps", [&options] { options.pdf = false; }, "Make PostScript files only");
    command
        .add_flag_callback(
            "--pdf", [&options] { options.pdf = true; }, "Make PDF files too")
        ->excludes(ps);
    command.add_option("--profile", options.profile, "The Distiller profile of the PDF files")
        ->type_name("NAME")
        ->excludes(ps);
    command.add_option("--set", options.assignments, "One setting; may be given several times")
        ->type_name("KEY=VALUE")
        ->allow_extra_args(false);
}
