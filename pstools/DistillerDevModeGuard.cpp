#include "pstools/DistillerDevModeGuard.h"

#include "common/UniqueHandle.h"
#include "pstools/DistillerDevMode.h"

namespace {

constexpr wchar_t PreferencesKey[] = L"Printers\\DevModePerUser";
constexpr wchar_t PrinterValue[] = L"Acrobat Distiller";

} // namespace

DistillerDevModeGuard::DistillerDevModeGuard() {
    RegistryKeyHandle key;
    m_armed =
        RegCreateKeyExW(HKEY_CURRENT_USER, PreferencesKey, 0, nullptr, REG_OPTION_NON_VOLATILE,
                        KEY_READ | KEY_WRITE, nullptr, key.Receive(), nullptr) == ERROR_SUCCESS;
    if (!m_armed)
        return;
    Save(key.Get());
    RegSetValueExW(key.Get(), PrinterValue, 0, REG_BINARY, DistillerDevMode.data(),
                   static_cast<DWORD>(DistillerDevMode.size()));
}

/// Keeps the value as it is, of whatever type and size: other drivers have other records.
void DistillerDevModeGuard::Save(HKEY key) {
    DWORD size = 0;
    if (RegQueryValueExW(key, PrinterValue, nullptr, nullptr, nullptr, &size) != ERROR_SUCCESS)
        return;
    m_saved.SetSize(static_cast<INT_PTR>(size));
    m_hadValue = RegQueryValueExW(key, PrinterValue, nullptr, &m_savedType, m_saved.GetData(),
                                  &size) == ERROR_SUCCESS;
}

DistillerDevModeGuard::~DistillerDevModeGuard() {
    RegistryKeyHandle key;
    if (!m_armed || RegOpenKeyExW(HKEY_CURRENT_USER, PreferencesKey, 0, KEY_READ | KEY_WRITE,
                                  key.Receive()) != ERROR_SUCCESS)
        return;
    if (m_hadValue)
        RegSetValueExW(key.Get(), PrinterValue, 0, m_savedType, m_saved.GetData(),
                       static_cast<DWORD>(m_saved.GetSize()));
    else
        RegDeleteValueW(key.Get(), PrinterValue);
}
