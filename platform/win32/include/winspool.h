#pragma once

// The print spooler: what CUPS lists, and the printers that this process put in by hand.

#include <windef.h>
#include <winerror.h>

struct DEVMODEW; // opaque here: nothing in this system looks inside one that the spooler gave
using LPDEVMODEW = DEVMODEW*;

struct PRINTER_INFO_2W {
    LPWSTR pServerName;
    LPWSTR pPrinterName;
    LPWSTR pShareName;
    LPWSTR pPortName;
    LPWSTR pDriverName;
    LPWSTR pComment;
    LPWSTR pLocation;
    LPDEVMODEW pDevMode;
    LPWSTR pSepFile;
    LPWSTR pPrintProcessor;
    LPWSTR pDatatype;
    LPWSTR pParameters;
    PSECURITY_DESCRIPTOR pSecurityDescriptor;
    DWORD Attributes;
    DWORD Priority;
    DWORD DefaultPriority;
    DWORD StartTime;
    DWORD UntilTime;
    DWORD Status;
    DWORD cJobs;
    DWORD AveragePPM;
};

struct DRIVER_INFO_3W {
    DWORD cVersion;
    LPWSTR pName;
    LPWSTR pEnvironment;
    LPWSTR pDriverPath;
    LPWSTR pDataFile;
    LPWSTR pConfigFile;
    LPWSTR pHelpFile;
    LPWSTR pDependentFiles;
    LPWSTR pMonitorName;
    LPWSTR pDefaultDataType;
};

struct PRINTER_DEFAULTSW {
    LPWSTR pDatatype;
    LPDEVMODEW pDevMode;
    DWORD DesiredAccess;
};
using LPPRINTER_DEFAULTSW = PRINTER_DEFAULTSW*;

#define PRINTER_ENUM_LOCAL 0x00000002U
#define PRINTER_ENUM_CONNECTIONS 0x00000004U

#define PRINTER_ATTRIBUTE_DEFAULT 0x00000004U
#define PRINTER_ATTRIBUTE_NETWORK 0x00000010U
#define PRINTER_ATTRIBUTE_LOCAL 0x00000040U

#define PRINTER_READ 0x00020008U
#define PRINTER_ALL_ACCESS 0x000F000CU

extern "C" {

BOOL WINAPI EnumPrintersW(DWORD flags, LPWSTR name, DWORD level, LPBYTE printers, DWORD size,
                          LPDWORD needed, LPDWORD returned);
BOOL WINAPI OpenPrinterW(LPWSTR printerName, LPHANDLE printer, LPPRINTER_DEFAULTSW defaults);
BOOL WINAPI ClosePrinter(HANDLE printer);
BOOL WINAPI GetPrinterDriverW(HANDLE printer, LPWSTR environment, DWORD level, LPBYTE driverInfo,
                              DWORD size, LPDWORD needed);
BOOL WINAPI AddPrinterDriverW(LPWSTR name, DWORD level, LPBYTE driverInfo);
BOOL WINAPI DeletePrinterDriverW(LPWSTR name, LPWSTR environment, LPWSTR driverName);
HANDLE WINAPI AddPrinterW(LPWSTR name, DWORD level, LPBYTE printer);
BOOL WINAPI DeletePrinter(HANDLE printer);

} // extern "C"
