#include "standins/distiller/supervisor/GhostscriptLog.h"

#include "standins/distiller/supervisor/GhostscriptCommand.h"
#include "standins/shared/Descriptor.h"
#include "standins/shared/FileBytes.h"

#include <fcntl.h>
#include <unistd.h>

#include <string_view>

namespace standins {

namespace {

constexpr off_t LongEnough = off_t{64} << 10;

/// A program can print without end; what Ghostscript says of it comes last.
std::string ReadEnd(const std::string& path) {
    const Descriptor file(open(path.c_str(), O_RDONLY | O_CLOEXEC));
    const off_t size = file.IsOpen() ? lseek(file.Get(), 0, SEEK_END) : 0;
    if (size <= LongEnough)
        return {};
    std::string text(LongEnough, '\0');
    const ssize_t got = pread(file.Get(), text.data(), text.size(), size - LongEnough);
    text.resize(got > 0 ? static_cast<std::size_t>(got) : 0);
    return text;
}

} // namespace

GhostscriptLog::GhostscriptLog(const std::string& path)
    : m_text(ReadText(path, LongEnough) + ReadEnd(path)) {}

bool GhostscriptLog::HasReadProfile() const {
    return Has(ProfileIsRead);
}

bool GhostscriptLog::TellsOfFullDisk() const {
    return Has("No space left on device");
}

bool GhostscriptLog::TellsOfUnfinishedPdf() const {
    return Has("on closing pdfwrite device");
}

std::string GhostscriptLog::PostScriptError() const {
    constexpr std::string_view Mark = "Error: /";
    constexpr std::size_t LongestName = 200;
    const std::size_t start = m_text.rfind(Mark);
    if (start == std::string::npos)
        return {};
    const std::size_t error = start + Mark.size();
    return m_text.substr(error, std::min(m_text.find('\n', error) - error, LongestName));
}

} // namespace standins
