#pragma once

// MFC's side of OLE automation: the dispatch driver, its exceptions, COleVariant.

#include <afxwin.h>
#include <ole2.h>

/// A COM call failed; m_sc tells how.
class COleException : public CException {
public:
    SCODE m_sc = S_OK;
};

/// An application raised an error from an automation call, and says where and what.
class COleDispatchException : public CException {
public:
    WORD m_wCode = 0;
    SCODE m_scError = S_OK;
    CString m_strSource;
    CString m_strDescription;
};

/// Throws a COleException for `sc`.
[[noreturn]] void AfxThrowOleException(SCODE sc);

/// A VARIANT that clears itself.
class COleVariant : public VARIANT {
public:
    COleVariant() noexcept;
    // NOLINTBEGIN(google-explicit-constructor): implicit in MFC
    COleVariant(SHORT value);
    COleVariant(LONG value, VARTYPE type = VT_I4); ///< VT_I4 or VT_ERROR
    COleVariant(LPCTSTR text);
    // NOLINTEND(google-explicit-constructor)
    COleVariant(const COleVariant&) = delete;
    COleVariant& operator=(const COleVariant&) = delete;
    ~COleVariant();

    operator LPVARIANT() { return this; } // NOLINT(google-explicit-constructor)
};

/// Calls an automation object by DISPID. Owns one reference to the object, as MFC's class does.
class COleDispatchDriver {
public:
    LPDISPATCH m_lpDispatch = nullptr;

    COleDispatchDriver() = default;
    /// Takes over the caller's reference to `dispatch`.
    explicit COleDispatchDriver(LPDISPATCH dispatch);
    COleDispatchDriver(const COleDispatchDriver& other);
    COleDispatchDriver& operator=(const COleDispatchDriver& other);
    ~COleDispatchDriver();

    /// Starts the application of `progId` and attaches its object.
    /// @param progId for instance "Word.Application"
    /// @return zero when the application cannot be started; nothing is thrown
    BOOL CreateDispatch(LPCTSTR progId);
    void ReleaseDispatch();

    /// Performs one IDispatch::Invoke.
    /// @param member the member's DISPID
    /// @param flags DISPATCH_METHOD, DISPATCH_PROPERTYGET or DISPATCH_PROPERTYPUT
    /// @param resultType VT_EMPTY or VT_DISPATCH
    /// @param result receives the object, which then belongs to the caller
    /// @param parameters VTS_ codes of the arguments that follow; null for none
    /// @throws COleDispatchException* when the application raised an error, COleException* when
    /// the call failed otherwise
    void InvokeHelper(DISPID member, WORD flags, VARTYPE resultType, void* result,
                      const BYTE* parameters, ...);

private:
    void Attach(LPDISPATCH dispatch);
};

// The types of InvokeHelper's arguments, in MFC's encoding: one byte each.
#define VTS_I4 "\x03"       // LONG
#define VTS_BSTR "\x08"     // LPCOLESTR, copied into a BSTR for the call
#define VTS_BOOL "\x0B"     // BOOL, passed as VARIANT_BOOL
#define VTS_VARIANT "\x0C"  // const VARIANT*, passed by value
#define VTS_PVARIANT "\x4C" // VARIANT*, passed by reference
#define VTS_NONE ""
