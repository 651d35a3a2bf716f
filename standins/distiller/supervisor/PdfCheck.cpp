#include "standins/distiller/supervisor/PdfCheck.h"

#include "standins/shared/Descriptor.h"

#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

#include <algorithm>
#include <string>
#include <string_view>

namespace standins {

namespace {

std::string Read(int file, off_t from, std::size_t size) {
    std::string bytes(size, '\0');
    const ssize_t got = pread(file, bytes.data(), bytes.size(), from);
    bytes.resize(got > 0 ? static_cast<std::size_t>(got) : 0);
    return bytes;
}

} // namespace

bool IsWholePdf(int pdf) {
    constexpr std::string_view Header = "%PDF-";
    constexpr std::string_view End = "%%EOF\n";
    const std::string path = "/proc/self/fd/" + std::to_string(pdf);
    const Descriptor file(open(path.c_str(), O_RDONLY | O_CLOEXEC));
    struct stat status {};
    if (!file.IsOpen() || fstat(file.Get(), &status) != 0)
        return false;
    const off_t end = std::max<off_t>(0, status.st_size - static_cast<off_t>(End.size()));
    return Read(file.Get(), 0, Header.size()) == Header && Read(file.Get(), end, End.size()) == End;
}

} // namespace standins
