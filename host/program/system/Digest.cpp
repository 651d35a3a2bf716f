#include "host/program/system/Digest.h"

#include <cerrno>
#include <fstream>
#include <vector>

std::string DigestOf(const std::filesystem::path& file, std::error_code& error,
                     const std::function<void()>& onProgress) {
    constexpr std::size_t Part = 1 << 20;
    std::vector<char> part(Part);
    Digest digest;
    errno = 0;
    std::ifstream stream(file, std::ios::binary);
    while (stream) {
        stream.read(part.data(), static_cast<std::streamsize>(part.size()));
        digest.Add(part.data(), static_cast<std::size_t>(stream.gcount()));
        if (onProgress)
            onProgress();
    }
    error.clear();
    if (!stream.eof()) // it was not read to its end
        error = std::error_code(errno != 0 ? errno : EIO, std::generic_category());
    return error ? std::string() : digest.Text();
}
