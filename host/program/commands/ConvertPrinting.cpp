#include "host/program/commands/ConvertPrinting.h"

#include "host/program/base/PathText.h"
#include "host/program/report/OutcomeReport.h"
#include "host/program/system/Interruption.h"
#include "host/services/OneLine.h"

#include <wx/intl.h>

#include <thread>

namespace {

wxString TextOf(const std::string& argument) {
    return Shown(FromArgument(argument));
}

/// @return whether the job is over
bool AwaitPrint(Outcome& outcome, const FilterSet& filters, PrintRun& print, Reporter& reporter) {
    constexpr std::chrono::milliseconds BetweenLooks{200};
    const wxString begin =
        Shown(outcome.input.filename()) + ": " + _("waiting for the printer") + "  ";
    PrintRun::Look look = print.LookAt(outcome);
    while (!look.isOver && !Interruption::Requested()) {
        reporter.Passing(begin + OneLine(look.message));
        std::this_thread::sleep_for(BetweenLooks);
        look = print.LookAt(outcome);
    }
    if (look.fault)
        outcome.End(State::Failed, *look.fault, filters.ErrorText(look.fault->code));
    TellPrint(outcome, look.isOver, look.message, reporter);
    return look.isOver;
}

} // namespace

std::optional<PrintRun> OpenPrintRun(const PrintOptions& options, Fault& fault) {
    PrintTicket ticket;
    ticket.queue = TextOf(*options.queue);
    if (options.server)
        ticket.server = TextOf(*options.server);
    for (const std::string& assignment : options.assignments) {
        const std::size_t sign = assignment.find('=');
        if (sign == 0 || sign == std::string::npos || sign + 1 == assignment.size()) {
            fault = {wxString::Format(_("the print option \"%s\" is not of the form NAME=VALUE"),
                                      TextOf(assignment)),
                     Blame::Usage};
            return std::nullopt;
        }
        ticket.options[assignment.substr(0, sign)] = assignment.substr(sign + 1);
    }
    return PrintRun::Open(ticket, fault);
}

bool AwaitPrints(std::vector<Outcome>& outcomes, const FilterSet& filters, PrintRun& print,
                 Reporter& reporter) {
    bool isAllOver = true;
    for (Outcome& outcome : outcomes)
        if (outcome.print)
            isAllOver = AwaitPrint(outcome, filters, print, reporter) && isAllOver;
    return isAllOver;
}
