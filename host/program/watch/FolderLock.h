#pragma once

#include "host/program/base/Fault.h"
#include "host/program/system/FileIdentity.h"

#include <filesystem>
#include <memory>
#include <optional>

/// Held by the one program that watches a folder: a hidden file in it, which others find locked.
/// It goes with the object.
class FolderLock {
public:
    /// @param fault receives why the folder is not had, with Blame::Usage when somebody else has it
    static std::optional<FolderLock> Take(const std::filesystem::path& folder, Fault& fault);

    /// Looks who watches a folder at the moment, without leaving anything in it.
    static std::optional<wxString> HolderOf(const std::filesystem::path& folder);

    FolderLock(FolderLock&& other) noexcept = default;
    FolderLock& operator=(FolderLock&& other) noexcept;
    ~FolderLock();

private:
    FolderLock(std::filesystem::path folder, std::shared_ptr<void> handle)
        : m_folder(std::move(folder)), m_handle(std::move(handle)) {}
    void Release();

    std::filesystem::path m_folder;
    FileIdentity m_file;            ///< the lock's, should another folder come to that place
    std::shared_ptr<void> m_handle; ///< null when it is another object's
};
