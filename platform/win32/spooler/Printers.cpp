#include "platform/win32/base/LogSink.h"
#include "platform/win32/spooler/PackRecords.h"
#include "platform/win32/spooler/Spooler.h"
#include "platform/win32/text/CaseFold.h"

using win32::OpenedPrinter;
using win32::Printer;
using win32::Spooler;

namespace {

constexpr std::size_t LongestName = 220;

bool IsGoodName(const std::wstring& name) {
    return !name.empty() && name.size() <= LongestName &&
           name.find_first_of(L"\\,!") == std::wstring::npos;
}

bool IsKnownPort(const std::wstring& name) {
    for (const wchar_t* port : {L"FILE:", L"LPT1:", L"LPT2:", L"LPT3:", L"NUL:"})
        if (win32::SameName(name, port))
            return true;
    return false;
}

PRINTER_INFO_2W ToRecord(const Printer& printer) {
    PRINTER_INFO_2W record{};
    record.pPrinterName = win32::Lend(printer.name);
    record.pPortName = win32::Lend(printer.portName);
    record.pDriverName = win32::Lend(printer.driver->name);
    record.Attributes = printer.attributes;
    return record;
}

bool IsAsked(const Printer& printer, DWORD flags) {
    const bool isConnection = (printer.attributes & PRINTER_ATTRIBUTE_NETWORK) != 0;
    return (flags & (isConnection ? PRINTER_ENUM_CONNECTIONS : PRINTER_ENUM_LOCAL)) != 0;
}

/// @return a system error code
DWORD CheckNewPrinter(LPWSTR server, const PRINTER_INFO_2W& record) {
    if (server || record.pDevMode || record.pSecurityDescriptor) {
        win32::Log("AddPrinterW: servers, device modes and protection are not supported");
        return ERROR_NOT_SUPPORTED;
    }
    if (!IsGoodName(win32::TextOrEmpty(record.pPrinterName)))
        return ERROR_INVALID_PRINTER_NAME;
    if (!IsKnownPort(win32::TextOrEmpty(record.pPortName)))
        return ERROR_UNKNOWN_PORT;
    if (!win32::SameName(win32::TextOrEmpty(record.pPrintProcessor), L"winprint"))
        return ERROR_UNKNOWN_PRINTPROCESSOR;
    if (record.pDatatype && !win32::SameName(record.pDatatype, L"RAW"))
        return ERROR_INVALID_DATATYPE;
    return ERROR_SUCCESS;
}

} // namespace

BOOL WINAPI EnumPrintersW(DWORD flags, LPWSTR /*name*/, DWORD level, LPBYTE printers, DWORD size,
                          LPDWORD needed, LPDWORD returned) {
    if (!needed || !returned)
        return win32::Fail(RPC_X_NULL_REF_POINTER);
    *needed = 0;
    *returned = 0;
    if (level != 2) {
        win32::Log("EnumPrintersW: only level 2 is supported");
        return win32::Fail(ERROR_INVALID_LEVEL);
    }
    if ((flags & ~(PRINTER_ENUM_LOCAL | PRINTER_ENUM_CONNECTIONS)) != 0) {
        win32::Log("EnumPrintersW: only local printers and connections are listed");
        return win32::Fail(ERROR_INVALID_FLAGS);
    }
    if (!printers && size > 0)
        return win32::Fail(ERROR_INVALID_USER_BUFFER);
    const win32::Printers all = Spooler::Instance().All();
    std::vector<PRINTER_INFO_2W> records;
    for (const auto& printer : all)
        if (IsAsked(*printer, flags))
            records.push_back(ToRecord(*printer));
    using Record = PRINTER_INFO_2W;
    constexpr LPWSTR Record::*Texts[] = {&Record::pPrinterName, &Record::pPortName,
                                         &Record::pDriverName};
    if (!win32::PackRecords(records, Texts, printers, size, needed))
        return FALSE;
    *returned = static_cast<DWORD>(records.size());
    return TRUE;
}

BOOL WINAPI OpenPrinterW(LPWSTR printerName, LPHANDLE printer, LPPRINTER_DEFAULTSW defaults) {
    if (!printer)
        return win32::Fail(ERROR_INVALID_PARAMETER);
    *printer = nullptr;
    if (!printerName) {
        win32::Log("OpenPrinterW: the print server itself cannot be opened");
        return win32::Fail(ERROR_INVALID_PRINTER_NAME);
    }
    if (defaults && defaults->pDevMode) {
        win32::Log("OpenPrinterW: device modes are not supported");
        return win32::Fail(ERROR_NOT_SUPPORTED);
    }
    if (defaults && defaults->pDatatype && !win32::SameName(defaults->pDatatype, L"RAW"))
        return win32::Fail(ERROR_INVALID_DATATYPE);
    std::shared_ptr<Printer> found = Spooler::Instance().Find(printerName);
    if (!found)
        return win32::Fail(ERROR_INVALID_PRINTER_NAME);
    auto opened = std::make_shared<OpenedPrinter>(
        OpenedPrinter{std::move(found), defaults ? defaults->DesiredAccess : 0});
    *printer = Spooler::Instance().Handles().Add(std::move(opened));
    return TRUE;
}

BOOL WINAPI ClosePrinter(HANDLE printer) {
    return Spooler::Instance().Handles().Remove(printer) || win32::Fail(ERROR_INVALID_HANDLE);
}

HANDLE WINAPI AddPrinterW(LPWSTR name, DWORD level, LPBYTE printer) {
    DWORD error = ERROR_SUCCESS;
    if (level != 2)
        error = ERROR_INVALID_LEVEL;
    else if (!printer)
        error = ERROR_INVALID_PARAMETER;
    if (error != ERROR_SUCCESS) {
        SetLastError(error);
        return nullptr;
    }
    const auto& record = *reinterpret_cast<const PRINTER_INFO_2W*>(printer);
    auto added = std::make_shared<Printer>();
    error = CheckNewPrinter(name, record);
    if (error == ERROR_SUCCESS) {
        added->name = record.pPrinterName;
        added->portName = record.pPortName;
        error = Spooler::Instance().AddPrinter(added, win32::TextOrEmpty(record.pDriverName));
    }
    if (error != ERROR_SUCCESS) {
        SetLastError(error);
        return nullptr;
    }
    return Spooler::Instance().Handles().Add(
        std::make_shared<OpenedPrinter>(OpenedPrinter{std::move(added), PRINTER_ALL_ACCESS}));
}

BOOL WINAPI DeletePrinter(HANDLE printer) {
    const std::shared_ptr<OpenedPrinter> opened = Spooler::Instance().Handles().Find(printer);
    if (!opened)
        return win32::Fail(ERROR_INVALID_HANDLE);
    if ((opened->access & PRINTER_ALL_ACCESS) != PRINTER_ALL_ACCESS)
        return win32::Fail(ERROR_ACCESS_DENIED);
    const DWORD error = Spooler::Instance().RemovePrinter(opened->printer);
    return error == ERROR_SUCCESS || win32::Fail(error);
}
