#include "host/program/base/PathText.h"
#include "host/program/base/ProgramFiles.h"
#include "host/program/commands/Command.h"
#include "host/program/printserver/ServerParts.h"

#include <wx/intl.h>

#include <algorithm>

namespace {

using State = ServerPart::State;

struct PrintServerOptions {
    std::string action;
    std::optional<std::string> root;
    std::optional<std::string> bin;
};

const char* NameOf(State state) {
    switch (state) {
    case State::Missing:
        return wxTRANSLATE("not installed");
    case State::InPlace:
        return wxTRANSLATE("installed");
    case State::Outdated:
        return wxTRANSLATE("outdated");
    case State::Foreign:
        return wxTRANSLATE("somebody else's");
    }
    return "";
}

void Tell(const ServerPart& part, State state, Reporter& reporter) {
    reporter.Line(wxString::Format("%s: %s, %s", Shown(part.path), wxGetTranslation(part.meaning),
                                   wxGetTranslation(NameOf(state))));
    reporter.Record({{"type", "part"}, {"path", part.path.u8string()}, {"state", NameOf(state)}});
}

/// @return what is in the way of them all
std::optional<Fault> FindForeign(const std::vector<ServerPart>& parts) {
    const auto foreign = std::find_if(parts.begin(), parts.end(), [](const ServerPart& part) {
        return part.Look() == State::Foreign;
    });
    if (foreign == parts.end())
        return std::nullopt;
    return Fault{wxString::Format(_("%s is not this program's"), Shown(foreign->path)),
                 Blame::Usage, ConversionFailed, _("Nothing was changed; move it away first")};
}

ExitCode TellStatus(const std::vector<ServerPart>& parts, Reporter& reporter) {
    bool isReady = true;
    for (const ServerPart& part : parts) {
        const State state = part.Look();
        Tell(part, state, reporter);
        isReady = isReady && state == State::InPlace;
    }
    reporter.Line(isReady ? _("Office documents can be printed.")
                          : _("Office documents cannot be printed: `quillon print-server install` "
                              "has them converted."));
    return isReady ? ExitCode::Done : ExitCode::DocumentsAtFault;
}

/// Brings all parts to a state.
ExitCode Bring(const std::vector<ServerPart>& parts, State wanted, Reporter& reporter) {
    bool hasChanged = false;
    for (const ServerPart& part : parts) {
        const State found = part.Look();
        if (found != wanted && found != State::Foreign) {
            if (const auto fault = wanted == State::InPlace ? part.PutIn() : part.TakeOut())
                return reporter.Error(*fault);
            hasChanged = true;
        }
        Tell(part, part.Look(), reporter);
    }
    reporter.Line(hasChanged ? wxString::Format(_("The print server takes it in with `%s`."),
                                                PrintServer::ReloadCommand())
                             : _("Nothing had to be changed."));
    return ExitCode::Done;
}

std::filesystem::path Absolute(const std::string& given) {
    return std::filesystem::absolute(FromArgument(given));
}

ExitCode RunPrintServer(const PrintServerOptions& given, Reporter& reporter) {
    std::optional<PrintServer::Folders> folders;
    if (given.root && given.bin)
        folders = {Absolute(*given.root), Absolute(*given.bin)};
    else
        folders = PrintServer::FindFolders();
    if (!folders)
        return reporter.Error({_("there is no print server here; install CUPS, or say where it is "
                                 "with --cups-server-root and --cups-server-bin"),
                               Blame::Machine});
    std::vector<ServerPart> parts = PartsFor(*folders, ProgramFile());
    if (given.action == "status")
        return TellStatus(parts, reporter);
    if (given.action == "install") {
        if (const auto fault = FindForeign(parts))
            return reporter.Error(*fault);
        return Bring(parts, State::InPlace, reporter);
    }
    if (given.action != "remove")
        return reporter.Error({_("print-server takes install, remove or status"), Blame::Usage});
    std::reverse(parts.begin(), parts.end());
    return Bring(parts, State::Missing, reporter);
}

} // namespace

void AddPrintServer(CLI::App& program, Command& chosen) {
    const auto given = std::make_shared<PrintServerOptions>();
    CLI::App& command =
        AddSubcommand(program, "print-server",
                      "Have CUPS print Office documents, by `filter`: quillon print-server\n"
                      "install|remove|status",
                      [&chosen, given] {
                          chosen.needsMachine = false;
                          chosen.run = [given](const CommonOptions&, Reporter& reporter) {
                              return RunPrintServer(*given, reporter);
                          };
                      });
    AddRequired(command, "ACTION", "install|remove|status", "What to do", given->action);
    AddOption(command, "--cups-server-root", "DIR",
              "The folder with the types and conversions of CUPS, if not its own", given->root);
    AddOption(command, "--cups-server-bin", "DIR",
              "The folder with the folder of filters of CUPS, if not its own", given->bin);
}
