#include "host/program/commands/CommandLine.h"

#include "host/program/base/ExitCode.h"
#include "plugin/settings/FilterSettings.h"

#include <CLI/CLI.hpp>
#include <algorithm>
#include <iomanip>
#include <iostream>
#include <sstream>

namespace {

constexpr const char* Description =
    "quillon converts Office documents (doc docx xls xlsx ppt pptx pps ppsx pub) into files\n"
    "ready for print.\n";

constexpr const char* Notes = R"(
Files and folders
  A PATH may be a file or a folder, which means the files directly in it; in a folder, files that
  no filter takes are skipped. DIR is created if only itself is missing.
  An output has the name of its document: letter.docx becomes letter.ps and, made of it,
  letter.pdf, in place of older ones. When two documents of one run have the same name, budget.doc
  and budget.xls, the second keeps its ending: budget.pdf and budget.xls.pdf; a third becomes
  budget.xls (2).pdf.
  An output appears in DIR whole or not at all. What a killed run leaves there, a hidden folder
  .quillon-…, goes with the next run.
  Put -- in front of names that begin with a dash.

Settings
  A settings file is XML with an element UI that has one element for each setting; `quillon
  settings` shows and writes it. A --set goes before the file, and --printer, --ps, --pdf and
  --profile go before both. What is not set has the value in brackets, in the window as in a
  conversion: a new file prints what none does. Without PRINTER, the program's own file printer
  is used; a Distiller printer, where there is one, is used whatever is chosen. Without a profile,
  Distiller makes PDF files in its own way. The window's texts for PRINTOUTPUTTYPE and COLOR are
  understood in every language.
)";

constexpr const char* ExitCodes = R"(
Exit codes
  0  done; for status: ready to convert; for settings: saved, or left as they were
  1  some documents were refused or could not be converted; for retry and cancel: or cannot be
     tried again, or cancelled; for print-server status: not installed
  2  the machine is at fault: no Office application, no printer, no filter, a full disk, no more
     processes, no isolation where it is required, an engine that was ended from outside, when it was tried again, too; for
     settings: no display to show them on; for queue and what goes with it: the journal cannot be
     read or written
  3  wrong usage: the command line, the settings file, the output folder or the configuration
  4  interrupted: Ctrl-C, or a request to end, came before all was done. What is under way is
     finished first; a second Ctrl-C ends the program at once

Output
  One line for each file when it is done, in the order of the files: input, output, state, result
  code, its text, seconds; below it, the fonts that it asks for and that are not installed, with
  those that stood in. What the program says is in the language of --lang, or else of LC_ALL,
  LC_MESSAGES or LANG. In English are this help, the log, what is wrong with a command line, and
  what the system or an engine's libraries say in their own words.
  `quillon queue` has a line for each document of a watched folder that waits, is under way or has
  failed: number, folder, name, state, attempts, next try, reason; then one for each folder, with
  how many there are in each state, and for a queue that machines share one for each machine.
  With --json, JSON Lines on stdout: records of "type" filter, folder, application, engine,
  printer, distiller, isolation, panel, missing, document, job, queue, machine, retry, cancel,
  pause, part, summary and error; lines for people then go to stderr. The "code", the "state" and the "fault" (document,
  machine or null) of a document or job are the same in every language, and times are UTC; "fonts"
  are those not installed, each with what was "asked" for and "used", and whether both have the
  "sameMetrics", so that lines break alike.
)";

/// The choices in a row, as "1 2 3" or as "this, that or another".
std::string ListOf(const SettingChoices& choices, const char* between, const char* beforeLast) {
    std::string list;
    for (const SettingChoice& choice : choices) {
        if (&choice != choices.begin())
            list += &choice + 1 == choices.end() ? beforeLast : between;
        list += choice.text;
    }
    return list;
}

std::string ValuesOf(const Setting& setting) {
    switch (setting.kind) {
    case Setting::Flag:
        return "1 0";
    case Setting::Text:
        return "text";
    case Setting::Number:
        return ListOf(setting.choices, " ", " ");
    case Setting::Printer:
        return "name";
    case Setting::Profile:
        return "file name";
    }
    return {};
}

