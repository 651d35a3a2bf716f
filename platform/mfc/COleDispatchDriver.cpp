#include <afxdisp.h>

#include <cstdarg>
#include <cstring>
#include <utility>
#include <vector>

namespace {

constexpr BYTE ByReference = 0x40; // MFC's mark of VTS_PVARIANT and its like

/// One argument of the call, taken from InvokeHelper's list. A text is copied into a BSTR, which
/// the argument owns; variants are lent for the length of the call.
class Argument {
public:
    Argument() : m_value() {}
    Argument(const Argument&) = delete;
    Argument& operator=(const Argument&) = delete;
    ~Argument() {
        if (m_ownsText)
            SysFreeString(m_value.bstrVal);
    }

    // NOLINTBEGIN(clang-analyzer-valist.Uninitialized): the caller has started the list
    void Take(BYTE type, va_list* list) {
        m_value.vt = type;
        switch (type) {
        case VT_I4:
            m_value.lVal = va_arg(*list, LONG);
            break;
        case VT_BOOL:
            m_value.boolVal = va_arg(*list, BOOL) ? VARIANT_TRUE : VARIANT_FALSE;
            break;
        case VT_BSTR:
            TakeText(va_arg(*list, LPCOLESTR));
            break;
        case VT_VARIANT:
            m_value = *va_arg(*list, const VARIANT*);
            break;
        case VT_VARIANT | ByReference:
            m_value.vt = VT_VARIANT | VT_BYREF;
            m_value.pvarVal = va_arg(*list, VARIANT*);
            break;
        default:
            AfxThrowOleException(DISP_E_BADVARTYPE);
        }
    }
    // NOLINTEND(clang-analyzer-valist.Uninitialized)

    const VARIANT& Value() const { return m_value; }

private:
    void TakeText(LPCOLESTR text) {
        m_value.bstrVal = SysAllocString(text);
        if (text && !m_value.bstrVal)
            AfxThrowMemoryException();
        m_ownsText = true;
    }

    VARIANT m_value;
    bool m_ownsText = false;
};

[[noreturn]] void ThrowRaised(EXCEPINFO& raised) {
    if (raised.pfnDeferredFillIn) // an application may wait with the texts until they are asked for
        raised.pfnDeferredFillIn(&raised);
    auto* exception = new COleDispatchException;
    exception->m_wCode = raised.wCode;
    exception->m_scError = raised.scode;
    exception->m_strSource = CString(raised.bstrSource);
    exception->m_strDescription = CString(raised.bstrDescription);
    for (BSTR text : {raised.bstrSource, raised.bstrDescription, raised.bstrHelpFile})
        SysFreeString(text);
    throw exception; // NOLINT(misc-throw-by-value-catch-by-reference): as MFC does
}

/// Hands the object that a call answered to the caller.
void StoreObject(COleVariant& answer, LPDISPATCH& object) {
    const HRESULT converted = VariantChangeType(&answer, &answer, 0, VT_DISPATCH);
    if (FAILED(converted))
        AfxThrowOleException(converted);
    object = std::exchange(answer.pdispVal, nullptr);
}

} // namespace

COleDispatchDriver::COleDispatchDriver(LPDISPATCH dispatch) : m_lpDispatch(dispatch) {}

COleDispatchDriver::COleDispatchDriver(const COleDispatchDriver& other)
    : m_lpDispatch(other.m_lpDispatch) {
    if (m_lpDispatch)
        m_lpDispatch->AddRef();
}

COleDispatchDriver& COleDispatchDriver::operator=(const COleDispatchDriver& other) {
    if (this != &other) {
        if (other.m_lpDispatch)
            other.m_lpDispatch->AddRef();
        Attach(other.m_lpDispatch);
    }
    return *this;
}

COleDispatchDriver::~COleDispatchDriver() {
    ReleaseDispatch();
}

BOOL COleDispatchDriver::CreateDispatch(LPCTSTR progId) {
    CLSID clsid{};
    IUnknown* created = nullptr;
    LPDISPATCH dispatch = nullptr;
    HRESULT result = CLSIDFromProgID(progId, &clsid);
    if (SUCCEEDED(result))
        result = CoCreateInstance(clsid, nullptr, CLSCTX_ALL, IID_IUnknown,
                                  reinterpret_cast<LPVOID*>(&created));
    if (SUCCEEDED(result)) {
        result = created->QueryInterface(IID_IDispatch, reinterpret_cast<void**>(&dispatch));
        created->Release();
    }
    if (FAILED(result))
        return FALSE;
    Attach(dispatch);
    return TRUE;
}

void COleDispatchDriver::Attach(LPDISPATCH dispatch) {
    ReleaseDispatch();
    m_lpDispatch = dispatch;
}

void COleDispatchDriver::ReleaseDispatch() {
    LPDISPATCH dispatch = std::exchange(m_lpDispatch, nullptr);
    if (dispatch)
        dispatch->Release();
}

void COleDispatchDriver::InvokeHelper(DISPID member, WORD flags, VARTYPE resultType, void* result,
                                      const BYTE* parameters, ...) {
    if (!m_lpDispatch)
        AfxThrowOleException(E_POINTER);
    if (resultType != VT_EMPTY && resultType != VT_DISPATCH)
        AfxThrowOleException(DISP_E_BADVARTYPE);

    const auto* types = parameters ? reinterpret_cast<const char*>(parameters) : VTS_NONE;
    const std::size_t count = std::strlen(types);
    std::vector<Argument> arguments(count);
    std::vector<VARIANT> passed(count); // last argument first, as IDispatch wants them
    va_list list;
    va_start(list, parameters);
    try {
        for (std::size_t i = 0; i < count; ++i) {
            arguments[i].Take(static_cast<BYTE>(types[i]), &list);
            passed[count - 1 - i] = arguments[i].Value();
        }
    } catch (...) {
        va_end(list);
        throw;
    }
    va_end(list);

    DISPID put = DISPID_PROPERTYPUT;
    DISPPARAMS call{passed.data(), nullptr, static_cast<UINT>(count), 0};
    if (flags & DISPATCH_PROPERTYPUT) {
        call.rgdispidNamedArgs = &put;
        call.cNamedArgs = 1;
    }

    COleVariant answer;
    EXCEPINFO raised{};
    UINT badArgument = 0;
    const HRESULT invoked = m_lpDispatch->Invoke(
        member, IID_NULL, LOCALE_USER_DEFAULT, flags, &call,
        resultType == VT_EMPTY ? nullptr : static_cast<VARIANT*>(&answer), &raised, &badArgument);
    if (invoked == DISP_E_EXCEPTION)
        ThrowRaised(raised);
    if (FAILED(invoked))
        AfxThrowOleException(invoked);
    if (resultType != VT_EMPTY)
        StoreObject(answer, *static_cast<LPDISPATCH*>(result));
}
