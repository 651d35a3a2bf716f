#include "tests/platform/ErrorOf.h"
#include "tests/platform/PrinterRecords.h"
#include "tests/support/TemporaryFolder.h"
#include "tests/support/TestPrinter.h"
#include "tests/support/Wine.h"

#include <gtest/gtest.h>

#include <optional>
#include <string>

namespace {

constexpr DWORD Everything = PRINTER_ENUM_LOCAL | PRINTER_ENUM_CONNECTIONS;

/// The spooler's records and calls take texts that can be written to, but only read them.
LPWSTR Writable(const wchar_t* text) {
    return const_cast<LPWSTR>(text);
}

class Spooler : public testing::Test {
protected:
    TemporaryFolder m_folder;
    std::wstring m_ppd = m_folder.Write("test.ppd", "*PPD-Adobe: \"4.3\"\n").wstring();
    std::optional<TestPrinter> m_printer{std::in_place, L"Quillon first", L"Quillon driver", m_ppd};
};

TEST_F(Spooler, ListsPrintersWithTheirTextsInOneBuffer) {
    const TestPrinter second(L"Quillon second", L"Quillon driver", m_ppd);
    DWORD count = 0;
    std::vector<BYTE> buffer = PrinterRecords(Everything, count);
    ASSERT_GE(count, 2U);
    const auto* records = reinterpret_cast<const PRINTER_INFO_2W*>(buffer.data());
    EXPECT_STREQ(L"Quillon first", records[0].pPrinterName);
    EXPECT_STREQ(L"Quillon second", records[1].pPrinterName);
    EXPECT_STREQ(L"Quillon driver", records[1].pDriverName);
    EXPECT_STREQ(L"FILE:", records[1].pPortName);
    for (LPCWSTR text : {records[0].pPrinterName, records[1].pDriverName}) {
        const auto* bytes = reinterpret_cast<const BYTE*>(text);
        EXPECT_TRUE(bytes > buffer.data() && bytes < buffer.data() + buffer.size());
    }

    DWORD needed = 0;
    const auto small = static_cast<DWORD>(buffer.size() - 1);
    EXPECT_EQ(
        ERROR_INSUFFICIENT_BUFFER,
        ErrorOf(EnumPrintersW(Everything, nullptr, 2, buffer.data(), small, &needed, &count)));
    EXPECT_EQ(buffer.size(), needed);
    EXPECT_EQ(0U, count);
}

TEST_F(Spooler, OpensPrintersByName) {
    PRINTER_DEFAULTSW reading{nullptr, nullptr, PRINTER_READ};
    HANDLE printer = nullptr;
    EXPECT_EQ(ERROR_INVALID_PRINTER_NAME,
              ErrorOf(OpenPrinterW(Writable(L"Quillon none"), &printer, &reading)));
    ASSERT_EQ(ERROR_SUCCESS, ErrorOf(OpenPrinterW(Writable(L"QUILLON first"), &printer, &reading)));

    const std::vector<BYTE> buffer = DriverRecord(printer);
    const auto* record = reinterpret_cast<const DRIVER_INFO_3W*>(buffer.data());
    EXPECT_EQ(3U, record->cVersion);
    EXPECT_STREQ(L"Quillon driver", record->pName);
    EXPECT_EQ(L".ppd", std::filesystem::path(record->pDataFile).extension().wstring());

    if (!RunsOnWine()) { // which asks for no right to delete
        EXPECT_EQ(ERROR_ACCESS_DENIED, ErrorOf(DeletePrinter(printer)));
    }
    EXPECT_TRUE(ClosePrinter(printer));
    EXPECT_EQ(ERROR_INVALID_HANDLE, ErrorOf(ClosePrinter(printer)));
}

TEST_F(Spooler, AddsNoPrinterWithoutAllItNeeds) {
    if (RunsOnWine())
        GTEST_SKIP() << "Wine asks for nothing but the driver, and keeps a refused printer";
    const struct {
        LPWSTR PRINTER_INFO_2W::*field;
        const wchar_t* text;
        LSTATUS error;
    } cases[] = {
        {&PRINTER_INFO_2W::pDriverName, L"Quillon none", ERROR_UNKNOWN_PRINTER_DRIVER},
        {&PRINTER_INFO_2W::pPortName, L"NOWHERE:", ERROR_UNKNOWN_PORT},
        {&PRINTER_INFO_2W::pPrintProcessor, L"none", ERROR_UNKNOWN_PRINTPROCESSOR},
        {&PRINTER_INFO_2W::pPrinterName, L"a,b", ERROR_INVALID_PRINTER_NAME},
        {&PRINTER_INFO_2W::pPrinterName, L"quillon FIRST", ERROR_PRINTER_ALREADY_EXISTS},
    };
    for (const auto& expected : cases) {
        PRINTER_INFO_2W record{};
        record.pPrinterName = Writable(L"Quillon new");
        record.pDriverName = Writable(L"Quillon driver");
        record.pPortName = Writable(L"FILE:");
        record.pPrintProcessor = Writable(L"winprint");
        record.*expected.field = Writable(expected.text);
        EXPECT_EQ(expected.error,
                  ErrorOf(AddPrinterW(nullptr, 2, reinterpret_cast<LPBYTE>(&record))))
            << expected.text;
    }
    const auto deleteDriver = [] {
        return ErrorOf(DeletePrinterDriverW(nullptr, nullptr, Writable(L"Quillon driver")));
    };
    EXPECT_EQ(ERROR_PRINTER_DRIVER_IN_USE, deleteDriver());
    m_printer.reset(); // takes the driver with it
    EXPECT_EQ(ERROR_UNKNOWN_PRINTER_DRIVER, deleteDriver());
}

} // namespace
