#include "tests/support/TemporaryFolder.h"
#include "tests/support/TestPrinter.h"
#include "tests/support/Wine.h"

#include <windows.h>
#include <winspool.h>

#include <gtest/gtest.h>

#include <algorithm>
#include <optional>
#include <string>
#include <vector>

namespace {

constexpr DWORD Everything = PRINTER_ENUM_LOCAL | PRINTER_ENUM_CONNECTIONS;

/// The records of level 2, in a buffer of just the size asked for.
std::vector<BYTE> ListPrinters(DWORD flags, DWORD& count) {
    DWORD needed = 0;
    EnumPrintersW(flags, nullptr, 2, nullptr, 0, &needed, &count);
    std::vector<BYTE> buffer(needed);
    EXPECT_TRUE(EnumPrintersW(flags, nullptr, 2, buffer.data(), needed, &needed, &count));
    return buffer;
}

std::vector<std::wstring> PrinterNames(DWORD flags = Everything) {
    DWORD count = 0;
    const std::vector<BYTE> buffer = ListPrinters(flags, count);
    const auto* records = reinterpret_cast<const PRINTER_INFO_2W*>(buffer.data());
    std::vector<std::wstring> names;
    for (DWORD i = 0; i < count; ++i)
        names.emplace_back(records[i].pPrinterName);
    return names;
}

DWORD OpenError(std::wstring name, HANDLE* printer, DWORD access = PRINTER_READ) {
    PRINTER_DEFAULTSW defaults{nullptr, nullptr, access};
    return OpenPrinterW(name.data(), printer, &defaults) ? DWORD{ERROR_SUCCESS} : GetLastError();
}

class Spooler : public testing::Test {
protected:
    static bool Has(const std::wstring& name) {
        const std::vector<std::wstring> names = PrinterNames();
        return std::find(names.begin(), names.end(), name) != names.end();
    }

    /// The texts of a driver record, which the spooler wants to be writable.
    struct Driver {
        std::wstring name = L"Quillon test driver";
        std::wstring file;
        std::wstring environment;
        DRIVER_INFO_3W Record() {
            DRIVER_INFO_3W record{};
            record.cVersion = 3;
            record.pName = name.data();
            record.pEnvironment = environment.empty() ? nullptr : environment.data();
            record.pDriverPath = file.data();
            record.pDataFile = file.data();
            record.pConfigFile = file.data();
            return record;
        }
    };
    struct NewPrinter {
        std::wstring name = L"Quillon test";
        std::wstring driver = L"Quillon test driver";
        std::wstring port = L"FILE:";
        std::wstring processor = L"winprint";
        DWORD AddError() {
            PRINTER_INFO_2W record{};
            record.pPrinterName = name.data();
            record.pDriverName = driver.data();
            record.pPortName = port.data();
            record.pPrintProcessor = processor.data();
            HANDLE added = AddPrinterW(nullptr, 2, reinterpret_cast<LPBYTE>(&record));
            if (!added)
                return GetLastError();
            DeletePrinter(added);
            ClosePrinter(added);
            return ERROR_SUCCESS;
        }
    };

    static DWORD AddDriverError(DRIVER_INFO_3W record, DWORD level = 3) {
        return AddPrinterDriverW(nullptr, level, reinterpret_cast<LPBYTE>(&record))
                   ? DWORD{ERROR_SUCCESS}
                   : GetLastError();
    }

