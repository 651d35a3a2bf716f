#pragma once

#include "standins/shared/Descriptor.h"
#include "tests/support/TemporaryFolder.h"

#include <string>

/// A LibreOffice that does what a shell script says, in the place of the real one from the next
/// document on. The script finds the work folder as $HOME and the document as $DOCUMENT; what is to
/// be the result goes to $PDF. See WriteScriptedProgram for what else it has.
class FakeEngine {
public:
    explicit FakeEngine(const std::string& script);

    /// How often it was started.
    std::size_t Starts() const;

    /// Lines of a script that hand over a PDF with one page.
    /// @param contents the page's contents (object 4) and further objects
    static std::string MakePdf(const std::string& contents = "");

private:
    TemporaryFolder m_folder;
    standins::Descriptor m_opened; ///< tells when the shell is opened: an engine itself cannot
    mutable std::size_t m_starts = 0;
};
