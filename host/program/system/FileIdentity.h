#pragma once

#include <cstdint>
#include <filesystem>
#include <system_error>

/// Which file it is, whatever its name. One that is written to becomes another.
struct FileIdentity {
    std::uint64_t device = 0;
    std::uint64_t number = 0;  ///< within the device
    std::uint64_t size = 0;    ///< bytes
    std::int64_t modified = 0; ///< nanoseconds, from wherever the system counts

    bool operator==(const FileIdentity& other) const {
        return device == other.device && number == other.number && size == other.size &&
               modified == other.modified;
    }
    bool operator!=(const FileIdentity& other) const { return !(*this == other); }
};

/// Whether two machines may mean the same file. Each numbers devices and files in its own way, and
/// file systems keep times more or less exactly.
inline bool MayBeSame(const FileIdentity& one, const FileIdentity& other) {
    constexpr std::int64_t Coarsest = 2'000'000'000; // of file systems that are in use
    const std::int64_t apart = one.modified - other.modified;
    return one.size == other.size && apart > -Coarsest && apart < Coarsest;
}

/// What a name stands for; a link is looked at itself, not followed.
struct FileLook {
    FileIdentity identity;
    std::int64_t changed = 0; ///< as modified; also when the file was renamed, where that is known
    std::filesystem::file_type type = std::filesystem::file_type::none;
};

/// @param error receives why there is nothing to see
FileLook LookAt(const std::filesystem::path& path, std::error_code& error);
