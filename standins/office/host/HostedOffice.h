#pragma once

#include <com/sun/star/uno/XComponentContext.hpp>
#include <functional>
#include <string>

namespace standins {

/// LibreOffice in this process, fully started. It behaves as when it is started from a command
/// line, so that its pages are the same: what its interface for other programs would change is
/// undone.
class HostedOffice {
public:
    /// Starts it, in the current folder: there its profile lies, and its temporary files go there,
    /// for a child in the child's current folder.
    /// @param program LibreOffice's program folder
    /// @param serve called when it is ready, in LibreOffice's own loop; must not return
    /// @return why it cannot be had, when serve has not been called
    static std::string Run(const std::string& program, const std::function<void()>& serve);

    /// Where its services are had from. For serve alone.
    static css::uno::Reference<css::uno::XComponentContext> Context();
};

} // namespace standins
