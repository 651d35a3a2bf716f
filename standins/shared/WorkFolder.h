#pragma once

#include "standins/shared/Descriptor.h"

#include <cstdint>
#include <string>

namespace standins {

/// The private folder of one engine run: its document, its profile, its temporary files and its
/// output. Its path is also the engine's home folder, so that the engine's processes can be told.
/// A file in it is locked for as long as it is in use, so that one whose processes were all killed
/// can be told, too.
class WorkFolder {
public:
    /// Removes what an engine that was killed leaves outside of its work folder.
    /// @param path of the work folder
    using ClearOutside = void (*)(const std::string& path);

    /// @param kind of engine, part of the name: "office"
    /// @return a path for a work folder that no other run has, in the folder for temporary files
    static std::string NewPath(const std::string& kind);

    /// Makes the folder, for this user alone. IsMade() tells whether it could, errno why not.
    explicit WorkFolder(std::string path);
    /// Removes everything. No process may be at work in it any more.
    ~WorkFolder();
    WorkFolder(const WorkFolder&) = delete;
    WorkFolder& operator=(const WorkFolder&) = delete;

    bool IsMade() const { return m_mark.IsOpen(); }
    const std::string& Path() const { return m_path; }

    /// The size of all files in it, in bytes.
    std::uint64_t Size() const;

    /// Removes a work folder in the place of its supervisor, which has ended; ends what is still at
    /// work in it.
    /// @param clearOutside may be null
    static void Discard(const std::string& path, ClearOutside clearOutside);

    /// Discards the work folders of this user in the folder for temporary files that nobody has in
    /// use, as they are left when supervisor and server are killed together.
    /// @param kind as for NewPath
    static void DiscardAbandoned(const std::string& kind, ClearOutside clearOutside);

private:
    std::string m_path;
    Descriptor m_mark; ///< the locked file
};

} // namespace standins
