#pragma once

#include "tests/host/Program.h"
#include "tests/support/TemporaryFolder.h"

#include <gmock/gmock.h>

using Arguments = std::vector<std::string>;
using Names = std::vector<std::string>;

/// Runs of `quillon convert` with the scripted filter, from one folder into another.
class ConvertRun : public testing::Test {
protected:
    /// @param paths in the test's folder
    RunResult Convert(const Arguments& paths, const Arguments& options = {}) const {
        return RunQuillon(ArgumentsFor(paths, options));
    }

    Arguments ArgumentsFor(const Arguments& paths, const Arguments& options = {}) const {
        Arguments arguments = {"convert", "--json", "--out", Out()};
        arguments.insert(arguments.end(), options.begin(), options.end());
        for (const std::string& path : paths)
            arguments.push_back((m_folder / path).u8string());
        return arguments;
    }

    std::string Out() const { return (m_folder / "out").u8string(); }

    /// The path of an output, as it is reported.
    std::string OutputPath(const std::string& name) const {
        return (m_folder / "out" / name).u8string();
    }

    /// The names in the output folder, hidden ones too.
    Names Outputs() const {
        Names names;
        for (const auto& entry : std::filesystem::directory_iterator(Out()))
            names.push_back(entry.path().filename().u8string());
        std::sort(names.begin(), names.end());
        return names;
    }

    /// What the filter was told when it made the output.
    std::string Output(const std::string& name) const {
        return ReadBytes(std::filesystem::path(Out()) / name);
    }

    TemporaryFolder m_folder;
};
