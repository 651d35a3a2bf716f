#include "tests/support/TestPrinter.h"

#include <windows.h>
#include <winspool.h>

#include <gtest/gtest.h>

namespace {

wchar_t PrintProcessor[] = L"winprint";
wchar_t DataType[] = L"RAW";
wchar_t FilePort[] = L"FILE:";

} // namespace

TestPrinter::TestPrinter(const std::wstring& name, const std::wstring& driver,
                         const std::wstring& dataFile)
    : m_driver(driver) {
    std::wstring printerName = name;
    std::wstring driverFile = dataFile;
    DRIVER_INFO_3W driverInfo{};
    driverInfo.cVersion = 3;
    driverInfo.pName = m_driver.data();
    driverInfo.pDriverPath = driverFile.data();
    driverInfo.pDataFile = driverFile.data();
    driverInfo.pConfigFile = driverFile.data();
    if (!AddPrinterDriverW(nullptr, 3, reinterpret_cast<LPBYTE>(&driverInfo))) {
        EXPECT_EQ(DWORD{ERROR_PRINTER_DRIVER_ALREADY_INSTALLED}, GetLastError());
    }

    PRINTER_INFO_2W printerInfo{};
    printerInfo.pPrinterName = printerName.data();
    printerInfo.pPortName = FilePort;
    printerInfo.pDriverName = m_driver.data();
    printerInfo.pPrintProcessor = PrintProcessor;
    printerInfo.pDatatype = DataType;
    m_printer = AddPrinterW(nullptr, 2, reinterpret_cast<LPBYTE>(&printerInfo));
    EXPECT_TRUE(m_printer) << "error " << GetLastError();
}

TestPrinter::~TestPrinter() {
    if (!m_printer)
        return;
    DeletePrinter(m_printer);
    ClosePrinter(m_printer);
    DeletePrinterDriverW(nullptr, nullptr, m_driver.data()); // stays while another printer uses it
}
