#pragma once

#include <wx/string.h>

/// What a document of one format must pass to be accepted.
struct ScreeningRule {
    /// Whether the application is new enough; null for the legacy formats, which each version
    /// reads and which are admitted when the filter is ready at all.
    bool (*isVersionSufficient)();
    /// Whether the file is a document of its application: 0, or a result code.
    int (*check)(const wxString& path);
};

/// @param extension without the dot, in any case
/// @return null when the filter does not handle it
const ScreeningRule* FindScreeningRule(const wxString& extension);
