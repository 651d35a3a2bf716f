#pragma once

#include <memory>

/// Held while a filter converts. A filter changes values of the user's registry for the length of
/// a print; where all processes of a user share that registry, only one of them holds a turn at a
/// time. Where each process has its own, all may.
class ConversionTurn {
public:
    /// Waits until it is this process's turn.
    ConversionTurn();

    /// Whether turns are taken on this system: then conversions do not overlap.
    static bool AreTaken();

private:
    std::shared_ptr<void> m_turn;
};
