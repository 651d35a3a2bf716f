#pragma once

#include "standins/shared/Descriptor.h"

#include <cstdint>

/// A server on this machine that answers nobody.
class LoopbackListener {
public:
    LoopbackListener();

    std::uint16_t Port() const { return m_port; }
    /// Whether somebody has come.
    bool HasVisitor() const;

private:
    standins::Descriptor m_socket;
    std::uint16_t m_port = 0;
};
