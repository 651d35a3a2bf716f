#pragma once

#include "host/program/filters/Filter.h"

#include <filesystem>
#include <memory>
#include <set>
#include <string>
#include <vector>

/// The filters of a folder.
class FilterSet {
public:
    /// Starts every filter that lies directly in the folder, in the order of their names.
    explicit FilterSet(const std::filesystem::path& folder);

    const std::vector<std::unique_ptr<Filter>>& Filters() const { return m_filters; }

    /// Of the files that they claim, in lower case, without dots.
    std::set<std::string> Extensions() const;

    /// @param extension without dot
    /// @return the first filter that claims files with it, or null
    Filter* Claiming(const wxString& extension) const;

    void ApplySettings(const wxXmlNode& settings);

    /// The message of a result code: the filters share one table of them.
    wxString ErrorText(int code) const;

private:
    std::vector<std::unique_ptr<Filter>> m_filters;
};
