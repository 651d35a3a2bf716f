#include "tests/host/Program.h"

#include "tests/host/System.h"

#include <windows.h>
#include <winspool.h>
// After it, which it takes for granted.
#include <objbase.h>

#include <wx/string.h>

#include <gtest/gtest.h>

#include <chrono>
#include <sstream>
#include <thread>

namespace fs = std::filesystem;

namespace {

/// Leaves the machine to the next program as it was, where it outlives this one.
class CleanMachine : public testing::Environment {
    void TearDown() override {
        UnregisterStandIn();
        wchar_t name[] = L"Quillon PostScript File Printer"; // its driver's too
        PRINTER_DEFAULTSW access = {nullptr, nullptr, PRINTER_ALL_ACCESS};
        HANDLE printer = nullptr;
        if (!OpenPrinterW(name, &printer, &access))
            return;
        EXPECT_TRUE(DeletePrinter(printer));
        ClosePrinter(printer);
        DeletePrinterDriverW(nullptr, nullptr, name);
    }
};

[[maybe_unused]] testing::Environment* const g_cleanMachine =
    testing::AddGlobalTestEnvironment(new CleanMachine);

} // namespace

std::vector<nlohmann::json> RunResult::Records() const {
    std::vector<nlohmann::json> records;
    std::istringstream lines(out);
    for (std::string line; std::getline(lines, line);) {
        records.push_back(nlohmann::json::parse(line, nullptr, false));
        EXPECT_TRUE(records.back().is_object()) << line;
    }
    return records;
}

std::vector<nlohmann::json> RunResult::Records(const std::string& type) const {
    std::vector<nlohmann::json> records;
    for (nlohmann::json& record : Records())
        if (record.value("type", "") == type)
            records.push_back(std::move(record));
    return records;
}

void RunningProgram::AwaitNote() const {
    Await("the note",
          [this] { return Err().find("finishing what is under way") != std::string::npos; });
}

void RunningProgram::InterruptTwice() const {
    Interrupt();
    AwaitNote();
    Terminate();
}

RunResult RunningProgram::Wait() {
    const int exitCode = ExitCode();
    return {exitCode, ReadBytes(m_folder / "out"), ReadBytes(m_folder / "err")};
}

RunResult RunProgram(const std::vector<std::string>& command) {
    return RunningProgram(command).Wait();
}

std::vector<std::string> QuillonCommand(std::vector<std::string> arguments) {
    arguments.insert(arguments.begin(),
                     {QUILLON_PROGRAM, "--filters", TEST_FILTERS, "--stand-ins", TEST_STAND_INS});
    return arguments;
}

RunResult RunQuillon(std::vector<std::string> arguments) {
    return RunProgram(QuillonCommand(std::move(arguments)));
}

void UnregisterStandIn(const std::string& file) {
    const HMODULE module = LoadLibraryW(wxString::FromUTF8(file + System::ModuleSuffix).wc_str());
    using Unregister = HRESULT(STDMETHODCALLTYPE*)();
    const auto unregister = reinterpret_cast<Unregister>(reinterpret_cast<void (*)()>(
        module ? GetProcAddress(module, "DllUnregisterServer") : nullptr));
    ASSERT_TRUE(unregister) << file;
    EXPECT_EQ(unregister(), S_OK);
    FreeLibrary(module);
}

void Await(const std::string& what, const std::function<bool()>& condition) {
    using namespace std::chrono;
    const auto end = steady_clock::now() + seconds(20);
    while (!condition() && steady_clock::now() < end)
        std::this_thread::sleep_for(milliseconds(5));
    ASSERT_TRUE(condition()) << what;
}

void AwaitFile(const fs::path& file) {
    Await(file.u8string(), [&file] { return fs::exists(file); });
}
