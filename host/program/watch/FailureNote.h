#pragma once

#include "host/program/journal/Job.h"
#include "host/program/report/Texts.h"

/// Where the note beside a document that has failed lies.
/// @param document as it is put away
std::filesystem::path NoteOf(const std::filesystem::path& document);

/// What a person who finds the document in the folder "failed" is to know: what was wrong with it,
/// and what to do.
/// @param in the watched folder
/// @return UTF-8, with the system's ends of lines
std::string NoteFor(const Job& job, const std::filesystem::path& in, const Texts& texts);
