#pragma once

#include "standins/shared/Failure.h"

#include <ole2.h>

#include <string>

namespace standins {

/// An error that the application raises: the caller gets DISP_E_EXCEPTION with this description.
struct Raised {
    std::wstring description;
    Failure failure{}; ///< what the host is told; without a reason, the description
};

/// A call that does not suit its member.
struct WrongCall {
    HRESULT code;
    UINT argument; ///< counted from the first, 0
};

/// One call of a member of an automation object. Arguments are counted from the first, 0; those
/// that a client passes by reference are followed.
class Call {
public:
    /// @param result where the answer goes; null when the client wants none
    Call(const DISPPARAMS& parameters, VARIANT* result);

    /// Whether an argument is given and not marked as left out.
    bool Has(UINT argument) const;

    // An argument's value, converted if need be.
    // @throws WrongCall when it is left out, or cannot be converted

    std::wstring Text(UINT argument) const;
    LONG Number(UINT argument) const;
    bool Flag(UINT argument) const;

    // The same, with the value that a left out argument has.

    LONG Number(UINT argument, LONG standard) const;
    bool Flag(UINT argument, bool standard) const;

    void Return(const std::wstring& text);
    /// @param object the caller's reference goes to the client, or is released if it wants none
    void Return(IDispatch* object);

private:
    const VARIANT* Find(UINT argument) const;

    const DISPPARAMS& m_parameters;
    VARIANT* m_result;
};

} // namespace standins
