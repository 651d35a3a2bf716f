#pragma once

#include "platform/win32/base/HandleTable.h"

#include <windows.h>

#include <map>
#include <memory>
#include <mutex>
#include <string>
#include <vector>

namespace win32 {

struct RegistryValue {
    DWORD type;
    std::vector<BYTE> data;
};

struct RegistryKey {
    std::map<std::wstring, std::shared_ptr<RegistryKey>> subKeys; ///< by case-folded name
    std::map<std::wstring, RegistryValue> values;                 ///< by case-folded name
    bool deleted = false; ///< gone from the tree, while handles to it are still open
};

/// What an HKEY stands for: a key, and what may be done with it.
struct OpenedKey {
    std::shared_ptr<RegistryKey> key;
    REGSAM access;
};

/// The registry of this process. Lock it for the length of one function of the API.
class Registry {
public:
    static Registry& Instance();

    [[nodiscard]] std::unique_lock<std::mutex> Lock() { return std::unique_lock(m_mutex); }

    /// @param handle an open key or one of the root keys
    /// @param access the rights that the caller's work needs the handle to have
    /// @param key receives the key
    LSTATUS Resolve(HKEY handle, REGSAM access, std::shared_ptr<RegistryKey>& key);

    HKEY Open(std::shared_ptr<RegistryKey> key, REGSAM access);
    /// Takes the lock itself.
    LSTATUS Close(HKEY handle);

private:
    Registry() = default;
    std::shared_ptr<RegistryKey> Root(HKEY handle);

    std::mutex m_mutex;
    std::shared_ptr<RegistryKey> m_currentUser = std::make_shared<RegistryKey>();
    std::shared_ptr<RegistryKey> m_localMachine = std::make_shared<RegistryKey>();
    HandleTable<OpenedKey> m_handles;
};

/// Follows `path` from `start` as far as there are keys for it.
/// @param path names with backslashes between them
/// @param missing receives the names that have no key; none when the whole path is there
/// @return the last key that was found
std::shared_ptr<RegistryKey> FollowPath(std::shared_ptr<RegistryKey> start,
                                        const std::wstring& path,
                                        std::vector<std::wstring>& missing);

/// Makes the keys `names` one below the other, the first below `parent`.
/// @return the last
std::shared_ptr<RegistryKey> AddSubKeys(std::shared_ptr<RegistryKey> parent,
                                        const std::vector<std::wstring>& names);

} // namespace win32
