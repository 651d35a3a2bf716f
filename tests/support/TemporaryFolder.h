#pragma once

#include <filesystem>
#include <string>
#include <string_view>

/// A folder of its own for one test; goes with everything in it.
class TemporaryFolder {
public:
    TemporaryFolder();
    ~TemporaryFolder();
    TemporaryFolder(const TemporaryFolder&) = delete;
    TemporaryFolder& operator=(const TemporaryFolder&) = delete;

    const std::filesystem::path& Path() const { return m_path; }
    std::filesystem::path operator/(const std::filesystem::path& name) const {
        return m_path / name;
    }

    /// Writes a file into the folder, replacing one of that name.
    /// @return its full path
    std::filesystem::path Write(const std::filesystem::path& name, std::string_view bytes) const;

private:
    std::filesystem::path m_path;
};

/// The bytes of a file; the test fails when it cannot be read.
std::string ReadBytes(const std::filesystem::path& path);
