#include "platform/win32/automation/VariantTypes.h"
#include "platform/win32/log/LogSink.h"
#include "platform/win32/text/CaseFold.h"

#include <algorithm>
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
    case VT_R8:
        number = source.dblVal;
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

std::string RealText(double number) {
    char text[32] = {};
    const auto [end, error] =
        std::to_chars(text, text + sizeof text, number, std::chars_format::general, 15);
    std::replace(text, end, 'e', 'E');
    return {text, end};
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
    case VT_R8:
        return AllocateText(RealText(source.dblVal), target);
    default:
        return DISP_E_TYPEMISMATCH;
    }
}

HRESULT ToObject(const VARIANT& source, REFIID iid, VARIANT& target) {
    if (source.vt != VT_DISPATCH && source.vt != VT_UNKNOWN)
        return DISP_E_TYPEMISMATCH;
    if (!source.punkVal)
        return S_OK;
    void* object = nullptr;
    if (FAILED(source.punkVal->QueryInterface(iid, &object)))
        return DISP_E_TYPEMISMATCH;
    target.byref = object;
    return S_OK;
}

HRESULT Convert(const VARIANT& source, VARTYPE type, VARIANT& target) {
    target.vt = type;
    switch (type) {
    case VT_I2:
        return ToInteger(source, target.iVal);
    case VT_I4:
        return ToInteger(source, target.lVal);
    case VT_R8:
        return ToNumber(source, target.dblVal);
    case VT_BOOL:
        return ToBool(source, target.boolVal);
    case VT_BSTR:
        return ToText(source, target);
    case VT_DISPATCH:
        return ToObject(source, IID_IDispatch, target);
    case VT_UNKNOWN:
        return ToObject(source, IID_IUnknown, target);
    default:
        return DISP_E_TYPEMISMATCH;
    }
}

} // namespace

HRESULT WINAPI VariantChangeType(VARIANTARG* target, const VARIANTARG* source, USHORT flags,
                                 VARTYPE type) {
    if ((type & VT_BYREF) != 0 || !win32::IsSupportedVariantType(type))
        return DISP_E_BADVARTYPE;
    if (flags != 0) {
        win32::Log("VariantChangeType: flags are not supported");
        return E_INVALIDARG;
    }
    VARIANT value{};
    HRESULT result = VariantCopyInd(&value, source);
    if (FAILED(result))
        return result;
    VARIANT converted{};
    if (value.vt == type) {
        converted = value;
    } else {
        result = Convert(value, type, converted);
        VariantClear(&value);
    }
    if (FAILED(result))
        return result;
    result = VariantClear(target);
    if (FAILED(result))
        VariantClear(&converted);
    else
        *target = converted;
    return result;
}
