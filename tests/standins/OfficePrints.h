#pragma once

#include "office/dispatch/PowerPointObjects.h"

#include <functional>
#include <string>

// The applications as the drivers of the filter drive them: from the start to Quit, with the same
// wrappers and arguments. Each answers what was raised; empty when all went well.

std::wstring PrintWorkbook(const std::wstring& path, const std::wstring& output,
                           const std::wstring& printer);

/// @param change changes the print options, which are those of a driver without settings
std::wstring
PrintPresentation(const std::wstring& path, const std::wstring& output, const std::wstring& printer,
                  const std::function<void(powerpoint::PrintOptions& options)>& change = {});

std::wstring PrintPublication(const std::wstring& path, const std::wstring& output,
                              const std::wstring& printer);
