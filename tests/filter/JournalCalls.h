#pragma once

#include "tests/support/RecordingOffice.h"

#include <algorithm>

// Calls by their lines in a RecordingOffice's journal: "Documents.15 method (…)".

/// Runs an action on each call of the line's member.
inline void OnCall(RecordingOffice& office, const std::string& line,
                   RecordingOffice::Action action) {
    const std::size_t dot = line.find('.');
    office.On(line.substr(0, dot), std::stoi(line.substr(dot + 1)), std::move(action));
}

/// Has the call fail that makes exactly this line.
/// @param fail throws what the call fails with
inline void FailAt(RecordingOffice& office, const std::string& line, void (*fail)()) {
    OnCall(office, line, [&office, line, fail](const auto&) {
        if (office.Journal().back() == line)
            fail();
    });
}

inline void Raise() {
    throw RecordingOffice::Raise{L"no"};
}
inline void DenyAccess() {
    throw RecordingOffice::Fail{E_ACCESSDENIED};
}

/// Whether the line is about an object's last reference.
inline bool IsRelease(const std::string& line) {
    return line.front() == '~';
}

inline std::vector<std::string> WithoutReleases(std::vector<std::string> journal) {
    journal.erase(std::remove_if(journal.begin(), journal.end(), IsRelease), journal.end());
    return journal;
}
