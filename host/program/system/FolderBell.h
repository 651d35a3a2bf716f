#pragma once

#include <chrono>
#include <filesystem>
#include <memory>

/// Rings when something happens in folders. It does not say what: whoever waits looks for himself,
/// and from time to time unasked, since there are changes that a system does not tell of, those on
/// another machine's disk above all. One thread uses it; any may ring it.
class FolderBell {
public:
    FolderBell();
    ~FolderBell();
    FolderBell(const FolderBell&) = delete;
    FolderBell& operator=(const FolderBell&) = delete;

    /// Has it rung by what happens to the names and the files in a folder, not in those below it.
    /// For one that it has already, nothing changes; one that is another under the same name by
    /// now takes the other's place.
    /// @return whether the system tells of it
    bool Watch(const std::filesystem::path& folder);

    /// Waits until it has rung, once or many times.
    /// @return false when the time is over without that
    bool Wait(std::chrono::milliseconds longest);

    void Ring();

private:
    class System;
    std::unique_ptr<System> m_system;
};
