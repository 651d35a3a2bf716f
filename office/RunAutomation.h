#pragma once

#include "common/CatchAll.h"

/// Runs automation steps and catches what they throw: a document that is refused, a printer that is
/// not there, an application that went away.
/// @param onException what is answered then; otherwise it is what the steps answer
template <typename Answer, typename Steps>
Answer RunAutomation(Answer onException, Steps&& steps) noexcept {
    return CatchAll(onException, std::forward<Steps>(steps));
}

/// Tells an application to quit that failed half-way; it may be past listening, or not have come
/// up at all.
template <typename Application>
void QuitAfterFailure(Application& application) noexcept {
    RunAutomation(false, [&] {
        application.Quit();
        return true;
    });
}
