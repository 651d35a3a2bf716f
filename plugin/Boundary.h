#pragma once

#include "common/CatchAll.h"

/// Runs the body of an operation that the host calls. No exception may cross the module's boundary:
/// one that comes up (memory running out, in the end) becomes `fallback`.
template <typename Answer, typename Body>
Answer AtBoundary(Answer fallback, Body&& body) noexcept {
    return CatchAll(fallback, std::forward<Body>(body));
}

/// The same for an operation without an answer.
template <typename Body>
void AtBoundary(Body&& body) noexcept {
    AtBoundary(0, [&] {
        std::forward<Body>(body)();
        return 0;
    });
}
