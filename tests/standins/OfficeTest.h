#pragma once

#include "plugin/settings/PowerPointOptions.h"
#include "tests/standins/StandInTest.h"
#include "tests/support/TestPrinter.h"

/// A machine with the Office stand-ins and one printer, driven by the filter itself. Tests are
/// skipped where LibreOffice is not installed.
class OfficeTest : public StandInTest {
protected:
    OfficeTest();
    void SetUp() override;
    void TearDown() override;

    // Each answers what the application has logged of its failure; empty when all went well.

    /// Opens a document in Word and closes it, as screening does.
    std::string Open(const std::filesystem::path& document);
    /// Prints a document by the driver of its application, to PrintedFile(document).
    std::string Print(const std::filesystem::path& document);
    /// Prints a presentation as the options say, without the waits of its driver.
    std::string Print(const std::filesystem::path& document, const PowerPointOptions& options);

    /// Where the output of a document goes.
    std::filesystem::path PrintedFile(const std::filesystem::path& document) const;
    /// Writes a document whose bytes no test before has opened.
    std::filesystem::path NewDocument(const std::string& name = "new.docx") const;
    /// Waits until an engine has made a file in its work folder.
    void AwaitInWorkFolder(const std::string& file) const;
    /// Waits until LibreOffice has made the socket that it leaves behind when it is killed.
    pid_t AwaitLibreOffice() const;

    std::wstring m_printer = L"Test printer";
    std::filesystem::path m_outputFolder = m_files.Path();

private:
    TestPrinter m_installedPrinter;
    std::set<std::string> m_socketsBefore;
};

std::filesystem::path Sample(const std::string& name);
/// A file's path as the filter takes it.
wxString FilterPath(const std::filesystem::path& path);
