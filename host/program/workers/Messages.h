#pragma once

#include "host/program/documents/Inputs.h"
#include "host/program/documents/Outcome.h"

#include <wx/string.h>

#include <chrono>
#include <filesystem>
#include <optional>
#include <string>

// What a run and its workers tell each other: JSON texts, one a line. A worker is told the run's
// facts once and then one document after the other; it answers each with the news of its progress
// and in the end with its outcome. All the while it gives signs of life.

/// What holds for all documents of a run.
struct RunFacts {
    std::string settings; ///< XML
    std::filesystem::path outputFolder;
    unsigned engineDocuments = 1; ///< until an engine is started anew
};

/// One document to convert.
struct Assignment {
    Input input;       ///< its names are text
    wxString baseName; ///< of the output
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

std::string Encode(const RunFacts& facts);
std::string Encode(const Assignment& assignment);
std::string Encode(const News& news);

// Each gives nothing for a text that is no such message.
std::optional<RunFacts> DecodeRunFacts(const std::string& line);
std::optional<Assignment> DecodeAssignment(const std::string& line);
std::optional<News> DecodeNews(const std::string& line);
