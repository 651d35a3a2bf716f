#include "host/services/Log.h"

#include "host/services/AppendFile.h"

#include <atomic>
#include <limits>

namespace {

AppendFile g_file;
std::atomic<int> g_standardErrorFrom{LevelWarning};

} // namespace

bool Log::ToFile(const std::filesystem::path& path) {
    if (!g_file.Open(path))
        return false;
    g_standardErrorFrom = std::numeric_limits<int>::max();
    return true;
}

void Log::ToStandardError(SeverityLevel level) {
    g_standardErrorFrom = level;
}

bool Log::Wants(int level) {
    return g_file.IsOpen() || level >= g_standardErrorFrom;
}

void Log::Write(int level, std::string_view line) {
    g_file.Append(line);
    if (level >= g_standardErrorFrom)
        AppendFile::AppendToStandardError(line);
}
