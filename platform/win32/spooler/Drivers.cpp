#include "platform/win32/base/LogSink.h"
#include "platform/win32/spooler/PackRecords.h"
#include "platform/win32/spooler/Spooler.h"
#include "platform/win32/text/Utf8.h"

#include <filesystem>

using win32::PrinterDriver;
using win32::Spooler;

namespace {

constexpr DWORD UserModeVersion = 3; // of drivers since Windows 2000

bool IsFile(LPCWSTR path) {
    const std::optional<std::string> utf8 = win32::ToUtf8(path);
    std::error_code ignored;
    return utf8 && std::filesystem::is_regular_file(*utf8, ignored);
}

bool IsGiven(LPCWSTR text) {
    return text && *text;
}

/// Drivers are installed for one environment, which goes without saying.
bool IsOtherEnvironment(LPCWSTR environment) {
    if (!IsGiven(environment))
        return false;
    win32::Log("spooler: environments of drivers are not supported");
    return true;
}

/// @return a system error code
DWORD CheckNewDriver(LPWSTR server, const DRIVER_INFO_3W& record) {
    if (IsGiven(server) || IsGiven(record.pDependentFiles)) {
        win32::Log("AddPrinterDriverW: servers and dependent files are not supported");
        return ERROR_NOT_SUPPORTED;
    }
    if (record.cVersion != UserModeVersion || !IsGiven(record.pName) ||
        !IsGiven(record.pDriverPath) || !IsGiven(record.pDataFile) || !IsGiven(record.pConfigFile))
        return ERROR_INVALID_PARAMETER;
    if (IsOtherEnvironment(record.pEnvironment))
        return ERROR_INVALID_ENVIRONMENT;
    // The description is what is read here; no code of a driver is ever loaded.
    return IsFile(record.pDataFile) ? ERROR_SUCCESS : ERROR_FILE_NOT_FOUND;
}

DRIVER_INFO_3W ToRecord(const PrinterDriver& driver) {
    DRIVER_INFO_3W record{};
    record.cVersion = UserModeVersion;
    record.pName = win32::Lend(driver.name);
    record.pDataFile = win32::Lend(driver.dataFile);
    return record;
}

} // namespace

BOOL WINAPI AddPrinterDriverW(LPWSTR name, DWORD level, LPBYTE driverInfo) {
    if (level != 3) {
        win32::Log("AddPrinterDriverW: only level 3 is supported");
        return win32::Fail(ERROR_INVALID_LEVEL);
    }
    if (!driverInfo)
        return win32::Fail(ERROR_INVALID_PARAMETER);
    const auto& record = *reinterpret_cast<const DRIVER_INFO_3W*>(driverInfo);
    DWORD error = CheckNewDriver(name, record);
    if (error == ERROR_SUCCESS)
        error = Spooler::Instance().AddDriver({record.pName, record.pDataFile});
    return error == ERROR_SUCCESS || win32::Fail(error);
}

BOOL WINAPI DeletePrinterDriverW(LPWSTR name, LPWSTR environment, LPWSTR driverName) {
    if (IsGiven(name)) {
        win32::Log("DeletePrinterDriverW: servers are not supported");
        return win32::Fail(ERROR_NOT_SUPPORTED);
    }
    if (!driverName)
        return win32::Fail(ERROR_INVALID_PARAMETER);
    if (IsOtherEnvironment(environment))
        return win32::Fail(ERROR_INVALID_ENVIRONMENT);
    const DWORD error = Spooler::Instance().RemoveDriver(driverName);
    return error == ERROR_SUCCESS || win32::Fail(error);
}

BOOL WINAPI GetPrinterDriverW(HANDLE printer, LPWSTR environment, DWORD level, LPBYTE driverInfo,
                              DWORD size, LPDWORD needed) {
    if (!needed)
        return win32::Fail(RPC_X_NULL_REF_POINTER);
    *needed = 0;
    const std::shared_ptr<win32::OpenedPrinter> opened =
        Spooler::Instance().Handles().Find(printer);
    if (!opened)
        return win32::Fail(ERROR_INVALID_HANDLE);
    if (opened->printer->deleted)
        return win32::Fail(ERROR_PRINTER_DELETED);
    if (level != 3) {
        win32::Log("GetPrinterDriverW: only level 3 is supported");
        return win32::Fail(ERROR_INVALID_LEVEL);
    }
    if (IsOtherEnvironment(environment))
        return win32::Fail(ERROR_INVALID_ENVIRONMENT);
    if (!driverInfo && size > 0)
        return win32::Fail(ERROR_INVALID_USER_BUFFER);
    using Record = DRIVER_INFO_3W;
    constexpr LPWSTR Record::*Texts[] = {&Record::pName, &Record::pDataFile};
    const std::vector<Record> records = {ToRecord(*opened->printer->driver)};
    return win32::PackRecords(records, Texts, driverInfo, size, needed);
}
