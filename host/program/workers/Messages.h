#pragma once

#include "host/program/documents/Inputs.h"
#include "host/program/documents/Outcome.h"
#include "host/program/system/FileIdentity.h"

#include <wx/string.h>

#include <chrono>
#include <filesystem>
#include <optional>
#include <string>

// What a program and its workers tell each other: JSON texts, one a line. A worker is given one
// document after the other; it answers each with the news of its progress and in the end with its
// outcome. All the while it gives signs of life.

/// One document to convert.
struct Assignment {
    Input input;                          ///< its names are text
    std::filesystem::path workplace;      ///< a folder for the attempt, whose own folder is there
    std::string settings;                 ///< XML
    std::optional<std::string> language;  ///< of what is said of it; the program's if not given
    unsigned engineDocuments = 1;         ///< until an engine is started anew
    std::optional<FileIdentity> identity; ///< what the file must be, before and after
    std::string digest;                   ///< likewise; see Job. Empty when nobody knows
    bool asItIs = false;                  ///< the output is a copy of the file; no filter is asked
};

/// What a worker tells of its document: that it has begun, how far it is, or what came of it.
struct News {
    wxString step;
    int percent = 0;
    std::optional<Outcome> outcome;
};

/// A line that says nothing else.
constexpr const char* SignOfLife = "alive";
constexpr std::chrono::milliseconds BetweenSignsOfLife{250};

std::string Encode(const Assignment& assignment);
std::string Encode(const News& news);

// Each gives nothing for a text that is no such message.
std::optional<Assignment> DecodeAssignment(const std::string& line);
std::optional<News> DecodeNews(const std::string& line);
