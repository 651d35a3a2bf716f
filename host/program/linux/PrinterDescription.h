#pragma once

#include <wx/string.h>

#include <cups/ppd.h>

#include <memory>
#include <optional>
#include <string>

/// The PPD file that a print server has of a queue: what IPP does not tell of a printer.
class PrinterDescription {
public:
    /// @return nothing when the queue has none, or the server does not give it
    static std::optional<PrinterDescription> Fetch(http_t* server, const wxString& queue);

    /// Whether PostScript comes to the printer as it is, not drawn anew by the print server.
    bool TakesPostScript() const;

    bool HasOption(const std::string& option) const;
    bool HasChoice(const std::string& option, const std::string& choice) const;
    /// The choices, with commas between them.
    wxString ChoicesOf(const std::string& option) const;

private:
    using File = std::unique_ptr<ppd_file_t, void (*)(ppd_file_t*)>;

    explicit PrinterDescription(File file) : m_file(std::move(file)) {}

    File m_file;
};
