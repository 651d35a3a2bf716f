#pragma once

#include <wx/string.h>

#include <cstdint>

/// What an operation reports: 0 for success, a negative number for a failure of the filter itself,
/// a positive one for a failure on the Office side. Shared by all of the host's filters.
using ResultCode = std::int32_t;

/// The codes that this filter reports. GetResultText knows the other filters' codes too.
namespace Result {

constexpr ResultCode Success = 0;
constexpr ResultCode Failure = -1;

constexpr ResultCode InputFileNotFound = -1002;
constexpr ResultCode InvalidInputFile = -1005;
constexpr ResultCode NotInitialized = -1006;
constexpr ResultCode PdfConversionFailed = -1007;
constexpr ResultCode DistillerNotInstalled = -1010;

constexpr ResultCode WordNotInstalled = 1012;
constexpr ResultCode PowerPointNotInstalled = 1013;
constexpr ResultCode ExcelNotInstalled = 1014;
constexpr ResultCode PublisherNotInstalled = 1015;
constexpr ResultCode WordStartFailed = 1016;
constexpr ResultCode PowerPointStartFailed = 1017;
constexpr ResultCode ExcelStartFailed = 1018;
constexpr ResultCode PublisherStartFailed = 1019;
constexpr ResultCode PrintFailed = 1020;
constexpr ResultCode OutputFileNotFound = 1021;
constexpr ResultCode NoPSHeader = 1022;
constexpr ResultCode PublisherTooOld = 1023;

} // namespace Result

/// Whether a result code says that something is missing on the machine; no document is to blame.
constexpr bool IsMachineCode(ResultCode code) {
    constexpr ResultCode OfficeNotInstalled = 1011; // the first of those on missing applications
    return code == Result::NotInitialized || code == Result::DistillerNotInstalled ||
           (code >= OfficeNotInstalled && code <= Result::PublisherStartFailed) ||
           code == Result::PublisherTooOld;
}

/// The message of a result code in the host's language, one line without a full stop.
/// @param code any number; one that is no result code has the message of success
wxString GetResultText(ResultCode code);
