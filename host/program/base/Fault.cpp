#include "host/program/base/Fault.h"

#include <wx/intl.h>

wxString Fault::Text() const {
    return advice.empty() ? what : wxString::Format(_("%s. %s"), what, advice);
}

ExitCode ExitCodeFor(const Fault& fault) {
    switch (fault.blame) {
    case Blame::Document:
        return ExitCode::DocumentsAtFault;
    case Blame::Machine:
    case Blame::Outside:
        return ExitCode::MachineAtFault;
    case Blame::Usage:
        break;
    }
    return ExitCode::WrongUsage;
}
