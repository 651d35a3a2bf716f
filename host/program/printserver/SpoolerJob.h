#pragma once

#include "host/program/base/Fault.h"

#include <filesystem>
#include <optional>
#include <string>
#include <vector>

/// A job as a print server hands it to a filter: by the command line, and by the environment.
struct SpoolerJob {
    std::string title;
    std::string options;
    std::string file;        ///< empty: the document comes by standard input
    std::string contentType; ///< may be empty
    std::string ppd;         ///< describes the printer; may be empty

    /// @param words JOB USER TITLE COPIES OPTIONS [FILE]
    /// @return nothing when they are not as many
    static std::optional<SpoolerJob> Read(const std::vector<std::string>& words);

    /// Copies the document into a folder, under a name that says its type.
    /// @param fault receives why it is not there, or not whole
    /// @return the copy
    std::optional<std::filesystem::path> CopyDocument(const std::filesystem::path& folder,
                                                      Fault& fault) const;
};
