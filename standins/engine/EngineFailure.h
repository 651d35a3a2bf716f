#pragma once

#include "standins/process/Clocks.h"

#include <string>

namespace standins {

// Why an engine failed, as the end of a sentence that begins with the document's name: "letter.doc
// cannot be opened: …". An engine is called by its name, "LibreOffice" for instance.

/// @return what, followed by the system's words for the error
std::string DescribeError(const std::string& what, int error);
std::string DescribeStall(const std::string& engine, const TimeLimits& limits);
std::string DescribeOverdue(const std::string& engine, const TimeLimits& limits);
/// @param status as waitpid gives it
/// @return empty when the engine ended well, as far as its status tells
std::string DescribeStatus(const std::string& engine, int status);

/// Whether there is hardly any room left on the file system of an open file or folder.
bool IsFull(int file);
bool IsFull(const std::string& path);
/// @param folder what there is no room in
std::string DescribeFull(const std::string& folder);

} // namespace standins
