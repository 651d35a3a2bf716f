#pragma once

#include "standins/shared/Descriptor.h"

#include <cstdint>
#include <string>

namespace standins {

/// What a process may still reach by a path, as rules of Landlock's: at first nothing.
class FileRules {
public:
    /// @param version of Landlock, at least 1
    explicit FileRules(int version);

    // Each answers false, with errno set, when the rule cannot be added.

    /// Lets a file, or all in a folder, be read, and run in the process's own place. What is not
    /// there needs no rule.
    bool AllowReading(const std::string& path);
    /// Lets a device be read and written.
    bool AllowDevice(const std::string& path);
    /// Lets everything be done in a folder but making devices. It must be there.
    bool AllowFolder(const std::string& path);
    /// Lets sockets be made in a folder, and nothing else.
    bool AllowSockets(const std::string& path);
    /// Lets a file be opened anew by its descriptor: to read, and to write if it is open for that.
    bool AllowFile(int file);

    /// Binds the calling thread, and what comes of it, to the rules for good.
    /// @return false, with errno set, when it cannot be
    bool Enforce() const;

private:
    bool Allow(const std::string& path, std::uint64_t access);
    bool Add(int file, std::uint64_t access);

    std::uint64_t m_handled; ///< all that this version can deny
    Descriptor m_ruleset;
};

} // namespace standins
