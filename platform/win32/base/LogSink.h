#pragma once

// What the layer has to say: arguments that it does not support, complaints of the libraries below
// it, and the texts of OutputDebugStringW.

#include <functional>
#include <string>

namespace win32 {

/// Takes one record: UTF-8, without a line end. Called by one thread at a time.
using LogSink = std::function<void(const std::string& record)>;

/// Sends the records to `sink` from now on; an empty one brings back standard error. The old sink
/// is not called any more once this has returned.
void SetLogSink(LogSink sink);

/// Hands one record to the sink. What a sink logs itself goes to standard error.
void Log(const std::string& record);

} // namespace win32
