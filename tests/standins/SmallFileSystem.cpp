#include "tests/standins/SmallFileSystem.h"

#include <gtest/gtest.h>
#include <sys/mount.h>

#include <string>

SmallFileSystem::SmallFileSystem(const std::filesystem::path& folder, std::size_t size)
    : m_folder(folder) {
    std::filesystem::create_directory(folder);
    const std::string options = "size=" + std::to_string(size);
    m_isMounted = mount("none", folder.c_str(), "tmpfs", 0, options.c_str()) == 0;
}

SmallFileSystem::~SmallFileSystem() {
    if (m_isMounted)
        umount2(m_folder.c_str(), MNT_DETACH);
}

void SmallFileSystem::MakeReadOnly() const {
    EXPECT_EQ(0, mount("none", m_folder.c_str(), nullptr, MS_REMOUNT | MS_RDONLY, nullptr));
}
