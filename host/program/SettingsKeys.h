#pragma once

#include <vector>

/// A setting that filters know.
struct SettingsKey {
    const char* name;
    const char* values;
    const char* meaning;
};

const std::vector<SettingsKey>& KnownSettings();
