#include <windows.h>

#include <wx/log.h>
#include <wx/msw/registry.h>
#include <wx/utils.h>

#include <gtest/gtest.h>

namespace {

class WxRegKey : public testing::Test {
protected:
    ~WxRegKey() override { RegDeleteTreeW(HKEY_CURRENT_USER, L"Software\\QuillonWxTest"); }

    wxLogNull m_quiet; // a key that is missing is nothing to tell people about
    wxRegKey m_key{wxRegKey::HKCU, "Software\\QuillonWxTest"};
};

TEST_F(WxRegKey, IsFoundByLongAndShortNames) {
    EXPECT_FALSE(m_key.Exists());
    EXPECT_FALSE(m_key.Open(wxRegKey::Read));
    ASSERT_TRUE(m_key.Create());
    EXPECT_TRUE(wxRegKey("HKEY_CURRENT_USER\\Software\\QuillonWxTest").Exists());
    EXPECT_TRUE(wxRegKey("HKCU\\software\\QUILLONWXTEST").Exists());
    EXPECT_FALSE(wxRegKey(wxRegKey::HKCU, "Software\\QuillonWxTest").Create(false));
}

TEST_F(WxRegKey, KeepsTextsAndNumbers) {
    ASSERT_TRUE(m_key.Create());
    for (const wxString& text : {wxString(), wxString("plain"), wxString(L"Größe €"),
                                 wxString::FromUTF8("\xF0\x9F\x96\xA8 printer")}) {
        ASSERT_TRUE(m_key.SetValue("text", text));
        wxString value("before");
        ASSERT_TRUE(m_key.QueryValue("text", value));
        EXPECT_EQ(text, value);
    }
    long number = 0;
    EXPECT_FALSE(m_key.HasValue("number"));
    ASSERT_TRUE(m_key.SetValue("number", 1200L));
    ASSERT_TRUE(m_key.QueryValue("number", &number));
    EXPECT_EQ(1200, number);
    EXPECT_TRUE(m_key.DeleteValue("number"));
    EXPECT_FALSE(m_key.HasValue("number"));
}

TEST_F(WxRegKey, ReadsTheDefaultValueByAnEmptyName) {
    ASSERT_TRUE(m_key.Create());
    ASSERT_TRUE(m_key.SetValue("", wxString("Word.Application.16")));
    wxString value;
    const wxRegKey other(wxRegKey::HKCU, "Software\\QuillonWxTest");
    ASSERT_TRUE(other.QueryValue("", value)); // opens itself
    EXPECT_EQ("Word.Application.16", value);
}

TEST_F(WxRegKey, PutsVariablesIntoExpandableTexts) {
    ASSERT_TRUE(m_key.Create());
    ASSERT_TRUE(wxSetEnv("QUILLON_TEST", "here"));
    HKEY key = nullptr;
    ASSERT_EQ(ERROR_SUCCESS,
              RegOpenKeyExW(HKEY_CURRENT_USER, L"Software\\QuillonWxTest", 0, KEY_SET_VALUE, &key));
    const char text[] = "%QUILLON_TEST%\\a$HOME 100%";
    std::vector<BYTE> bytes;
    for (const char letter : text)
        bytes.insert(bytes.end(), {static_cast<BYTE>(letter), 0});
    EXPECT_EQ(ERROR_SUCCESS, RegSetValueExW(key, L"x", 0, REG_EXPAND_SZ, bytes.data(),
                                            static_cast<DWORD>(bytes.size())));
    RegCloseKey(key);
    wxString value;
    ASSERT_TRUE(m_key.QueryValue("x", value));
    EXPECT_EQ("here\\a$HOME 100%", value);
    ASSERT_TRUE(m_key.QueryValue("x", value, true));
    EXPECT_EQ("%QUILLON_TEST%\\a$HOME 100%", value);
    wxUnsetEnv("QUILLON_TEST");
}

TEST_F(WxRegKey, DeletesItselfWithItsSubKeys) {
    ASSERT_TRUE(m_key.Create());
    ASSERT_TRUE(wxRegKey(wxRegKey::HKCU, "Software\\QuillonWxTest\\Sub").Create());
    EXPECT_TRUE(m_key.DeleteSelf());
    EXPECT_FALSE(wxRegKey("HKCU\\Software\\QuillonWxTest\\Sub").Exists());
}

} // namespace
