#pragma once

#include "standins/office/printer/PrintJob.h"

#include <string>

namespace standins {

/// PostScript that makes the drawing procedures of cairo's prolog draw with fewer colours. Text
/// stays text and pictures stay pictures: the printer does it, whichever it is.
/// @return empty when all colours are wanted
std::string ColourProcedures(Colours colours);

} // namespace standins
