#include "standins/shared/FileBytes.h"

#include "standins/shared/Descriptor.h"

#include <fcntl.h>
#include <glib.h>
#include <unistd.h>

#include <algorithm>
#include <cerrno>
#include <vector>

namespace standins {

int ReadWhole(int file, const TakeBytes& take) {
    std::vector<char> buffer(std::size_t{64} << 10);
    for (off_t position = 0;;) {
        const ssize_t size = pread(file, buffer.data(), buffer.size(), position);
        if (size < 0 && errno == EINTR)
            continue;
        if (size < 0)
            return errno;
        if (size == 0)
            return 0;
        if (const int error = take(buffer.data(), static_cast<std::size_t>(size)))
            return error;
        position += size;
    }
}

std::string ReadText(const std::string& path, std::size_t limit) {
    const Descriptor file(open(path.c_str(), O_RDONLY | O_CLOEXEC));
    std::string text;
    if (file.IsOpen())
        ReadWhole(file.Get(), [&](const char* bytes, std::size_t size) {
            text.append(bytes, std::min(size, limit - text.size()));
            return text.size() < limit ? 0 : EFBIG;
        });
    return text;
}

int WriteWhole(int file, const char* bytes, std::size_t size) {
    while (size > 0) {
        const ssize_t written = write(file, bytes, size);
        if (written < 0 && errno == EINTR)
            continue;
        if (written < 0)
            return errno;
        bytes += written;
        size -= static_cast<std::size_t>(written);
    }
    return 0;
}

Sha256::Sha256() : m_sum(g_checksum_new(G_CHECKSUM_SHA256), g_checksum_free) {}

void Sha256::Add(const char* bytes, std::size_t size) {
    g_checksum_update(m_sum.get(), reinterpret_cast<const guchar*>(bytes),
                      static_cast<gssize>(size));
}

std::string Sha256::Text() const {
    return g_checksum_get_string(m_sum.get());
}

} // namespace standins
