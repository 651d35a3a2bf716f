#pragma once

#include "host/program/base/Fault.h"

#include <filesystem>
#include <optional>
#include <set>

/// The folder that a run's outputs go to, and the names that they get there.
class OutputFolder {
public:
    /// Takes a folder, creating it when only itself is missing.
    /// @param fault receives why it cannot be used
    static std::optional<OutputFolder> Open(const std::filesystem::path& path, Fault& fault);

    /// Looks why a folder cannot be taken, without creating it.
    /// @return empty when nothing is in the way that can be seen
    static wxString FindObstacle(const std::filesystem::path& path);

    /// Absolute, without a separator at its end.
    const std::filesystem::path& Path() const { return m_path; }

    /// The base name for one input's output: the input's own, "budget" for budget.doc; when an
    /// input of this run has that already, its whole name, "budget.xls", and then "budget.xls (2)".
    /// @param fileName the input's name with extension
    wxString Allot(const wxString& fileName);

private:
    explicit OutputFolder(std::filesystem::path path) : m_path(std::move(path)) {}

    std::filesystem::path m_path;
    std::set<wxString> m_allotted; ///< in lower case, as some file systems see no difference
};

/// Whether next to nothing can be written any more, in a folder or among the temporary files.
bool IsFull(const std::filesystem::path& folder);
