#include <windows.h>

#include <wx/log.h>
#include <wx/msw/registry.h>
#include <wx/utils.h>

#include <gtest/gtest.h>

#include <string>

namespace {

class WxRegKey : public testing::Test {
protected:
    ~WxRegKey() override { m_key.DeleteSelf(); }

    wxLogNull m_quiet; // a key that is missing is nothing to tell people about
    wxRegKey m_key{wxRegKey::HKCU, "Software\\QuillonWxTest"};
};

TEST_F(WxRegKey, IsFoundByItsNames) {
    EXPECT_FALSE(m_key.Exists());
    EXPECT_FALSE(m_key.HasValue(""));
    ASSERT_TRUE(m_key.Create());
    EXPECT_TRUE(wxRegKey("HKEY_CURRENT_USER\\Software\\QuillonWxTest").Exists());
    EXPECT_TRUE(wxRegKey(wxRegKey::HKCU, "software\\QUILLONWXTEST").Exists());
    ASSERT_TRUE(wxRegKey(wxRegKey::HKCU, "Software\\QuillonWxTest\\Sub").Create());
    EXPECT_TRUE(m_key.DeleteSelf());
    EXPECT_FALSE(wxRegKey(wxRegKey::HKCU, "Software\\QuillonWxTest\\Sub").Exists());
}

TEST_F(WxRegKey, KeepsTextsAsTheyAre) {
    ASSERT_TRUE(m_key.Create());
    const wxRegKey reader(wxRegKey::HKCU, "Software\\QuillonWxTest"); // opens itself
    for (const wxString& text : {wxString(), wxString("plain"), wxString(L"Größe €"),
                                 wxString::FromUTF8("\xF0\x9F\x96\xA8 printer")}) {
        ASSERT_TRUE(m_key.SetValue("", text)); // the default value
        wxString value("before");
        ASSERT_TRUE(reader.QueryValue("", value));
        EXPECT_EQ(text, value);
    }
    for (int time = 0; time < 2; ++time) {
        EXPECT_TRUE(m_key.DeleteValue(""));
        wxString value;
        EXPECT_FALSE(reader.QueryValue("", value));
    }
}

TEST_F(WxRegKey, PutsVariablesIntoExpandableTexts) {
    ASSERT_TRUE(m_key.Create());
    HKEY key = nullptr;
    ASSERT_EQ(ERROR_SUCCESS,
              RegOpenKeyExW(HKEY_CURRENT_USER, L"Software\\QuillonWxTest", 0, KEY_SET_VALUE, &key));
    std::string bytes;
    for (const char letter : "%QUILLON_TEST%\\a$HOME 100%")
        bytes.append({letter, '\0'});
    EXPECT_EQ(ERROR_SUCCESS, RegSetValueExW(key, L"x", 0, REG_EXPAND_SZ,
                                            reinterpret_cast<const BYTE*>(bytes.data()),
                                            static_cast<DWORD>(bytes.size())));
    RegCloseKey(key);
    ASSERT_TRUE(wxSetEnv("QUILLON_TEST", "here"));
    wxString value;
    ASSERT_TRUE(m_key.QueryValue("x", value));
    EXPECT_EQ("here\\a$HOME 100%", value);
    wxUnsetEnv("QUILLON_TEST");
}

} // namespace
