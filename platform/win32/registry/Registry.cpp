#include "platform/win32/registry/Registry.h"

#include "platform/win32/text/CaseFold.h"

#include <sstream>

namespace win32 {

Registry& Registry::Instance() {
    static Registry registry;
    return registry;
}

std::shared_ptr<RegistryKey> Registry::Root(HKEY handle) {
    if (handle == HKEY_CLASSES_ROOT) {
        std::vector<std::wstring> missing;
        const auto found = FollowPath(m_localMachine, L"SOFTWARE\\Classes", missing);
        return AddSubKeys(found, missing);
    }
    if (handle == HKEY_CURRENT_USER)
        return m_currentUser;
    if (handle == HKEY_LOCAL_MACHINE)
        return m_localMachine;
    return nullptr;
}

LSTATUS Registry::Resolve(HKEY handle, REGSAM access, std::shared_ptr<RegistryKey>& key) {
    key = Root(handle);
    if (key)
        return ERROR_SUCCESS;
    const std::shared_ptr<OpenedKey> opened = m_handles.Find(handle);
    if (!opened)
        return ERROR_INVALID_HANDLE;
    if (opened->key->deleted)
        return ERROR_KEY_DELETED;
    if ((opened->access & access) != access)
        return ERROR_ACCESS_DENIED;
    key = opened->key;
    return ERROR_SUCCESS;
}

HKEY Registry::Open(std::shared_ptr<RegistryKey> key, REGSAM access) {
    auto opened = std::make_shared<OpenedKey>(OpenedKey{std::move(key), access});
    return static_cast<HKEY>(m_handles.Add(std::move(opened)));
}

LSTATUS Registry::Close(HKEY handle) {
    const std::unique_lock lock = Lock();
    return Root(handle) || m_handles.Remove(handle) ? ERROR_SUCCESS : ERROR_INVALID_HANDLE;
}

std::shared_ptr<RegistryKey> FollowPath(std::shared_ptr<RegistryKey> start,
                                        const std::wstring& path,
                                        std::vector<std::wstring>& missing) {
    std::wistringstream names(path);
    for (std::wstring name; std::getline(names, name, L'\\');) {
        if (name.empty())
            continue;
        const auto found =
            missing.empty() ? start->subKeys.find(CaseFold(name)) : start->subKeys.end();
        if (found == start->subKeys.end())
            missing.push_back(name);
        else
            start = found->second;
    }
    return start;
}

std::shared_ptr<RegistryKey> AddSubKeys(std::shared_ptr<RegistryKey> parent,
                                        const std::vector<std::wstring>& names) {
    for (const std::wstring& name : names) {
        auto key = std::make_shared<RegistryKey>();
        parent->subKeys.emplace(CaseFold(name), key);
        parent = std::move(key);
    }
    return parent;
}

} // namespace win32
