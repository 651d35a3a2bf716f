#include "standins/office/inprocess/Call.h"

namespace standins {

namespace {

/// A variant of our own, converted from an argument.
class Converted {
public:
    Converted(const VARIANT* source, VARTYPE type, UINT argument) {
        if (!source)
            throw WrongCall{DISP_E_PARAMNOTFOUND, argument};
        const HRESULT result = VariantChangeType(&m_value, source, 0, type);
        if (FAILED(result))
            throw WrongCall{result, argument};
    }
    ~Converted() { VariantClear(&m_value); }
    Converted(const Converted&) = delete;
    Converted& operator=(const Converted&) = delete;
    const VARIANT* operator->() const { return &m_value; }

private:
    VARIANT m_value{};
};

bool IsLeftOut(const VARIANT& argument) {
    return argument.vt == VT_ERROR && argument.scode == DISP_E_PARAMNOTFOUND;
}

} // namespace

Call::Call(const DISPPARAMS& parameters, VARIANT* result)
    : m_parameters(parameters), m_result(result) {}

/// @return null when the argument is left out
const VARIANT* Call::Find(UINT argument) const {
    if (argument >= m_parameters.cArgs)
        return nullptr;
    const VARIANT* found = &m_parameters.rgvarg[m_parameters.cArgs - 1 - argument];
    if (found->vt == (VT_VARIANT | VT_BYREF))
        found = found->pvarVal;
    return !found || IsLeftOut(*found) ? nullptr : found;
}

bool Call::Has(UINT argument) const {
    return Find(argument) != nullptr;
}

std::wstring Call::Text(UINT argument) const {
    const Converted text(Find(argument), VT_BSTR, argument);
    return {text->bstrVal, SysStringLen(text->bstrVal)};
}

LONG Call::Number(UINT argument) const {
    return Converted(Find(argument), VT_I4, argument)->lVal;
}

bool Call::Flag(UINT argument) const {
    return Converted(Find(argument), VT_BOOL, argument)->boolVal != VARIANT_FALSE;
}

LONG Call::Number(UINT argument, LONG standard) const {
    return Has(argument) ? Number(argument) : standard;
}

bool Call::Flag(UINT argument, bool standard) const {
    return Has(argument) ? Flag(argument) : standard;
}

void Call::Return(const std::wstring& text) {
    if (!m_result)
        return;
    m_result->vt = VT_BSTR;
    m_result->bstrVal = SysAllocStringLen(text.data(), static_cast<UINT>(text.size()));
}

void Call::Return(IDispatch* object) {
    if (!m_result) {
        object->Release();
        return;
    }
    m_result->vt = VT_DISPATCH;
    m_result->pdispVal = object;
}

} // namespace standins
