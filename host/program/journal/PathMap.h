#pragma once

#include <filesystem>
#include <map>
#include <string>

/// Machines that work on the same files may have them under different paths. What they share is
/// called by a name, as "office:/letters/in", and each has it in a folder of its own.
class PathMap {
public:
    PathMap() = default;
    /// @param shares their folders on this machine, absolute, by their names
    explicit PathMap(std::map<std::string, std::filesystem::path> shares)
        : m_shares(std::move(shares)) {}

    /// @param local absolute
    /// @return how all machines call it; the path itself, UTF-8, when it is on no share
    std::string ToShared(const std::filesystem::path& local) const;

    /// @return the path itself when it is on no share, or one that this machine does not have
    std::filesystem::path ToLocal(const std::string& shared) const;

    /// Whether a share can be called so: nothing else is taken for it, a drive's letter least of
    /// all.
    static bool IsName(const std::string& name);

    /// Whether this machine has it, whatever is there.
    bool Has(const std::string& shared) const;

private:
    std::map<std::string, std::filesystem::path> m_shares;
};
