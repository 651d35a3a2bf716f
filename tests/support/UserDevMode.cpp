#include "tests/support/UserDevMode.h"

#include "common/UniqueHandle.h"

#include <gtest/gtest.h>

namespace {

constexpr wchar_t Key[] = L"Printers\\DevModePerUser";
constexpr wchar_t Value[] = L"Acrobat Distiller";

RegistryKeyHandle OpenKey() {
    RegistryKeyHandle key;
    RegCreateKeyExW(HKEY_CURRENT_USER, Key, 0, nullptr, REG_OPTION_NON_VOLATILE,
                    KEY_READ | KEY_WRITE, nullptr, key.Receive(), nullptr);
    EXPECT_TRUE(key);
    return key;
}

} // namespace

UserDevMode::UserDevMode() {
    RegDeleteValueW(OpenKey().Get(), Value);
}

UserDevMode::~UserDevMode() {
    RegDeleteValueW(OpenKey().Get(), Value);
}

void UserDevMode::Set(DWORD type, const std::vector<BYTE>& bytes) {
    EXPECT_EQ(ERROR_SUCCESS, RegSetValueExW(OpenKey().Get(), Value, 0, type, bytes.data(),
                                            static_cast<DWORD>(bytes.size())));
}

bool UserDevMode::Exists() const {
    return RegQueryValueExW(OpenKey().Get(), Value, nullptr, nullptr, nullptr, nullptr) ==
           ERROR_SUCCESS;
}

DWORD UserDevMode::Type() const {
    DWORD type = REG_NONE;
    RegQueryValueExW(OpenKey().Get(), Value, nullptr, &type, nullptr, nullptr);
    return type;
}

std::vector<BYTE> UserDevMode::Bytes() const {
    DWORD size = 0;
    RegQueryValueExW(OpenKey().Get(), Value, nullptr, nullptr, nullptr, &size);
    std::vector<BYTE> bytes(size);
    RegQueryValueExW(OpenKey().Get(), Value, nullptr, nullptr, bytes.data(), &size);
    return bytes;
}
