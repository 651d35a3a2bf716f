#pragma once

#include "tests/support/TemporaryFolder.h"

#include <string>

/// A LibreOffice that does what a shell script says, in the place of the real one from the next
/// document on. The script finds the work folder as $HOME and the document as $DOCUMENT; what is to
/// be the result goes to $PDF.
class FakeEngine {
public:
    explicit FakeEngine(const std::string& script);
    ~FakeEngine();
    FakeEngine(const FakeEngine&) = delete;
    FakeEngine& operator=(const FakeEngine&) = delete;

    /// How often it was started.
    std::size_t Starts() const;

    /// Takes its program away, as when LibreOffice is removed while a client runs.
    void Uninstall() const;

    /// A script's line that hands over a PDF with one page.
    static std::string MakePdf();
    /// That PDF.
    static std::string OnePage();

private:
    TemporaryFolder m_folder;
};
