#include "standins/office/inprocess/Papers.h"

#include "standins/shared/Text.h"

#include <windows.h>
#include <winspool.h>

#include <cups/cups.h>
#include <cups/ppd.h>

#include <cstdio>
#include <memory>

// The library calls these files old, but nothing else says as much of a printer.
#pragma GCC diagnostic ignored "-Wdeprecated-declarations"

namespace standins {

namespace {

constexpr int ConnectingTakes = 500; // milliseconds
constexpr double AnswerTakes = 2;    // seconds

using Description = std::unique_ptr<ppd_file_t, void (*)(ppd_file_t*)>;

/// The file that describes the printer, as the spooler calls it; of a queue it is no path.
std::wstring DataFileOf(const std::wstring& printer) {
    std::wstring changeable = printer; // the spooler's interface wants it so
    HANDLE handle = nullptr;
    if (!OpenPrinterW(changeable.data(), &handle, nullptr))
        return {};
    DWORD size = 0;
    GetPrinterDriverW(handle, nullptr, 3, nullptr, 0, &size);
    std::vector<BYTE> record(size + 1);
    const bool isRead =
        size > 0 && GetPrinterDriverW(handle, nullptr, 3, record.data(), size, &size);
    ClosePrinter(handle);
    const auto* const driver = reinterpret_cast<const DRIVER_INFO_3W*>(record.data());
    return isRead && driver->pDataFile ? driver->pDataFile : std::wstring();
}

Description Fetch(const std::string& name) {
    const std::unique_ptr<http_t, void (*)(http_t*)> server(
        httpConnect2(cupsServer(), ippPort(), nullptr, AF_UNSPEC, cupsEncryption(), 1,
                     ConnectingTakes, nullptr),
        httpClose);
    const std::unique_ptr<std::FILE, int (*)(std::FILE*)> copy(std::tmpfile(), std::fclose);
    if (!server || !copy)
        return {nullptr, ppdClose};
    httpSetTimeout(
        server.get(), AnswerTakes, [](http_t*, void*) { return 0; }, nullptr);
    if (cupsGetFd(server.get(), ("/printers/" + name).c_str(), fileno(copy.get())) !=
        HTTP_STATUS_OK)
        return {nullptr, ppdClose};
    std::rewind(copy.get());
    return {ppdOpen(copy.get()), ppdClose};
}

std::string OptionFor(const ppd_size_t& paper) {
    std::string option = "--paper=";
    for (const float value : {paper.width, paper.length, paper.left, paper.bottom,
                              paper.width - paper.right, paper.length - paper.top})
        option += std::to_string(value) + ',';
    option.pop_back();
    return option;
}

} // namespace

std::vector<std::string> PaperOptions(const std::wstring& printer) {
    const std::wstring dataFile = DataFileOf(printer);
    const std::optional<std::string> name = ToUtf8(dataFile);
    if (!name || name->empty() || name->find('/') != std::string::npos)
        return {};
    const Description description = Fetch(*name);
    if (!description)
        return {};
    std::vector<std::string> options;
    ppdMarkDefaults(description.get());
    for (int i = 0; i < description->num_sizes; ++i) {
        const ppd_size_t& paper = description->sizes[i];
        const auto place = paper.marked ? options.begin() : options.end(); // the usual one first
        if (paper.width > 0 && paper.length > 0)
            options.insert(place, OptionFor(paper));
    }
    if (!options.empty() && description->variable_sizes == 0)
        options.emplace_back("--only-these-papers");
    return options;
}

} // namespace standins
