#include "standins/office/supervisor/EngineOutput.h"

#include "standins/shared/FileBytes.h"

#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

#include <string_view>

namespace standins {

Descriptor OpenOutput(const std::string& path) {
    const bool isPdf = path.substr(path.rfind('.') + 1) == "pdf";
    const std::string_view header = isPdf ? "%PDF-" : "PK\3\4";
    Descriptor output(open(path.c_str(), O_RDONLY | O_NOFOLLOW | O_NONBLOCK | O_CLOEXEC));
    struct stat status {};
    char start[5];
    if (!output.IsOpen() || fstat(output.Get(), &status) != 0 || !S_ISREG(status.st_mode) ||
        pread(output.Get(), start, sizeof start, 0) != static_cast<ssize_t>(sizeof start) ||
        std::string_view(start, header.size()) != header)
        return Descriptor();
    return output;
}

std::string DescribeMissingOutput(const std::string& log) {
    constexpr std::size_t LongEnough = std::size_t{64} << 10;
    const std::string words = ReadText(log, LongEnough);
    if (words.find("could not be loaded") != std::string::npos)
        return "LibreOffice cannot load it; the file is damaged or not of its type";
    return "LibreOffice loaded it, but made no pages of it";
}

} // namespace standins
