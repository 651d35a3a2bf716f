#pragma once

/// Initialises MFC for the process and COM, single-threaded, for the calling thread, which must not
/// be in COM's multithreaded apartment. When MFC refuses, says so on standard output and leaves COM
/// alone. Throws nothing.
/// @return whether COM was initialised, so that CoUninitialize is owed
bool InitializeMfcAndCom();

/// What every operation stands in that touches COM or an Office application: MFC and COM are there
/// from the construction to the destruction, on the constructing thread.
///
/// Declare it before anything that holds a COM object.
class AutomationScope {
public:
    AutomationScope();
    ~AutomationScope();
    AutomationScope(const AutomationScope&) = delete;
    AutomationScope& operator=(const AutomationScope&) = delete;

    /// False when MFC could not be initialised; automation calls then fail.
    bool IsComInitialised() const { return m_comInitialised; }

private:
    bool m_comInitialised;
};
