#include "standins/office/engine/EngineOutput.h"

#include "standins/process/FileBytes.h"

#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

#include <string_view>

namespace standins {

Descriptor OpenPdf(const std::string& path) {
    constexpr std::string_view Header = "%PDF-";
    Descriptor pdf(open(path.c_str(), O_RDONLY | O_NOFOLLOW | O_NONBLOCK | O_CLOEXEC));
    struct stat status {};
    char start[Header.size()];
    if (!pdf.IsOpen() || fstat(pdf.Get(), &status) != 0 || !S_ISREG(status.st_mode) ||
        pread(pdf.Get(), start, sizeof start, 0) != static_cast<ssize_t>(sizeof start) ||
        std::string_view(start, sizeof start) != Header)
        return Descriptor();
    return pdf;
}

std::string DescribeMissingPdf(const std::string& log) {
    constexpr std::size_t LongEnough = std::size_t{64} << 10;
    const std::string words = ReadText(log, LongEnough);
    if (words.find("could not be loaded") != std::string::npos)
        return "LibreOffice cannot load it; the file is damaged or not of its type";
    return "LibreOffice loaded it, but made no pages of it";
}

} // namespace standins
