#pragma once

#include <string>

namespace standins {

bool PrinterExists(const std::wstring& name);

/// The printer that an application starts with: the system's default printer, else the first one;
/// empty when there is none.
std::wstring DefaultPrinter();

} // namespace standins
