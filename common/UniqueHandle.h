#pragma once

#include <windows.h>

#include <utility>

/// Owns one handle of the kind that `Traits` describes: its type, the value that means none, and
/// how it is closed.
template <typename Traits>
class UniqueHandle {
public:
    using Type = typename Traits::Type;

    UniqueHandle() = default;
    explicit UniqueHandle(Type handle) : m_handle(handle) {}
    UniqueHandle(UniqueHandle&& other) noexcept
        : m_handle(std::exchange(other.m_handle, Traits::None())) {}
    UniqueHandle& operator=(UniqueHandle&& other) noexcept {
        if (this != &other) {
            Reset();
            m_handle = std::exchange(other.m_handle, Traits::None());
        }
        return *this;
    }
    ~UniqueHandle() { Reset(); }

    explicit operator bool() const { return m_handle != Traits::None(); }
    Type Get() const { return m_handle; }

    /// Closes what is held and answers where a call may store a new handle.
    Type* Receive() {
        Reset();
        return &m_handle;
    }

    void Reset() {
        if (m_handle != Traits::None())
            Traits::Close(m_handle);
        m_handle = Traits::None();
    }

private:
    Type m_handle = Traits::None();
};

struct FileTraits {
    using Type = HANDLE;
    static Type None() { return INVALID_HANDLE_VALUE; }
    static void Close(Type handle) { CloseHandle(handle); }
};

struct RegistryKeyTraits {
    using Type = HKEY;
    static Type None() { return nullptr; }
    static void Close(Type key) { RegCloseKey(key); }
};

using FileHandle = UniqueHandle<FileTraits>;
using RegistryKeyHandle = UniqueHandle<RegistryKeyTraits>;
