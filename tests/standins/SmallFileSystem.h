#pragma once

#include <cstddef>
#include <filesystem>

/// A file system of its own with little room, mounted on a folder. Needs the right to mount.
class SmallFileSystem {
public:
    /// @param folder is made
    /// @param size in bytes
    SmallFileSystem(const std::filesystem::path& folder, std::size_t size);
    ~SmallFileSystem();
    SmallFileSystem(const SmallFileSystem&) = delete;
    SmallFileSystem& operator=(const SmallFileSystem&) = delete;

    bool IsMounted() const { return m_isMounted; }
    /// Lets nothing be written any more.
    void MakeReadOnly() const;

private:
    std::filesystem::path m_folder;
    bool m_isMounted;
};

/// Skips the test where file systems cannot be mounted.
#define NEEDS_MOUNT(fileSystem)                                                                    \
    if (!(fileSystem).IsMounted())                                                                 \
    GTEST_SKIP() << "file systems cannot be mounted here"
