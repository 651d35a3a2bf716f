#pragma once

#include <filesystem>
#include <functional>
#include <memory>
#include <string>
#include <system_error>

/// The SHA-256 of what is put into it.
class Digest {
public:
    Digest();

    void Add(const char* data, std::size_t size);

    /// In hexadecimal digits, in lower case. Nothing can be added afterwards.
    std::string Text();

private:
    std::shared_ptr<void> m_hash;
};

/// The digest of a file.
/// @param error receives why there is none
/// @param onProgress called now and then, as it may take long; may be empty
std::string DigestOf(const std::filesystem::path& file, std::error_code& error,
                     const std::function<void()>& onProgress = {});
