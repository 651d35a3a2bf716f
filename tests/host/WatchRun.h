#pragma once

#include "tests/host/Program.h"
#include "tests/support/TemporaryFolder.h"

#include <gmock/gmock.h>

/// Runs of `quillon watch` with the scripted filter on folders of the test's.
class WatchRun : public testing::Test {
protected:
    using Names = std::vector<std::string>;
    using Arguments = std::vector<std::string>;

    WatchRun() {
        for (const char* const name : {"in", "out"})
            std::filesystem::create_directory(m_folder / name);
    }

    std::string Path(const std::string& name) const { return (m_folder / name).u8string(); }

    /// Writes a configuration of one folder that settles at once.
    /// @param more lines for the folder
    void Configure(const std::string& more = {}, const std::string& head = {}) const {
        m_folder.Write("watch.toml", "journal = 'journal.db'\nhttp = ''\n" + head +
                                         "\n[defaults]\nsettle = '20ms'\nretries = ['1s']\n"
                                         "min_free = '1K'\n[[folder]]\nname = 'letters'\n"
                                         "in = 'in'\nout = 'out'\n" +
                                         more);
    }

    Arguments Watch(const Arguments& more = {}) const {
        Arguments arguments = {"watch", "--config", Path("watch.toml"), "--json"};
        arguments.insert(arguments.end(), more.begin(), more.end());
        return arguments;
    }

    RunResult WatchOnce() const { return RunQuillon(Watch({"--once"})); }

    /// Runs another command on the journal.
    RunResult Ask(Arguments arguments) const {
        arguments.insert(arguments.end(), {"--journal", Path("journal.db"), "--json"});
        return RunQuillon(std::move(arguments));
    }

    /// All files below a folder of the test's, hidden ones too, but for the watch's lock.
    Names FilesIn(const std::string& folder) const {
        namespace fs = std::filesystem;
        Names names;
        for (const auto& entry : fs::recursive_directory_iterator(m_folder / folder)) {
            const std::string name =
                entry.path().lexically_relative(m_folder / folder).generic_u8string();
            if (!entry.is_directory() && name.rfind(".quillon-watch", 0) != 0)
                names.push_back(name);
            else if (entry.is_directory() && name.rfind(".quillon", 0) == 0)
                names.push_back(name + "/");
        }
        std::sort(names.begin(), names.end());
        return names;
    }

    void Put(const std::string& name, const std::string& script = "script") const {
        m_folder.Write("in/" + name, script);
    }

    TemporaryFolder m_folder;
};
