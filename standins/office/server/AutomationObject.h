#pragma once

#include "standins/office/server/Call.h"
#include "standins/office/server/Session.h"

#include <atomic>
#include <memory>
#include <vector>

namespace standins {

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
class AutomationObject : public IDispatch {
public:
    AutomationObject(const AutomationObject&) = delete;
    AutomationObject& operator=(const AutomationObject&) = delete;

    HRESULT STDMETHODCALLTYPE QueryInterface(REFIID iid, void** object) final;
    ULONG STDMETHODCALLTYPE AddRef() final;
    ULONG STDMETHODCALLTYPE Release() final;
    HRESULT STDMETHODCALLTYPE GetTypeInfoCount(UINT* count) final;
    HRESULT STDMETHODCALLTYPE GetTypeInfo(UINT index, LCID locale, ITypeInfo** info) final;
    HRESULT STDMETHODCALLTYPE GetIDsOfNames(REFIID reserved, LPOLESTR* names, UINT count,
                                            LCID locale, DISPID* ids) final;
    HRESULT STDMETHODCALLTYPE Invoke(DISPID member, REFIID reserved, LCID locale, WORD flags,
                                     DISPPARAMS* arguments, VARIANT* result, EXCEPINFO* exception,
                                     UINT* badArgument) final;

protected:
    using SharedSession = std::shared_ptr<Session>;

    explicit AutomationObject(SharedSession session) : m_session(std::move(session)) {}
    virtual ~AutomationObject() = default;

    virtual const std::vector<Member>& Members() const = 0;

    const SharedSession& TheSession() const { return m_session; }

private:
    void Perform(const Member& member, Call& call);

    SharedSession m_session;
    std::atomic<ULONG> m_references = 1;
};

/// Makes an object of the given class; the reference is the caller's.
template <typename Object, typename... Arguments>
IDispatch* MakeObject(Arguments&&... arguments) {
    return new Object(std::forward<Arguments>(arguments)...);
}

// From a table's line to the operation of the object.

template <typename Object>
Object& As(AutomationObject& object, void (Object::*)(Call&)) {
    return static_cast<Object&>(object);
}

template <auto Operation>
void Handle(AutomationObject& object, Call& call) {
    (As(object, Operation).*Operation)(call);
}

} // namespace standins
