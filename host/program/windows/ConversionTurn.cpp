#include "host/program/system/ConversionTurn.h"

#include <windows.h>

#include <wx/utils.h>

namespace {

void EndTurn(HANDLE mutex) {
    if (!mutex)
        return;
    ReleaseMutex(mutex);
    CloseHandle(mutex);
}

} // namespace

ConversionTurn::ConversionTurn() {
    // Not of the session alone: a user's sessions have one registry too.
    const wxString name = "Global\\Quillon conversion of " + wxGetUserId();
    HANDLE mutex = CreateMutexW(nullptr, FALSE, name.wc_str());
    if (mutex)
        WaitForSingleObject(mutex, INFINITE); // one that was left behind is ours too
    m_turn.reset(mutex, EndTurn);
}

bool ConversionTurn::AreTaken() {
    return true;
}
