#include "tests/standins/OfficeClient.h"
#include "tests/standins/OfficeTest.h"
#include "tests/standins/StandInModule.h"

#include <ole2.h>
#include <windows.h>

#include <gmock/gmock.h>

#include <cstdlib>

namespace fs = std::filesystem;

namespace {

/// A text of the registry; "(none)" where there is no such value.
std::string Text(HKEY root, const std::wstring& path, const wchar_t* name = nullptr) {
    HKEY key = nullptr;
    if (RegOpenKeyExW(root, path.c_str(), 0, KEY_READ, &key) != ERROR_SUCCESS)
        return "(none)";
    DWORD type = REG_NONE;
    std::vector<BYTE> bytes(2000);
    DWORD size = static_cast<DWORD>(bytes.size());
    const LSTATUS found = RegQueryValueExW(key, name, nullptr, &type, bytes.data(), &size);
    RegCloseKey(key);
    if (found != ERROR_SUCCESS || type != REG_SZ || size < 2)
        return "(none)";
    EXPECT_EQ(0, bytes[size - 1] | bytes[size - 2]) << "no terminating zero";
    std::string text;
    for (DWORD i = 0; i + 2 < size; i += 2)
        text += static_cast<char>(bytes[i]); // they are all ASCII
    return text;
}

std::string Default(const std::wstring& path) {
    return Text(HKEY_CLASSES_ROOT, path);
}

constexpr const wchar_t* StandIns = L"SOFTWARE\\Orvanta\\Office Stand-Ins";

class RegistrationTest : public OfficeTest {
protected:
    void TearDown() override {
        setenv("PATH", m_path.c_str(), 1);
        EXPECT_EQ(S_OK, StandInModule::Instance().Register());
        OfficeTest::TearDown();
    }

    /// A LibreOffice with the given files in its program folder, and nothing else, on the PATH.
    void Install(const std::vector<std::string>& files) {
        const fs::path program = m_files / "office/program";
        fs::create_directories(program);
        for (const std::string& file : files) {
            m_files.Write("office/program/" + file, "");
            fs::permissions(program / file, fs::perms::owner_all);
        }
        if (fs::create_directory(m_files / "bin"))
            fs::create_symlink(program / "soffice", m_files / "bin/soffice");
        setenv("PATH", (m_files / "bin").c_str(), 1);
    }

    std::string m_path = std::getenv("PATH");
};

} // namespace

TEST_F(RegistrationTest, EntersEveryApplicationThatLibreOfficeServes) {
    NEEDS_LIBREOFFICE();
    for (const std::wstring application : {L"Word", L"Excel", L"PowerPoint", L"Publisher"}) {
        const std::wstring progId = application + L".Application";
        EXPECT_NE("(none)", Default(progId));
        EXPECT_EQ(std::string(progId.begin(), progId.end()) + ".16", Default(progId + L"\\CurVer"));
        const std::string clsid = Default(progId + L"\\CLSID");
        EXPECT_EQ(clsid, Default(progId + L".16\\CLSID"));
        const std::wstring server =
            L"CLSID\\" + std::wstring(clsid.begin(), clsid.end()) + L"\\InprocServer32";
        EXPECT_EQ(fs::path(STANDINS_FOLDER) / "office.so", Default(server));
        EXPECT_EQ("Apartment", Text(HKEY_CLASSES_ROOT, server, L"ThreadingModel"));
    }
}

TEST_F(RegistrationTest, TellsWhichEngineThereIs) {
    NEEDS_LIBREOFFICE();
    EXPECT_THAT(Text(HKEY_LOCAL_MACHINE, StandIns, L"Engine"),
                testing::MatchesRegex("LibreOffice [0-9]+[.][0-9.]+"));
    EXPECT_TRUE(fs::exists(Text(HKEY_LOCAL_MACHINE, StandIns, L"EnginePath") + "/soffice.bin"));
}

TEST_F(RegistrationTest, WithoutAPathLibreOfficeIsFoundInTheUsualFolders) {
    NEEDS_LIBREOFFICE();
    unsetenv("PATH");
    EXPECT_EQ(S_OK, StandInModule::Instance().Register());
    EXPECT_NE("(none)", Default(L"Word.Application"));
}

TEST_F(RegistrationTest, WithoutLibreOfficeNothingIsEntered) {
    setenv("PATH", m_files.Path().c_str(), 1);
    EXPECT_EQ(S_OK, StandInModule::Instance().Register());
    for (const wchar_t* progId : {L"Word.Application", L"Word.Application.16"})
        EXPECT_EQ("(none)", Default(progId)); // nor left from the registration before
    EXPECT_EQ("(none)", Text(HKEY_LOCAL_MACHINE, StandIns, L"Engine"));
    COleDispatchDriver word;
    EXPECT_FALSE(word.CreateDispatch(L"Word.Application"));
}

TEST_F(RegistrationTest, EntersOnlyWhatTheInstalledPartsServe) {
    Install({"soffice", "soffice.bin", "libsclo.so"});
    EXPECT_EQ(S_OK, StandInModule::Instance().Register());
    EXPECT_EQ("(none)", Default(L"Word.Application"));
    EXPECT_NE("(none)", Default(L"Excel.Application"));
    EXPECT_EQ("(none)", Default(L"PowerPoint.Application"));
    Install({"libsdlo.so"});
    EXPECT_EQ(S_OK, StandInModule::Instance().Register());
    EXPECT_NE("(none)", Default(L"PowerPoint.Application"));
    EXPECT_EQ("(none)", Default(L"Publisher.Application")); // Draw alone reads no publications
    EXPECT_EQ("LibreOffice", Text(HKEY_LOCAL_MACHINE, StandIns, L"Engine")); // of no known version
}

TEST_F(RegistrationTest, AScriptNamedSofficeIsNoLibreOffice) {
    Install({"soffice"});
    EXPECT_EQ(S_OK, StandInModule::Instance().Register());
    EXPECT_EQ("(none)", Default(L"Word.Application"));
}

TEST_F(RegistrationTest, EntriesOfOthersStayWhenOursGo) {
    ASSERT_EQ(S_OK, StandInModule::Instance().Unregister());
    HKEY key = nullptr;
    ASSERT_EQ(ERROR_SUCCESS,
              RegCreateKeyExW(HKEY_CLASSES_ROOT, L"Word.Application\\CLSID", 0, nullptr,
                              REG_OPTION_NON_VOLATILE, KEY_WRITE, nullptr, &key, nullptr));
    RegCloseKey(key);
    EXPECT_EQ(S_OK, StandInModule::Instance().Unregister());
    EXPECT_EQ(ERROR_SUCCESS,
              RegOpenKeyExW(HKEY_CLASSES_ROOT, L"Word.Application\\CLSID", 0, KEY_READ, &key));
    RegCloseKey(key);
    RegDeleteTreeW(HKEY_CLASSES_ROOT, L"Word.Application");
}
