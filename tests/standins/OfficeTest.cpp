#include "tests/standins/OfficeTest.h"

#include "tests/standins/Processes.h"
#include "tests/standins/StandInModule.h"

#include <ole2.h>
#include <windows.h>

#include <wx/string.h>

#include <cstdlib>

namespace fs = std::filesystem;

namespace {

constexpr const wchar_t* SettingsKey = L"SOFTWARE\\Orvanta\\Office Stand-Ins";

} // namespace

void OfficeTest::SetUp() {
    m_socketsBefore = SocketsOfKilledEngines();
    setenv("TMPDIR", m_temporary.Path().c_str(), 1);
    const fs::path ppd = m_files.Write("printer.ppd", "*PPD-Adobe: \"4.3\"\n");
    m_printer.emplace(Printer, L"Test driver", ppd.wstring());
    CoInitialize(nullptr);
    ASSERT_EQ(S_OK, StandInModule::Instance().Register());
    RegDeleteTreeW(HKEY_CURRENT_USER, SettingsKey);
}

void OfficeTest::TearDown() {
    EXPECT_EQ("", Leftovers());
    RegDeleteTreeW(HKEY_CURRENT_USER, SettingsKey);
    CoUninitialize();
    unsetenv("TMPDIR");
}

void OfficeTest::SetLimit(const wchar_t* name, unsigned seconds) {
    HKEY key = nullptr;
    ASSERT_EQ(ERROR_SUCCESS,
              RegCreateKeyExW(HKEY_CURRENT_USER, SettingsKey, 0, nullptr, REG_OPTION_NON_VOLATILE,
                              KEY_WRITE, nullptr, &key, nullptr));
    const DWORD value = seconds;
    EXPECT_EQ(ERROR_SUCCESS, RegSetValueExW(key, name, 0, REG_DWORD,
                                            reinterpret_cast<const BYTE*>(&value), sizeof value));
    RegCloseKey(key);
}

std::string OfficeTest::Leftovers() const {
    return LeftoversOf(m_temporary.Path(), m_files.Path()) + NewSockets();
}

bool IsLibreOfficeInstalled() {
    HKEY key = nullptr;
    const bool isRegistered =
        RegOpenKeyExW(HKEY_CLASSES_ROOT, L"Word.Application", 0, KEY_READ, &key) == ERROR_SUCCESS;
    if (isRegistered)
        RegCloseKey(key);
    return isRegistered;
}

/// The sockets have names that do not tell whose they are: one that goes at once may be that of a
/// test which runs at the same time.
std::string OfficeTest::NewSockets() const {
    std::string found;
    Await(
        [&] {
            found.clear();
            for (const std::string& socket : SocketsOfKilledEngines()) {
                if (m_socketsBefore.count(socket) == 0)
                    found += "socket " + socket + "\n";
            }
            return found.empty();
        },
        std::chrono::seconds(1));
    return found;
}

std::wstring WidePath(const fs::path& path) {
    return wxString::FromUTF8(path.string()).ToStdWstring(); // whatever the locale
}

std::wstring SamplePath(const std::string& name) {
    return WidePath(fs::path(SAMPLES_FOLDER) / name);
}
