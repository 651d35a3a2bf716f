#pragma once

#include "tests/support/TemporaryFolder.h"
#include "tests/support/TestPrinter.h"

#include <gtest/gtest.h>

#include <optional>
#include <set>
#include <string>

/// A path as the Windows API takes it.
std::wstring WidePath(const std::filesystem::path& path);

/// A machine with the Office stand-ins registered and one printer; temporary files go to a folder
/// of the test's own. After the test no process and no file of the stand-ins may be left.
class OfficeTest : public testing::Test {
protected:
    void SetUp() override;
    void TearDown() override;

    /// Sets a number among the stand-ins' settings, for instance "StallSeconds".
    static void SetLimit(const wchar_t* name, unsigned seconds);
    /// What the stand-ins have left behind so far: processes, files; empty when all is clean.
    std::string Leftovers() const;

    std::wstring PathOf(const std::filesystem::path& name) const {
        return WidePath(m_files / name);
    }

    static constexpr const wchar_t* Printer = L"Test printer";

    TemporaryFolder m_files; ///< documents and output
    TemporaryFolder m_temporary;
    std::optional<TestPrinter> m_printer;

private:
    std::string NewSockets() const;

    std::set<std::string> m_socketsBefore;
};

/// Skips the test where LibreOffice is not installed.
#define NEEDS_LIBREOFFICE()                                                                        \
    if (!IsLibreOfficeInstalled())                                                                 \
    GTEST_SKIP() << "LibreOffice is not installed"

bool IsLibreOfficeInstalled();

/// The full path of a sample document.
std::wstring SamplePath(const std::string& name);
