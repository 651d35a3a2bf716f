#pragma once

#include "plugin/interface/ProgressSink.h"

#include <vector>

/// Keeps what a driver reports.
class RecordingProgress : public ProgressSink {
public:
    bool Report(const wxString& text, int percent) override {
        texts.push_back(text);
        percents.push_back(percent);
        return false; // a wish to stop, which drivers do not follow
    }

    std::vector<wxString> texts;
    std::vector<int> percents;
};