    TemporaryFolder m_folder;
    std::wstring m_ppd = m_folder.Write("test.ppd", "*PPD-Adobe: \"4.3\"\n").wstring();
};

TEST_F(Spooler, ListsPrintersWithTheirTextsInOneBuffer) {
    const TestPrinter first(L"Quillon first", L"Quillon driver", m_ppd);
    const TestPrinter second(L"Quillon second", L"Quillon driver", m_ppd);
    DWORD count = 0;
    std::vector<BYTE> buffer = ListPrinters(Everything, count);
    ASSERT_GE(count, 2U);
    const auto* records = reinterpret_cast<const PRINTER_INFO_2W*>(buffer.data());
    const auto isInside = [&](LPCWSTR text) {
        const auto* bytes = reinterpret_cast<const BYTE*>(text);
        return bytes > buffer.data() && bytes < buffer.data() + buffer.size();
    };
    EXPECT_STREQ(L"Quillon first", records[0].pPrinterName);
    EXPECT_STREQ(L"Quillon second", records[1].pPrinterName);
    EXPECT_STREQ(L"Quillon driver", records[1].pDriverName);
    EXPECT_STREQ(L"FILE:", records[1].pPortName);
    EXPECT_TRUE(isInside(records[0].pPrinterName) && isInside(records[1].pDriverName));

    DWORD needed = 0;
    const auto small = static_cast<DWORD>(buffer.size() - 1);
    EXPECT_FALSE(EnumPrintersW(Everything, nullptr, 2, buffer.data(), small, &needed, &count));
    EXPECT_EQ(DWORD{ERROR_INSUFFICIENT_BUFFER}, GetLastError());
    EXPECT_EQ(buffer.size(), needed);
    EXPECT_EQ(0U, count);
}

TEST_F(Spooler, ListsLocalPrintersAndConnectionsByFlag) {
    const TestPrinter printer(L"Quillon local", L"Quillon driver", m_ppd);
    const std::vector<std::wstring> local = PrinterNames(PRINTER_ENUM_LOCAL);
    const std::vector<std::wstring> connections = PrinterNames(PRINTER_ENUM_CONNECTIONS);
    EXPECT_EQ(1, std::count(local.begin(), local.end(), L"Quillon local"));
    EXPECT_EQ(0, std::count(connections.begin(), connections.end(), L"Quillon local"));
    DWORD needed = 0;
    DWORD count = 0;
    EXPECT_FALSE(EnumPrintersW(Everything, nullptr, 77, nullptr, 0, &needed, &count));
    EXPECT_EQ(DWORD{ERROR_INVALID_LEVEL}, GetLastError());
}

TEST_F(Spooler, OpensPrintersByName) {
    const TestPrinter printer(L"Quillon open", L"Quillon driver", m_ppd);
    HANDLE handle = nullptr;
    EXPECT_EQ(DWORD{ERROR_INVALID_PRINTER_NAME}, OpenError(L"Quillon none", &handle));
    ASSERT_EQ(DWORD{ERROR_SUCCESS}, OpenError(L"QUILLON open", &handle));
    if (!RunsOnWine()) { // which asks for no right to delete
        EXPECT_FALSE(DeletePrinter(handle));
        EXPECT_EQ(DWORD{ERROR_ACCESS_DENIED}, GetLastError());
    }
    EXPECT_TRUE(ClosePrinter(handle));
    EXPECT_FALSE(ClosePrinter(handle));
    EXPECT_EQ(DWORD{ERROR_INVALID_HANDLE}, GetLastError());
}

TEST_F(Spooler, TellsAPrintersDriver) {
    const TestPrinter printer(L"Quillon driven", L"Quillon driver", m_ppd);
    HANDLE handle = nullptr;
    ASSERT_EQ(DWORD{ERROR_SUCCESS}, OpenError(L"Quillon driven", &handle));
    DWORD needed = 0;
    EXPECT_FALSE(GetPrinterDriverW(handle, nullptr, 3, nullptr, 0, &needed));
    EXPECT_EQ(DWORD{ERROR_INSUFFICIENT_BUFFER}, GetLastError());
    std::vector<BYTE> buffer(needed);
    ASSERT_TRUE(GetPrinterDriverW(handle, nullptr, 3, buffer.data(), needed, &needed));
    const auto* record = reinterpret_cast<const DRIVER_INFO_3W*>(buffer.data());
    EXPECT_EQ(3U, record->cVersion);
    EXPECT_STREQ(L"Quillon driver", record->pName);
    EXPECT_EQ(L".ppd", std::filesystem::path(record->pDataFile).extension().wstring());
    EXPECT_FALSE(GetPrinterDriverW(handle, nullptr, 99, nullptr, 0, &needed));
    EXPECT_EQ(DWORD{ERROR_INVALID_LEVEL}, GetLastError());
    wchar_t nonsense[] = L"No such system";
    EXPECT_FALSE(GetPrinterDriverW(handle, nonsense, 3, nullptr, 0, &needed));
    EXPECT_EQ(DWORD{ERROR_INVALID_ENVIRONMENT}, GetLastError());
    ClosePrinter(handle);
}

TEST_F(Spooler, RefusesDriversThatAreIncomplete) {
    if (RunsOnWine())
        GTEST_SKIP() << "Wine takes a driver's record without looking, addresses of nothing too";
    Driver good;
    good.file = m_ppd;
    EXPECT_EQ(DWORD{ERROR_INVALID_LEVEL}, AddDriverError(good.Record(), 77));
    Driver missing;
    missing.file = (m_folder / "none.ppd").wstring();
    EXPECT_EQ(DWORD{ERROR_FILE_NOT_FOUND}, AddDriverError(missing.Record()));
    Driver foreign = good;
    foreign.environment = L"No such system";
    EXPECT_EQ(DWORD{ERROR_INVALID_ENVIRONMENT}, AddDriverError(foreign.Record()));
    DRIVER_INFO_3W noName = good.Record();
    noName.pName = nullptr;
    EXPECT_EQ(DWORD{ERROR_INVALID_PARAMETER}, AddDriverError(noName));
    DRIVER_INFO_3W noData = good.Record();
    noData.pDataFile = nullptr;
    EXPECT_EQ(DWORD{ERROR_INVALID_PARAMETER}, AddDriverError(noData));
    EXPECT_FALSE(DeletePrinterDriverW(nullptr, nullptr, good.name.data()));
    EXPECT_EQ(DWORD{ERROR_UNKNOWN_PRINTER_DRIVER}, GetLastError());
}

TEST_F(Spooler, AddsAPrinterWhenAllItNeedsIsThere) {
    if (RunsOnWine())
        GTEST_SKIP() << "Wine asks for nothing but the driver, and keeps a refused printer";
    Driver driver;
    driver.file = m_ppd;
    EXPECT_EQ(DWORD{ERROR_UNKNOWN_PRINTER_DRIVER}, NewPrinter().AddError());
    ASSERT_EQ(DWORD{ERROR_SUCCESS}, AddDriverError(driver.Record()));
    NewPrinter badPort;
    badPort.port = L"NOWHERE:";
    EXPECT_EQ(DWORD{ERROR_UNKNOWN_PORT}, badPort.AddError());
    NewPrinter badProcessor;
    badProcessor.processor = L"none";
    EXPECT_EQ(DWORD{ERROR_UNKNOWN_PRINTPROCESSOR}, badProcessor.AddError());
    NewPrinter badName;
    badName.name = L"a,b";
    EXPECT_EQ(DWORD{ERROR_INVALID_PRINTER_NAME}, badName.AddError());
    EXPECT_EQ(DWORD{ERROR_SUCCESS}, NewPrinter().AddError());
    EXPECT_FALSE(Has(L"Quillon test"));

    std::optional<TestPrinter> printer(std::in_place, L"Quillon test", driver.name, m_ppd);
    NewPrinter again;
    again.name = L"quillon TEST";
    EXPECT_EQ(DWORD{ERROR_PRINTER_ALREADY_EXISTS}, again.AddError());
    EXPECT_FALSE(DeletePrinterDriverW(nullptr, nullptr, driver.name.data()));
    EXPECT_EQ(DWORD{ERROR_PRINTER_DRIVER_IN_USE}, GetLastError());
    printer.reset(); // takes the driver with it
    EXPECT_EQ(DWORD{ERROR_UNKNOWN_PRINTER_DRIVER}, NewPrinter().AddError());
}

} // namespace
