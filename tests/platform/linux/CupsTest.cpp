// The queues of a print server as the spooler shows them. Each case runs in a process of its own,
// since the spooler remembers for a while what a server answered.

#include "tests/platform/PrinterRecords.h"

#include <arpa/inet.h>
#include <cups/cups.h>
#include <gtest/gtest.h>
#include <sys/socket.h>

#include <chrono>
#include <cstdlib>
#include <string>
#include <thread>
#include <vector>

namespace {

constexpr struct {
    const char* name;
    const char* driver;
    int type;
} Queues[] = {
    {"Farbe", "Example Color Printer", CUPS_PRINTER_DEFAULT},
    {"Gr\xC3\xB6\xC3\x9F"
     "e A0",
     "Example Plotter", CUPS_PRINTER_REMOTE},
    {"raw", "Local Raw Printer", CUPS_PRINTER_LOCAL},
};

/// Listens on the loopback interface and tells the layer so.
int ListenAsPrintServer() {
    const int listener = socket(AF_INET, SOCK_STREAM, 0);
    sockaddr_in address{};
    address.sin_family = AF_INET;
    address.sin_addr.s_addr = htonl(INADDR_LOOPBACK);
    socklen_t size = sizeof address;
    EXPECT_EQ(0, bind(listener, reinterpret_cast<sockaddr*>(&address), size));
    EXPECT_EQ(0, listen(listener, 4));
    getsockname(listener, reinterpret_cast<sockaddr*>(&address), &size);
    setenv("CUPS_SERVER", ("127.0.0.1:" + std::to_string(ntohs(address.sin_port))).c_str(), 1);
    return listener;
}

void AnswerWithQueues(http_t* http) {
    ipp_t* request = ippNew();
    while (ippRead(http, request) == IPP_STATE_ATTRIBUTE) {
    }
    ipp_t* response = ippNewResponse(request);
    for (const auto& queue : Queues) {
        ippAddString(response, IPP_TAG_PRINTER, IPP_TAG_NAME, "printer-name", nullptr, queue.name);
        ippAddString(response, IPP_TAG_PRINTER, IPP_TAG_TEXT, "printer-make-and-model", nullptr,
                     queue.driver);
        ippAddString(response, IPP_TAG_PRINTER, IPP_TAG_URI, "device-uri", nullptr, "file:/x");
        ippAddInteger(response, IPP_TAG_PRINTER, IPP_TAG_ENUM, "printer-type", queue.type);
        ippAddSeparator(response);
    }
    httpClearFields(http);
    httpSetField(http, HTTP_FIELD_CONTENT_TYPE, "application/ipp");
    httpSetLength(http, ippLength(response));
    httpWriteResponse(http, HTTP_STATUS_OK);
    while (ippWrite(http, response) == IPP_STATE_ATTRIBUTE) {
    }
    ippDelete(request);
    ippDelete(response);
}

/// Tells whether the queue asked for has a printer description: all but the raw one.
void AnswerAboutDescription(http_t* http, const std::string& resource) {
    httpClearFields(http);
    httpWriteResponse(http,
                      resource == "/printers/raw.ppd" ? HTTP_STATUS_NOT_FOUND : HTTP_STATUS_OK);
}

void Serve(int listener) {
    while (http_t* http = httpAcceptConnection(listener, 1)) {
        char resource[1024];
        for (;;) {
            const http_state_t method = httpReadRequest(http, resource, sizeof resource);
            if (method == HTTP_STATE_WAITING)
                continue;
            if (method != HTTP_STATE_POST && method != HTTP_STATE_HEAD)
                break;
            while (httpUpdate(http) == HTTP_STATUS_CONTINUE) {
            }
            if (httpGetExpect(http) == HTTP_STATUS_CONTINUE)
                httpWriteResponse(http, HTTP_STATUS_CONTINUE);
            if (method == HTTP_STATE_POST)
                AnswerWithQueues(http);
            else
                AnswerAboutDescription(http, resource);
            httpFlushWrite(http);
        }
        httpClose(http);
    }
}

std::wstring DataFileOf(LPWSTR printerName) {
    HANDLE printer = nullptr;
    if (!OpenPrinterW(printerName, &printer, nullptr))
        return L"not opened";
    const std::vector<BYTE> buffer = DriverRecord(printer);
    ClosePrinter(printer);
    return reinterpret_cast<const DRIVER_INFO_3W*>(buffer.data())->pDataFile;
}

/// @return one line a printer: name, driver, attributes, data file
std::vector<std::wstring> Describe(DWORD flags) {
    DWORD count = 0;
    const std::vector<BYTE> buffer = PrinterRecords(flags, count);
    const auto* records = reinterpret_cast<const PRINTER_INFO_2W*>(buffer.data());
    std::vector<std::wstring> lines;
    for (const auto* record = records; record < records + count; ++record)
        lines.push_back(std::wstring(record->pPrinterName) + L"|" + record->pDriverName + L"|" +
                        std::to_wstring(record->Attributes) + L"|" +
                        DataFileOf(record->pPrinterName));
    return lines;
}

[[noreturn]] void CheckQueues() {
    std::thread(Serve, ListenAsPrintServer()).detach();
    const std::vector<std::wstring> expected = {
        L"Farbe|Example Color Printer|68|Farbe.ppd",
        L"Größe A0|Example Plotter|16|Größe A0.ppd",
        L"raw|Local Raw Printer|64|",
    };
    const bool good = Describe(PRINTER_ENUM_LOCAL | PRINTER_ENUM_CONNECTIONS) == expected &&
                      Describe(PRINTER_ENUM_CONNECTIONS) == std::vector<std::wstring>{expected[1]};
    std::_Exit(good ? 0 : 1);
}

[[noreturn]] void CheckNoPrinters(std::chrono::milliseconds longest) {
    const auto start = std::chrono::steady_clock::now();
    const bool none = Describe(PRINTER_ENUM_LOCAL).empty() && Describe(PRINTER_ENUM_LOCAL).empty();
    const bool inTime = std::chrono::steady_clock::now() - start < longest;
    std::_Exit(none && inTime ? 0 : 1);
}

class Cups : public testing::Test {
protected:
    Cups() { testing::FLAGS_gtest_death_test_style = "threadsafe"; }
};

TEST_F(Cups, QueuesArePrinters) {
    EXPECT_EXIT(CheckQueues(), testing::ExitedWithCode(0), "");
}

TEST_F(Cups, WithoutAServerThereAreNoneAtOnce) {
    EXPECT_EXIT(
        {
            setenv("CUPS_SERVER", "127.0.0.1:1", 1);
            CheckNoPrinters(std::chrono::milliseconds(500));
        },
        testing::ExitedWithCode(0), "");
}

TEST_F(Cups, AServerThatDoesNotAnswerIsGivenUp) {
    EXPECT_EXIT(
        {
            ListenAsPrintServer();
            CheckNoPrinters(std::chrono::milliseconds(2500));
        },
        testing::ExitedWithCode(0), "does not answer");
}

} // namespace
