#pragma once

#include <ole2.h>

#include <vector>

namespace standins {

/// An Office application that this module stands in for.
struct Application {
    CLSID clsid;           ///< our own, not Office's
    const wchar_t* progId; ///< without a version: "Word.Application"
    const wchar_t* title;
    std::vector<const char*> libraries; ///< of LibreOffice's, without which it cannot be served
    IDispatch* (*start)();              ///< a new running application
};

const std::vector<Application>& Applications();

// A new running application each, as the root of its object model.

IDispatch* StartWord();
IDispatch* StartExcel();
IDispatch* StartPowerPoint();
IDispatch* StartPublisher();

/// The version of Office that the stand-ins say they are, as the last part of a ProgID.
constexpr const wchar_t* OfficeVersion = L"16";

} // namespace standins
