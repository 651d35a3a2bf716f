#pragma once

#include <afxwin.h>

#include <utility>

/// Runs `body` and answers what it answers, or `fallback` where it throws: what MFC throws, by
/// pointer, and whatever else there is.
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
