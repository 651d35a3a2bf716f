#pragma once

#include "standins/office/server/ModuleUse.h"

#include <memory>
#include <string>
#include <utility>

namespace standins {

/// What the objects of one running application share.
struct Session {
    Session(const wchar_t* applicationName, std::wstring startPrinter)
        : name(applicationName), printer(std::move(startPrinter)) {}

    const wchar_t* name;   ///< "Word"; the source of the errors that it raises
    bool isRunning = true; ///< until it is told to quit
    std::wstring printer;  ///< the active printer
    ModuleUse use{};
};

using SharedSession = std::shared_ptr<Session>;

} // namespace standins
