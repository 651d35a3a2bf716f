#pragma once

#include <string>

namespace standins {

/// What Ghostscript said while it worked.
class GhostscriptLog {
public:
    /// @param path of the file with its messages
    explicit GhostscriptLog(const std::string& path);

    /// Whether the profile was read to its end.
    bool HasReadProfile() const;
    /// Whether it could not write for lack of room.
    bool TellsOfFullDisk() const;
    /// Whether it could not finish the PDF. Its exit code does not tell.
    bool TellsOfUnfinishedPdf() const;
    /// The PostScript error that ended its work, "undefined in foo"; empty when there was none.
    std::string PostScriptError() const;

private:
    bool Has(const char* text) const { return m_text.find(text) != std::string::npos; }

    std::string m_text; ///< as much of the beginning and of the end as matters
};

} // namespace standins
