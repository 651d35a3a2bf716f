#pragma once

#include <windows.h>

#include <vector>

/// MFC's growable array of bytes.
class CByteArray {
public:
    INT_PTR GetSize() const { return static_cast<INT_PTR>(m_bytes.size()); }
    /// Gives the array `size` bytes; new ones are zero.
    void SetSize(INT_PTR size) { m_bytes.resize(static_cast<std::size_t>(size)); }
    BYTE* GetData() { return m_bytes.data(); }

private:
    std::vector<BYTE> m_bytes;
};
