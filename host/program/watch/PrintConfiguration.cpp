#include "host/program/watch/PrintConfiguration.h"

#include "host/program/watch/ConfigurationValue.h"
#include "host/services/OneLine.h"

#include <wx/intl.h>
#include <wx/tokenzr.h>

namespace {

using Value = const ConfigurationValue&;

/// A text as a print server takes it.
std::string ReadWord(Value value) {
    constexpr std::size_t Longest = 1023;
    const wxString text = value.AsText();
    if (text.empty() || text.utf8_string().size() > Longest || OneLine(text) != text)
        value.Refuse(_("it must be a text of one line, neither empty nor very long"));
    return text.utf8_string();
}

/// "1-4,7,9-".
std::string ReadPages(Value value) {
    unsigned long last = 0;
    bool isRight = true;
    for (const wxString& part : wxStringTokenize(value.Word(), ",", wxTOKEN_RET_EMPTY_ALL)) {
        unsigned long from = 0;
        unsigned long to = 0;
        const wxString end = part.AfterFirst('-');
        isRight = isRight && part.BeforeFirst('-').ToULong(&from) && from > last;
        to = from;
        if (part.Contains("-") && !end.empty())
            isRight = isRight && end.ToULong(&to) && to >= from;
        last = to;
    }
    if (!isRight)
        value.Refuse(_("it must be pages in their order, such as \"1-4,7,9-\""));
    return ReadWord(value);
}

/// Until when a job is held.
std::string ReadHold(Value value) {
    const wxString text = value.AsText();
    if (text == "1")
        return "indefinite";
    return text == "0" ? "no-hold" : ReadWord(value);
}

// clang-format off
const KeyReaders<PrintConfiguration> PrintKeys = {
    {"after_loss", [](Value value, PrintConfiguration& p) { p.printsLost = value.Choice({"hold", "print"}) == 1; }},
    {"copies", [](Value value, PrintConfiguration& p) { p.ticket.options["copies"] = std::to_string(value.Number(1, 9999)); }},
    {"hold", [](Value value, PrintConfiguration& p) { p.ticket.options["job-hold-until"] = ReadHold(value); }},
    {"keep", [](Value value, PrintConfiguration& p) { p.keepsFiles = value.Flag(); }},
    {"max_queued", [](Value value, PrintConfiguration& p) { p.mostQueued = static_cast<std::size_t>(value.Number(1, 10000)); }},
    {"media", [](Value value, PrintConfiguration& p) { p.ticket.options["media"] = ReadWord(value); }},
    {"number_up", [](Value value, PrintConfiguration& p) { p.ticket.options["number-up"] = std::to_string(value.Number(1, 16)); }},
    {"options", [](Value value, PrintConfiguration& p) {
        for (const ConfigurationValue& option : value.Values())
            p.ticket.options[option.Key()] = ReadWord(option);
    }},
    {"pages", [](Value value, PrintConfiguration& p) { p.ticket.options["page-ranges"] = ReadPages(value); }},
    {"queue", [](Value value, PrintConfiguration& p) { p.ticket.queue = wxString::FromUTF8(ReadWord(value)); }},
    {"server", [](Value value, PrintConfiguration& p) { p.ticket.server = wxString::FromUTF8(ReadWord(value)); }},
    {"sheets", [](Value value, PrintConfiguration& p) { p.ticket.options["job-sheets"] = ReadWord(value); }},
    {"sides", [](Value value, PrintConfiguration& p) { p.ticket.options["sides"] = ReadWord(value); }},
};
// clang-format on

} // namespace

PrintConfiguration ReadPrinting(const ConfigurationValue& table) {
    if (!Spooler::IsAvailable())
        throw Misfit{table.KeyAt(), _("this system has no print server that documents can be "
                                      "submitted to; take this part out, and the output goes to "
                                      "\"out\"")};
    PrintConfiguration printing;
    ReadTable(table, PrintKeys, printing);
    if (printing.ticket.queue.empty())
        throw Misfit{table.KeyAt(), _("it has no \"queue\"; `lpstat -e` shows which there are")};
    return printing;
}
