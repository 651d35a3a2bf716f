#pragma once

#include <string>

/// A printer that the spooler has for the length of a test.
class TestPrinter {
public:
    /// @param driver the driver's name; installed with the printer unless it is there already
    /// @param dataFile the driver's data file, full path; must exist
    TestPrinter(const std::wstring& name, const std::wstring& driver, const std::wstring& dataFile);
    ~TestPrinter();
    TestPrinter(const TestPrinter&) = delete;
    TestPrinter& operator=(const TestPrinter&) = delete;

private:
    std::wstring m_driver;
    void* m_printer = nullptr;
};
