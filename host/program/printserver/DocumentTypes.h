#pragma once

#include <wx/string.h>

#include <string>

/// A type of documents, as print servers call it.
struct DocumentType {
    const char* name;
    const char* endings; ///< of file names, with spaces between; the first is the usual one
    /// How a file is known whose name does not say it, in the words of CUPS' rules for types; null
    /// when the beginning of a file cannot tell.
    const char* content = nullptr;
};

// clang-format off
inline constexpr DocumentType DocumentTypes[] = {
    {"application/msword", "doc"},
    {"application/vnd.ms-excel", "xls"},
    {"application/vnd.ms-powerpoint", "ppt pps"},
    {"application/vnd.ms-publisher", "pub"},
    {"application/vnd.openxmlformats-officedocument.wordprocessingml.document", "docx",
     "string(0,PK<0304>) + contains(0,4096,word/)"},
    {"application/vnd.openxmlformats-officedocument.spreadsheetml.sheet", "xlsx",
     "string(0,PK<0304>) + contains(0,4096,xl/)"},
    {"application/vnd.openxmlformats-officedocument.presentationml.presentation", "pptx",
     "string(0,PK<0304>) + contains(0,4096,ppt/) + !match(*.ppsx) + !match(*.PPSX)"},
    {"application/vnd.openxmlformats-officedocument.presentationml.slideshow", "ppsx"},
};
// clang-format on

/// The name under which a job's document is converted, which its fields may print: the job's title,
/// as a file can be called, with an ending that fits the type.
/// @param title any bytes
/// @param type as the print server calls it; where it says nothing, the title's ending counts
wxString DocumentName(const std::string& title, const std::string& type);
