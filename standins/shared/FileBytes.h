#pragma once

#include <cstddef>
#include <functional>
#include <memory>
#include <string>

struct _GChecksum; // GLib's, whose header is not everybody's business

namespace standins {

/// Takes a piece of a file; answers 0, or an errno that ends the reading.
using TakeBytes = std::function<int(const char* bytes, std::size_t size)>;

/// Reads a file from its start to its end; its file position stays as it is.
/// @return 0, or the errno of what failed
int ReadWhole(int file, const TakeBytes& take);

/// The first bytes of the file at `path`, at most `limit`; as many as can be read.
std::string ReadText(const std::string& path, std::size_t limit);

/// Writes all bytes.
/// @return 0, or the errno of what failed
int WriteWhole(int file, const char* bytes, std::size_t size);

/// The SHA-256 sum of bytes that come piece by piece.
class Sha256 {
public:
    Sha256();
    void Add(const char* bytes, std::size_t size);
    /// The sum in hexadecimal digits; nothing can be added afterwards.
    std::string Text() const;

private:
    std::unique_ptr<_GChecksum, void (*)(_GChecksum*)> m_sum;
};

} // namespace standins
