#include "platform/win32/automation/VariantTypes.h"
#include "platform/win32/base/LogSink.h"
#include "platform/win32/text/CaseFold.h"

#include <charconv>
#include <cmath>
#include <limits>
#include <string>

namespace {

HRESULT AllocateText(std::string_view ascii, VARIANT& target) {
    const std::wstring text(ascii.begin(), ascii.end());
    target.bstrVal = SysAllocStringLen(text.data(), static_cast<UINT>(text.size()));
    return target.bstrVal ? S_OK : E_OUTOFMEMORY;
}

/// Reads a number in the notation of programs: a point, no grouping.
HRESULT ParseNumber(const std::wstring& text, double& number) {
    const std::size_t first = text.find_first_not_of(L" \t\r\n");
    if (first == std::wstring::npos)
        return DISP_E_TYPEMISMATCH;
    const std::size_t last = text.find_last_not_of(L" \t\r\n");
    std::string ascii;
    for (std::size_t i = first; i <= last; ++i)
        ascii += text[i] < 0x80 ? static_cast<char>(text[i]) : '?';
    if (ascii[0] == '+' && ascii[1] != '-')
        ascii.erase(0, 1);
    const bool digitFirst = ascii.find_first_of("0123456789") <= 2; // no "inf", no "nan"
    const char* end = ascii.data() + ascii.size();
    const auto [stop, error] = std::from_chars(ascii.data(), end, number);
    if (!digitFirst || stop != end || error == std::errc::invalid_argument)
        return DISP_E_TYPEMISMATCH;
    return error == std::errc() ? S_OK : DISP_E_OVERFLOW;
}

HRESULT ToNumber(const VARIANT& source, double& number) {
    switch (source.vt) {
    case VT_EMPTY:
        number = 0;
        return S_OK;
    case VT_I2:
        number = source.iVal;
        return S_OK;
    case VT_BOOL:
        number = source.boolVal;
        return S_OK;
    case VT_I4:
        number = source.lVal;
        return S_OK;
    case VT_BSTR:
        return ParseNumber({source.bstrVal, SysStringLen(source.bstrVal)}, number);
    default:
        return DISP_E_TYPEMISMATCH;
    }
}

/// Rounds to the nearest whole number, halves to the even one.
template <typename Integer>
HRESULT ToInteger(const VARIANT& source, Integer& value) {
    double number = 0;
    const HRESULT read = ToNumber(source, number);
    if (FAILED(read))
        return read;
    number = std::nearbyint(number);
    using Limits = std::numeric_limits<Integer>;
    if (!(number >= Limits::min() && number <= Limits::max()))
        return DISP_E_OVERFLOW;
    value = static_cast<Integer>(number);
    return S_OK;
}

HRESULT ToBool(const VARIANT& source, VARIANT_BOOL& value) {
    if (source.vt == VT_BSTR) {
        const std::wstring word = win32::CaseFold({source.bstrVal, SysStringLen(source.bstrVal)});
        if (word == L"TRUE" || word == L"FALSE") {
            value = word == L"TRUE" ? VARIANT_TRUE : VARIANT_FALSE;
            return S_OK;
        }
    }
    double number = 0;
    const HRESULT read = ToNumber(source, number);
    if (SUCCEEDED(read))
        value = number != 0 ? VARIANT_TRUE : VARIANT_FALSE;
    return read;
}

HRESULT ToText(const VARIANT& source, VARIANT& target) {
    switch (source.vt) {
    case VT_EMPTY:
        return AllocateText({}, target);
    case VT_I2:
        return AllocateText(std::to_string(source.iVal), target);
    case VT_BOOL: // "-1" or "0"
        return AllocateText(std::to_string(source.boolVal), target);
    case VT_I4:
        return AllocateText(std::to_string(source.lVal), target);
    default:
        return DISP_E_TYPEMISMATCH;
    }
}

/// Gives the target the same value, with a text or a reference of its own.
HRESULT Copy(const VARIANT& source, VARIANT& target) {
    target = source;
    if (source.vt == VT_DISPATCH && source.pdispVal)
        source.pdispVal->AddRef();
    if (source.vt != VT_BSTR || !source.bstrVal)
        return S_OK;
    target.bstrVal = SysAllocStringLen(source.bstrVal, SysStringLen(source.bstrVal));
    return target.bstrVal ? S_OK : E_OUTOFMEMORY;
}

HRESULT Convert(const VARIANT& source, VARTYPE type, VARIANT& target) {
    if (source.vt == type)
        return Copy(source, target);
    target.vt = type;
    switch (type) {
    case VT_I2:
        return ToInteger(source, target.iVal);
    case VT_I4:
        return ToInteger(source, target.lVal);
    case VT_BOOL:
        return ToBool(source, target.boolVal);
    case VT_BSTR:
        return ToText(source, target);
    default:
        return DISP_E_TYPEMISMATCH;
    }
}

} // namespace

HRESULT WINAPI VariantChangeType(VARIANTARG* target, const VARIANTARG* source, USHORT flags,
                                 VARTYPE type) {
    if ((type & VT_BYREF) != 0 || !win32::IsSupportedVariantType(type) ||
        !win32::IsSupportedVariantType(source->vt))
        return DISP_E_BADVARTYPE;
    if (flags != 0 || (source->vt & VT_BYREF) != 0) {
        win32::Log("VariantChangeType: flags and references are not supported");
        return E_INVALIDARG;
    }
    VARIANT converted{};
    HRESULT result = Convert(*source, type, converted);
    if (FAILED(result))
        return result;
    result = VariantClear(target);
    if (FAILED(result))
        VariantClear(&converted);
    else
        *target = converted;
    return result;
}
