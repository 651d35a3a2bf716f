#pragma once

#include <afxwin.h>

#include <utility>

/// Runs automation steps. The one place where what they throw is caught: a document that is
/// refused, a printer that is not there, an application that went away.
/// @param steps answers whether they succeeded
/// @return that answer, or false when an exception ended them
template <typename Steps>
bool RunAutomation(Steps&& steps) noexcept {
    try {
        return std::forward<Steps>(steps)();
    } catch (CException* exception) {
        exception->Delete();
    } catch (...) { // NOLINT(bugprone-empty-catch): false is the report
    }
    return false;
}

/// Tells an application to quit that failed half-way; it may be past listening.
template <typename Application>
void QuitAfterFailure(Application& application) noexcept {
    RunAutomation([&] {
        application.Quit();
        return true;
    });
}
