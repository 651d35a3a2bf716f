#pragma once

#include "platform/com/ComObject.h"
#include "standins/office/inprocess/Call.h"
#include "standins/office/inprocess/ModuleUse.h"

#include <memory>
#include <string>
#include <utility>
#include <vector>

namespace standins {

/// What the objects of one running application share.
struct Session {
    Session(const wchar_t* applicationName, std::wstring startPrinter)
        : name(applicationName), printer(std::move(startPrinter)) {}

    const wchar_t* name;   ///< "Word"; the source of the errors that it raises
    bool isRunning = true; ///< until it is told to quit
    std::wstring printer;  ///< the active printer
    ModuleUse use{};
};

using SharedSession = std::shared_ptr<Session>;

class AutomationObject;

/// One line of an object's table of members.
struct Member {
    DISPID id;
    WORD kind; ///< DISPATCH_METHOD, DISPATCH_PROPERTYGET or DISPATCH_PROPERTYPUT
    const wchar_t* name;
    UINT required; ///< arguments that must be there
    UINT accepted; ///< arguments that may be there
    void (*perform)(AutomationObject& object, Call& call);
};

/// An object of an application's object model. It is driven by DISPID; its table says what it
/// answers. It lives until its last Release, the application's Quit or not; after Quit every call
/// raises.
class AutomationObject : public ComObject<IDispatch> {
public:
    HRESULT STDMETHODCALLTYPE GetTypeInfoCount(UINT* count) final;
    HRESULT STDMETHODCALLTYPE GetTypeInfo(UINT index, LCID locale, ITypeInfo** info) final;
    HRESULT STDMETHODCALLTYPE GetIDsOfNames(REFIID reserved, LPOLESTR* names, UINT count,
                                            LCID locale, DISPID* ids) final;
    HRESULT STDMETHODCALLTYPE Invoke(DISPID member, REFIID reserved, LCID locale, WORD flags,
                                     DISPPARAMS* arguments, VARIANT* result, EXCEPINFO* exception,
                                     UINT* badArgument) final;

protected:
    /// @param members its table
    AutomationObject(SharedSession session, std::vector<Member> members)
        : ComObject(IID_IDispatch), m_session(std::move(session)), m_members(std::move(members)) {}

    const SharedSession& TheSession() const { return m_session; }

private:
    void Perform(const Member& member, Call& call);

    SharedSession m_session;
    std::vector<Member> m_members;
};

/// Makes an object of the given class; the reference is the caller's.
template <typename Object, typename... Arguments>
IDispatch* MakeObject(Arguments&&... arguments) {
    return new Object(std::forward<Arguments>(arguments)...);
}

// The lines of a table: an object's operation, and how it is called.

template <typename Object>
Object& As(AutomationObject& object, void (Object::*)(Call&)) {
    return static_cast<Object&>(object);
}

template <auto Operation>
void Handle(AutomationObject& object, Call& call) {
    (As(object, Operation).*Operation)(call);
}

template <auto Operation>
Member Method(DISPID id, const wchar_t* name, UINT required, UINT accepted) {
    return {id, DISPATCH_METHOD, name, required, accepted, Handle<Operation>};
}

template <auto Operation>
Member Get(DISPID id, const wchar_t* name) {
    return {id, DISPATCH_PROPERTYGET, name, 0, 0, Handle<Operation>};
}

template <auto Operation>
Member Put(DISPID id, const wchar_t* name) {
    return {id, DISPATCH_PROPERTYPUT, name, 1, 1, Handle<Operation>};
}

} // namespace standins
