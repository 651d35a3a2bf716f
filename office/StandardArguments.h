#pragma once

#include <afxdisp.h>

/// The argument values that automation calls share. Yes and no are 16-bit integers, which Office
/// has always taken; an omitted optional argument is an error variant by automation's rule.
struct StandardArguments {
    COleVariant ArgTrue{static_cast<SHORT>(1)};
    COleVariant ArgFalse{static_cast<SHORT>(0)};
    COleVariant ArgOmitted{static_cast<LONG>(DISP_E_PARAMNOTFOUND), VT_ERROR};
};
