#include "host/program/system/Spooler.h"

#include <wx/intl.h>

namespace {

Fault NotAvailable() {
    return {_("this system has no print server that documents can be submitted to"), Blame::Usage,
            ConversionFailed, _("Have the output delivered to a folder")};
}

} // namespace

bool Spooler::IsAvailable() {
    return false;
}

std::optional<Fault> Spooler::Check(const PrintTicket& /*ticket*/) {
    return NotAvailable();
}

std::optional<PrintWay> Spooler::FindWay(const wxString& /*queue*/,
                                         const std::vector<std::string>& /*types*/,
                                         const PageSize& /*pages*/, Fault& fault) {
    fault = NotAvailable();
    return std::nullopt;
}

std::optional<int> Spooler::Create(const PrintTicket& /*ticket*/, const wxString& /*name*/,
                                   Fault& fault) {
    fault = NotAvailable();
    return std::nullopt;
}

std::optional<Fault> Spooler::Send(const wxString& /*queue*/, int /*number*/,
                                   const std::filesystem::path& /*file*/,
                                   const std::string& /*type*/) {
    return NotAvailable();
}

std::optional<std::vector<SpooledJob>> Spooler::Find(int /*number*/, Fault& fault) {
    fault = NotAvailable();
    return std::nullopt;
}

std::optional<std::vector<SpooledJob>> Spooler::Unfinished(const wxString& /*queue*/,
                                                           Fault& fault) {
    fault = NotAvailable();
    return std::nullopt;
}

std::optional<Fault> Spooler::Cancel(int /*number*/) {
    return NotAvailable();
}

wxString Spooler::Address() {
    return m_server;
}
