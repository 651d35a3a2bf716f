#pragma once

#include <unistd.h>

#include <utility>

namespace standins {

/// A file descriptor that closes itself.
class Descriptor {
public:
    Descriptor() = default;
    explicit Descriptor(int descriptor) : m_descriptor(descriptor) {}
    Descriptor(Descriptor&& other) noexcept : m_descriptor(other.Release()) {}
    Descriptor& operator=(Descriptor&& other) noexcept {
        Close();
        m_descriptor = other.Release();
        return *this;
    }
    ~Descriptor() { Close(); }

    bool IsOpen() const { return m_descriptor >= 0; }
    int Get() const { return m_descriptor; }
    /// Hands the descriptor over to the caller, who closes it.
    int Release() { return std::exchange(m_descriptor, -1); }
    void Close() {
        if (IsOpen())
            close(Release());
    }

private:
    int m_descriptor = -1;
};

} // namespace standins
