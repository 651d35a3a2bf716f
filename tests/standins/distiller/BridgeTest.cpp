#include "tests/standins/distiller/BridgeTest.h"

#include "platform/win32/log/LogSink.h"
#include "tests/standins/Processes.h"

#include <windows.h>

#include <wx/strconv.h>
#include <wx/string.h>

#include <array>
#include <cstdint>
#include <cstdlib>
#include <cstring>

namespace fs = std::filesystem;

const char* const PictureProgram = R"(%!PS-Adobe-3.0
/Helvetica findfont 24 scalefont setfont 72 600 moveto (Words in a common font) show
gsave 72 100 translate 72 72 scale
/row 1800 string def
600 600 8 [600 0 0 -600 0 600] { 0 1 1799 { row exch rand 256 mod put } for row }
false 3 colorimage
grestore showpage
)";

namespace {

constexpr const wchar_t* SettingsKey = L"SOFTWARE\\Orvanta\\Distiller Stand-In";
constexpr const wchar_t* UserProfilesKey = L"SOFTWARE\\Adobe\\PDF Settings";

template <typename Function>
Function* Find(HMODULE module, const char* name) {
    return reinterpret_cast<Function*>(
        reinterpret_cast<void*>(module ? GetProcAddress(module, name) : nullptr));
}

std::vector<char> Utf16(const std::string& text) {
    const wxString wide = wxString::FromUTF8(text);
    const wxScopedCharBuffer bytes = wide.mb_str(wxMBConvUTF16LE());
    std::vector<char> units(bytes.data(), bytes.data() + bytes.length());
    units.insert(units.end(), 2, '\0');
    return units;
}

} // namespace

void BridgeTest::SetUp() {
    m_path = std::getenv("PATH");
    setenv("TMPDIR", m_temporary.Path().c_str(), 1);
    win32::SetLogSink([this](const std::string& record) { m_log.push_back(record); });
    ASSERT_EQ(S_OK, CallRegistration("DllRegisterServer"));
    if (std::system("gs --version > /dev/null") != 0) // NOLINT(concurrency-mt-unsafe)
        GTEST_SKIP() << "Ghostscript is not installed";
}

void BridgeTest::TearDown() {
    EXPECT_EQ("", Leftovers());
    setenv("PATH", m_path.c_str(), 1);
    unsetenv("TMPDIR");
    RegDeleteTreeW(HKEY_CURRENT_USER, SettingsKey);
    RegDeleteTreeW(HKEY_CURRENT_USER, UserProfilesKey);
    win32::SetLogSink(nullptr);
}

int BridgeTest::Convert(const fs::path& postScript, const fs::path& pdf,
                        const std::string& profile) {
    const auto psPath = Utf16(postScript);
    const auto pdfPath = Utf16(pdf);
    const auto profileName = Utf16(profile);
    // By its offsets, as another's program fills it.
    std::array<std::uint64_t, 5> record{};
    record[0] = reinterpret_cast<std::uintptr_t>(psPath.data());
    record[1] = reinterpret_cast<std::uintptr_t>(pdfPath.data());
    record[2] = reinterpret_cast<std::uintptr_t>(profileName.data());
    return Call(record.data());
}

int BridgeTest::Call(const void* record) {
    const HMODULE module = LoadLibraryW(wxString::FromUTF8(BRIDGE).wc_str());
    auto* const convert = Find<std::int32_t(const void*)>(module, "DIST_convertFile");
    EXPECT_TRUE(convert);
    const int result = convert ? convert(record) : -1;
    FreeLibrary(module);
    return result;
}

std::string BridgeTest::Failure(const std::string& program, const std::string& profile) {
    const fs::path postScript = m_files.Write("failing.ps", program);
    const std::set<std::string> names = Names();
    m_log.clear();
    EXPECT_NE(0, Convert(postScript, m_files / "failed.pdf", profile)) << program;
    EXPECT_EQ(names, Names()) << program;
    EXPECT_EQ("", Leftovers()) << program;
    EXPECT_EQ(1U, m_log.size()) << program;
    const std::string start =
        postScript.string() + " cannot be converted to " + (m_files / "failed.pdf").string() + ": ";
    const std::string record = m_log.empty() ? std::string() : m_log[0];
    EXPECT_EQ(0U, record.rfind(start, 0)) << record;
    return record.substr(std::min(record.size(), start.size()));
}

void BridgeTest::SetLimit(const wchar_t* name, unsigned seconds) {
    HKEY key = nullptr;
    const DWORD value = seconds;
    ASSERT_EQ(ERROR_SUCCESS,
              RegCreateKeyExW(HKEY_CURRENT_USER, SettingsKey, 0, nullptr, REG_OPTION_NON_VOLATILE,
                              KEY_WRITE, nullptr, &key, nullptr));
    RegSetValueExW(key, name, 0, REG_DWORD, reinterpret_cast<const BYTE*>(&value), sizeof value);
    RegCloseKey(key);
}

std::string BridgeTest::Leftovers() const {
    return LeftoversOf(m_temporary.Path(), m_files.Path());
}

std::set<std::string> BridgeTest::Names() const {
    std::set<std::string> names;
    for (const fs::directory_entry& entry : fs::recursive_directory_iterator(m_files.Path()))
        names.insert(fs::relative(entry.path(), m_files.Path()));
    return names;
}

long CallRegistration(const char* name) {
    const HMODULE module = LoadLibraryW(wxString::FromUTF8(DISTILLER_MODULE).wc_str());
    auto* const function = Find<HRESULT STDMETHODCALLTYPE()>(module, name);
    EXPECT_TRUE(function) << name;
    const HRESULT result = function ? function() : E_FAIL;
    FreeLibrary(module);
    return result;
}