std::string SettingsTable() {
    std::ostringstream table;
    for (const Setting* const setting : FilterSettings::All) {
        table << "  " << std::left << std::setw(27) << setting->key << std::setw(13)
              << ValuesOf(*setting)
              << (setting->meaning ? setting->meaning : ListOf(setting->choices, ", ", " or "));
        if (*setting->standard)
            table << " (" << setting->standard << ')';
        table << '\n';
    }
    return table.str();
}

void AddCommands(CLI::App& app, Command& chosen) {
    for (AddCommand* const add : AllCommands)
        add(app, chosen);
    app.require_subcommand(1);
    for (CLI::App* const command : app.get_subcommands({})) {
        command->fallthrough();
        command->set_help_flag(); // the program's is one for all
    }
}

bool TakesValue(const CLI::App& app, const std::string& name) {
    const CLI::Option* const option = app.get_option_no_throw(name);
    const auto commands = app.get_subcommands([](const CLI::App*) { return true; });
    return (option && option->get_expected_min() > 0) ||
           std::any_of(commands.begin(), commands.end(),
                       [&name](const CLI::App* command) { return TakesValue(*command, name); });
}

/// The arguments, last one first as CLI11 wants them. It takes a PATH like "[a,b]" for a list, but
/// not the same one behind "./".
std::vector<std::string> ArgumentsFor(const CLI::App& app, const std::vector<std::string>& given) {
    std::vector<std::string> arguments;
    for (std::size_t i = given.size(); i-- > 0;) {
        const std::string& argument = given[i];
        const bool list = argument.size() > 1 && argument.front() == '[' && argument.back() == ']';
        const bool value = i > 0 && TakesValue(app, given[i - 1]);
        arguments.push_back(list && !value ? "./" + argument : argument);
    }
    return arguments;
}

/// Takes the words with which a spooler calls a filter off the arguments: a title is anything, and
/// no option. Fewer of them are a person's.
std::vector<std::string> TakeSpoolerWords(const CLI::App& app,
                                          std::vector<std::string>& arguments) {
    constexpr std::size_t Fewest = 5;
    std::size_t command = 0;
    while (command < arguments.size() && arguments[command].rfind('-', 0) == 0)
        command += TakesValue(app, arguments[command]) ? 2 : 1;
    if (command + Fewest >= arguments.size() || arguments[command] != "filter")
        return {};
    const auto first = arguments.begin() + static_cast<std::ptrdiff_t>(command + 1);
    std::vector<std::string> words(first, arguments.end());
    arguments.erase(first, arguments.end());
    return words;
}

/// CLI11 shows the help of the one command that was given; ours is one text, and says it all.
std::string HelpOf(CLI::App& app) {
    app.clear();
    return app.help("", CLI::AppFormatMode::All);
}

/// What fits one screen, for who has asked for nothing yet.
std::string FirstScreenOf(CLI::App& app) {
    app.clear();
    for (CLI::Option* const option : app.get_options())
        option->group("");
    app.footer("All options, settings and exit codes: quillon --help");
    return app.help();
}

} // namespace

std::optional<CommandLine> ReadCommandLine(std::vector<std::string> arguments, int& exitCode) {
    CommandLine line;
    CLI::App app(Description, "quillon");
    app.set_help_flag("-h,--help", "Print this help");
    app.set_version_flag("--version", "quillon " QUILLON_VERSION, "Print the version");
    app.footer(Notes + SettingsTable() + ExitCodes);
    AddCommonOptions(app, line.options);
    AddCommands(app, line.command);
    line.options.spoolerWords = TakeSpoolerWords(app, arguments);
    try {
        if (arguments.empty())
            throw CLI::RequiredError("A command");
        app.parse(ArgumentsFor(app, arguments));
        return line;
    } catch (const CLI::CallForHelp&) {
        std::cout << HelpOf(app) << std::flush;
        exitCode = static_cast<int>(ExitCode::Done);
    } catch (const CLI::CallForVersion& version) {
        std::cout << version.what() << std::endl;
        exitCode = static_cast<int>(ExitCode::Done);
    } catch (const CLI::ParseError& error) {
        exitCode = static_cast<int>(ExitCode::WrongUsage);
        if (arguments.empty())
            std::cerr << FirstScreenOf(app) << std::flush;
        else
            std::cerr << "quillon: " << error.what() << "\nSee quillon --help.\n" << std::flush;
    }
    return std::nullopt;
}
