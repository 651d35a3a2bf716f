#pragma once

#include <afxdisp.h>

/// The base of the wrappers of Office's objects. A wrapper owns one reference to its object and is
/// copied by taking another; each member performs one IDispatch::Invoke, by the DISPID that
/// Office's type library publishes, and throws what COleDispatchDriver::InvokeHelper throws.
class DispatchWrapper : public COleDispatchDriver {
public:
    DispatchWrapper() = default;
    /// Takes over the caller's reference.
    explicit DispatchWrapper(LPDISPATCH object) : COleDispatchDriver(object) {}

protected:
    /// Calls a method without a result.
    /// @param types the VTS_ codes of the arguments
    template <typename... Arguments>
    void Call(DISPID member, const char* types, Arguments... arguments) {
        InvokeHelper(member, DISPATCH_METHOD, VT_EMPTY, nullptr, Encoded(types), arguments...);
    }

    /// Calls a method that answers an object.
    template <typename Object, typename... Arguments>
    Object CallForObject(DISPID member, const char* types, Arguments... arguments) {
        LPDISPATCH object = nullptr;
        InvokeHelper(member, DISPATCH_METHOD, VT_DISPATCH, &object, Encoded(types), arguments...);
        return Object(object);
    }

    template <typename Object>
    Object GetObjectProperty(DISPID member) {
        LPDISPATCH object = nullptr;
        InvokeHelper(member, DISPATCH_PROPERTYGET, VT_DISPATCH, &object, nullptr);
        return Object(object);
    }

    template <typename Value>
    void Put(DISPID member, const char* type, Value value) {
        InvokeHelper(member, DISPATCH_PROPERTYPUT, VT_EMPTY, nullptr, Encoded(type), value);
    }

private:
    static const BYTE* Encoded(const char* types) { return reinterpret_cast<const BYTE*>(types); }
};
