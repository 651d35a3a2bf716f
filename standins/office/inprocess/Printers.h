#pragma once

#include <string>

namespace standins {

/// @throws Raised when there is no printer of this name
void RequirePrinter(const std::wstring& name);

/// The printer that an application starts with: the system's default printer, else the first one;
/// empty when there is none.
std::wstring DefaultPrinter();

} // namespace standins
