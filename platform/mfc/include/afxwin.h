#pragma once

// MFC's start-up, module state and exceptions: what the filter uses of them.

#include <afxcoll.h>
#include <windows.h>

#include <string>

/// MFC's text class, as far as an exception's texts need it.
class CString {
public:
    CString() = default;
    CString(LPCWSTR text) : m_text(text ? text : L"") {} // NOLINT(google-explicit-constructor)
    operator LPCWSTR() const { return m_text.c_str(); }  // NOLINT(google-explicit-constructor)

private:
    std::wstring m_text;
};

/// The base of what MFC throws: always by pointer, and the catcher calls Delete().
class CException {
public:
    CException() = default;
    CException(const CException&) = delete;
    CException& operator=(const CException&) = delete;
    virtual ~CException() = default;

    void Delete();
};

class CMemoryException : public CException {};

/// Throws a CMemoryException.
[[noreturn]] void AfxThrowMemoryException();

/// What MFC keeps per module: here only its identity.
class AFX_MODULE_STATE {};

/// The state of the module whose code runs on this thread; the host's unless it was switched.
AFX_MODULE_STATE* AfxGetModuleState();

#ifdef __ELF__
#    define AFX_PER_MODULE __attribute__((visibility("hidden")))
#else
#    define AFX_PER_MODULE
#endif

/// The state of the module that the caller is linked into.
AFX_PER_MODULE inline AFX_MODULE_STATE* AfxGetStaticModuleState() {
    static AFX_MODULE_STATE state;
    return &state;
}

/// Switches MFC's module state for the life of the object.
class AFX_MAINTAIN_STATE2 {
public:
    explicit AFX_MAINTAIN_STATE2(AFX_MODULE_STATE* state) noexcept;
    ~AFX_MAINTAIN_STATE2();
    AFX_MAINTAIN_STATE2(const AFX_MAINTAIN_STATE2&) = delete;
    AFX_MAINTAIN_STATE2& operator=(const AFX_MAINTAIN_STATE2&) = delete;

private:
    AFX_MODULE_STATE* m_previous;
};

/// Initialises MFC for the process. May be called again.
/// @param instance the host's module
/// @param previous must be null
/// @param commandLine the process's command line
/// @param show how the main window would be shown
/// @return false when there is no module to initialise for
BOOL AfxWinInit(HINSTANCE instance, HINSTANCE previous, LPTSTR commandLine, int show);
