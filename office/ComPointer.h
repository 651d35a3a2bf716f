#pragma once

#include <objbase.h>

/// Owns one reference to a COM object.
template <typename Interface>
class ComPointer {
public:
    ComPointer() = default;
    ComPointer(const ComPointer&) = delete;
    ComPointer& operator=(const ComPointer&) = delete;
    ~ComPointer() { Reset(); }

    Interface* operator->() const { return m_object; }
    explicit operator bool() const { return m_object != nullptr; }

    /// Releases what is held and answers where a call may store a reference.
    Interface** Receive() {
        Reset();
        return &m_object;
    }

    void Reset() {
        if (m_object)
            m_object->Release();
        m_object = nullptr;
    }

private:
    Interface* m_object = nullptr;
};
