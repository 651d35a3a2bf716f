#include "tests/support/RegistryText.h"

#include <wx/strconv.h>
#include <wx/string.h>

#include <gtest/gtest.h>

void WriteRegistryText(HKEY root, const std::wstring& path, const std::wstring& name,
                       const std::wstring& text, DWORD type) {
    HKEY key = nullptr;
    ASSERT_EQ(ERROR_SUCCESS,
              RegCreateKeyExW(root, path.c_str(), 0, nullptr, REG_OPTION_NON_VOLATILE,
                              KEY_READ | KEY_WRITE, nullptr, &key, nullptr));
    const wxString source(text); // the buffer below points into it
    const wxScopedCharBuffer utf16 = source.mb_str(wxMBConvUTF16LE());
    std::string bytes(utf16.data(), utf16.length());
    bytes.append(2, '\0');
    EXPECT_EQ(ERROR_SUCCESS, RegSetValueExW(key, name.c_str(), 0, type,
                                            reinterpret_cast<const BYTE*>(bytes.data()),
                                            static_cast<DWORD>(bytes.size())));
    RegCloseKey(key);
}
