#pragma once

// MFC's side of OLE automation: the dispatch driver, its exceptions, COleVariant.

#include <afxwin.h>
#include <ole2.h>

/// A COM call failed; m_sc tells how.
class COleException : public CException {
public:
    SCODE m_sc = S_OK;

    BOOL GetErrorMessage(LPTSTR buffer, UINT size) const override;
};

/// An application raised an error from an automation call, and says where and what.
class COleDispatchException : public CException {
public:
    WORD m_wCode = 0;
    SCODE m_scError = S_OK;
    CString m_strSource;
    CString m_strDescription;
    CString m_strHelpFile;
    DWORD m_dwHelpContext = 0;

    BOOL GetErrorMessage(LPTSTR buffer, UINT size) const override;
};

/// Throws a COleException for `sc`.
[[noreturn]] void AfxThrowOleException(SCODE sc);

/// A VARIANT that clears itself.
class COleVariant : public VARIANT {
public:
    COleVariant() noexcept;
    // NOLINTBEGIN(google-explicit-constructor): implicit in MFC
    COleVariant(SHORT value, VARTYPE type = VT_I2); ///< VT_I2 or VT_BOOL
    COleVariant(LONG value, VARTYPE type = VT_I4);  ///< VT_I4, VT_ERROR or VT_BOOL
    COleVariant(LPCTSTR text, VARTYPE type = VT_BSTR);
    // NOLINTEND(google-explicit-constructor)
    COleVariant(const COleVariant& other);
    COleVariant& operator=(const COleVariant& other);
    ~COleVariant();

    void Clear();
    operator LPVARIANT() { return this; }            // NOLINT(google-explicit-constructor)
    operator const VARIANT*() const { return this; } // NOLINT(google-explicit-constructor)
};

/// Calls an automation object by DISPID. Owns one reference to the object, as MFC's class does.
class COleDispatchDriver {
public:
    LPDISPATCH m_lpDispatch = nullptr;
    BOOL m_bAutoRelease = TRUE;

    COleDispatchDriver() = default;
    /// Takes over the caller's reference to `dispatch`.
    explicit COleDispatchDriver(LPDISPATCH dispatch, BOOL autoRelease = TRUE);
    COleDispatchDriver(const COleDispatchDriver& other);
    COleDispatchDriver& operator=(const COleDispatchDriver& other);
    ~COleDispatchDriver();

    /// Starts the application of `progId` and attaches its object.
    /// @param progId for instance "Word.Application"
    /// @param error receives the code of a failure; may be null
    /// @return zero when the application cannot be started; nothing is thrown
    BOOL CreateDispatch(LPCTSTR progId, COleException* error = nullptr);
    void AttachDispatch(LPDISPATCH dispatch, BOOL autoRelease = TRUE);
    LPDISPATCH DetachDispatch();
    void ReleaseDispatch();

    /// Performs one IDispatch::Invoke.
    /// @param member the member's DISPID
    /// @param flags DISPATCH_METHOD, DISPATCH_PROPERTYGET or DISPATCH_PROPERTYPUT
    /// @param resultType VT_EMPTY, VT_I2, VT_I4, VT_BOOL, VT_BSTR, VT_DISPATCH or VT_VARIANT
    /// @param result receives the result; a BSTR or an object then belongs to the caller
    /// @param parameters VTS_ codes of the arguments that follow; null for none
    /// @throws COleDispatchException* when the application raised an error, COleException* when
    /// the call failed otherwise
    void InvokeHelper(DISPID member, WORD flags, VARTYPE resultType, void* result,
                      const BYTE* parameters, ...);
};

// The types of InvokeHelper's arguments, in MFC's encoding: one byte each.
#define VTS_I2 "\x02"       // SHORT
#define VTS_I4 "\x03"       // LONG
#define VTS_BSTR "\x08"     // LPCOLESTR, copied into a BSTR for the call
#define VTS_DISPATCH "\x09" // LPDISPATCH
#define VTS_BOOL "\x0B"     // BOOL, passed as VARIANT_BOOL
#define VTS_VARIANT "\x0C"  // const VARIANT*, passed by value
#define VTS_PVARIANT "\x4C" // VARIANT*, passed by reference
#define VTS_NONE ""
