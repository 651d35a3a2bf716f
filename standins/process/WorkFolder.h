#pragma once

#include <cstdint>
#include <string>

namespace standins {

/// The private folder of one engine run: its document, its profile, its temporary files and its
/// output. Its path is also the engine's home folder, so that the engine's processes can be told.
class WorkFolder {
public:
    /// @param kind of engine, part of the name: "office"
    /// @return a path for a work folder that no other run has, in the folder for temporary files
    static std::string NewPath(const std::string& kind);

    /// Makes the folder, for this user alone. IsMade() tells whether it could.
    explicit WorkFolder(std::string path);
    /// Removes everything, like Remove().
    ~WorkFolder();
    WorkFolder(const WorkFolder&) = delete;
    WorkFolder& operator=(const WorkFolder&) = delete;

    bool IsMade() const { return m_isMade; }
    const std::string& Path() const { return m_path; }

    /// The size of all files in it, in bytes.
    std::uint64_t Size() const;

    /// Removes a work folder. No process may be at work in it any more.
    static void Remove(const std::string& path);

private:
    std::string m_path;
    bool m_isMade;
};

} // namespace standins
