#pragma once

// Handles are numbers that are given out once and never again, so that a handle which was closed,
// or never was one, is always told from a good one.

#include <windef.h>

#include <atomic>
#include <map>
#include <memory>
#include <mutex>

namespace win32 {

/// A value that no handle of the process had before; neither null nor one of Windows' fixed values.
inline ULONG_PTR NextHandleValue() {
    static std::atomic<ULONG_PTR> next{ULONG_PTR{1} << 32}; // above the registry's root keys
    return next.fetch_add(4);
}

/// The open handles of one kind and what they stand for. Safe to use from several threads; an
/// object that one thread still works with outlives its handle.
template <typename Object>
class HandleTable {
public:
    void* Add(std::shared_ptr<Object> object) {
        const std::lock_guard lock(m_mutex);
        const ULONG_PTR value = NextHandleValue();
        m_objects.emplace(value, std::move(object));
        return reinterpret_cast<void*>(value); // NOLINT(performance-no-int-to-ptr)
    }

    /// @return null when the handle is not open
    std::shared_ptr<Object> Find(const void* handle) const {
        const std::lock_guard lock(m_mutex);
        const auto found = m_objects.find(reinterpret_cast<ULONG_PTR>(handle));
        return found == m_objects.end() ? nullptr : found->second;
    }

    /// Closes the handle.
    /// @return what it stood for; null when it is not open
    std::shared_ptr<Object> Remove(const void* handle) {
        const std::lock_guard lock(m_mutex);
        const auto found = m_objects.find(reinterpret_cast<ULONG_PTR>(handle));
        if (found == m_objects.end())
            return nullptr;
        std::shared_ptr<Object> object = std::move(found->second);
        m_objects.erase(found);
        return object;
    }

private:
    mutable std::mutex m_mutex;
    std::map<ULONG_PTR, std::shared_ptr<Object>> m_objects;
};

} // namespace win32
