#include "standins/office/inprocess/AutomationObject.h"

#include "standins/inprocess/HostRecord.h"
#include "standins/shared/Text.h"

#include <windows.h>

#include <cwchar>
#include <exception>
#include <memory>
#include <new>

namespace standins {

namespace {

const Member* FindMember(const std::vector<Member>& members, DISPID id, WORD flags) {
    for (const Member& member : members) {
        if (member.id == id && (member.kind & flags) != 0)
            return &member;
    }
    return nullptr;
}

const Member* FindMember(const std::vector<Member>& members, LPCOLESTR name) {
    for (const Member& member : members) {
        if (wcscasecmp(member.name, name) == 0)
            return &member;
    }
    return nullptr;
}

/// Whether the arguments suit the member by number. They have no names, but for the value of a
/// property that is put.
HRESULT CheckArguments(const Member& member, const DISPPARAMS& arguments) {
    const bool isPut = member.kind == DISPATCH_PROPERTYPUT;
    if (arguments.cNamedArgs > (isPut ? 1U : 0U))
        return DISP_E_NONAMEDARGS;
    if (arguments.cArgs < member.required || arguments.cArgs > member.accepted)
        return DISP_E_BADPARAMCOUNT;
    return S_OK;
}

HRESULT Raise(const Raised& error, const wchar_t* source, EXCEPINFO* exception) {
    // Clients tend to answer with a code alone.
    OutputDebugStringW((std::wstring(source) + L": " + error.description).c_str());
    LeaveFailure(error.failure ? error.failure
                               : Failure{ToUtf8(error.description).value_or(std::string())});
    if (exception) {
        *exception = EXCEPINFO{};
        exception->bstrSource = SysAllocString(source);
        exception->bstrDescription = SysAllocString(error.description.c_str());
        exception->scode = E_FAIL;
    }
    return DISP_E_EXCEPTION;
}

} // namespace

HRESULT AutomationObject::GetTypeInfoCount(UINT* count) {
    if (!count)
        return E_POINTER;
    *count = 0;
    return S_OK;
}

HRESULT AutomationObject::GetTypeInfo(UINT /*index*/, LCID /*locale*/, ITypeInfo** info) {
    if (info)
        *info = nullptr;
    return TYPE_E_ELEMENTNOTFOUND;
}

HRESULT AutomationObject::GetIDsOfNames(REFIID /*reserved*/, LPOLESTR* names, UINT count,
                                        LCID /*locale*/, DISPID* ids) {
    if (!names || !ids || count == 0)
        return E_INVALIDARG;
    const Member* member = FindMember(m_members, names[0]);
    ids[0] = member ? member->id : DISPID_UNKNOWN;
    for (UINT i = 1; i < count; ++i) // names of arguments
        ids[i] = DISPID_UNKNOWN;
    return member && count == 1 ? S_OK : DISP_E_UNKNOWNNAME;
}

HRESULT AutomationObject::Invoke(DISPID id, REFIID reserved, LCID /*locale*/, WORD flags,
                                 DISPPARAMS* arguments, VARIANT* result, EXCEPINFO* exception,
                                 UINT* badArgument) {
    if (reserved != IID_NULL)
        return DISP_E_UNKNOWNINTERFACE;
    if (!arguments)
        return E_INVALIDARG;
    const Member* member = FindMember(m_members, id, flags);
    if (!member)
        return DISP_E_MEMBERNOTFOUND;
    if (const HRESULT suits = CheckArguments(*member, *arguments); FAILED(suits))
        return suits;
    if (result)
        VariantInit(result);
    try {
        Call call(*arguments, result);
        Perform(*member, call);
        return S_OK;
    } catch (const Raised& error) {
        return Raise(error, m_session->name, exception);
    } catch (const WrongCall& wrong) {
        if (badArgument)
            *badArgument = arguments->cArgs - 1 - wrong.argument; // as rgvarg counts them
        return wrong.code;
    } catch (const std::bad_alloc&) {
        return E_OUTOFMEMORY;
    } catch (const std::exception&) {
        return E_UNEXPECTED;
    }
}

void AutomationObject::Perform(const Member& member, Call& call) {
    if (!m_session->isRunning)
        throw Raised{std::wstring(m_session->name) + L" has quit."};
    // The object may be released from within the call.
    AddRef();
    const std::unique_ptr<AutomationObject, void (*)(AutomationObject*)> held(
        this, [](AutomationObject* object) { object->Release(); });
    member.perform(*this, call);
}

} // namespace standins
