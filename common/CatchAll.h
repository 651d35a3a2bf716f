#pragma once

#include <afxwin.h>

#include <utility>

/// Runs `body` and catches what it throws: what MFC throws, by pointer, and whatever else there is.
/// Here ends what an operation of the host's meets (no exception may cross the module's boundary:
/// memory runs out, in the end) and what automation meets: a document that is refused, a printer
/// that is not there, an application that went away.
/// @param fallback what is answered then; otherwise it is what the body answers
template <typename Answer, typename Body>
Answer CatchAll(Answer fallback, Body&& body) noexcept {
    try {
        return std::forward<Body>(body)();
    } catch (CException* exception) {
        exception->Delete();
    } catch (...) { // NOLINT(bugprone-empty-catch): the fallback is the report
    }
    return fallback;
}

/// The same for a body without an answer.
template <typename Body>
void CatchAll(Body&& body) noexcept {
    CatchAll(0, [&] {
        std::forward<Body>(body)();
        return 0;
    });
}
