#include "standins/process/WorkFolder.h"

#include <sys/stat.h>
#include <unistd.h>

#include <filesystem>
#include <random>

namespace fs = std::filesystem;

namespace standins {

std::string WorkFolder::NewPath(const std::string& kind) {
    std::error_code error;
    fs::path base = fs::temp_directory_path(error);
    if (error)
        base = "/tmp";
    std::random_device random;
    const std::uint64_t number = (static_cast<std::uint64_t>(random()) << 32) | random();
    return fs::absolute(
        base / ("quillon-" + kind + "-" + std::to_string(getpid()) + "-" + std::to_string(number)));
}

WorkFolder::WorkFolder(std::string path)
    : m_path(std::move(path)), m_isMade(mkdir(m_path.c_str(), S_IRWXU) == 0) {}

WorkFolder::~WorkFolder() {
    if (m_isMade)
        Remove(m_path);
}

std::uint64_t WorkFolder::Size() const {
    std::uint64_t sum = 0;
    std::error_code error;
    for (fs::recursive_directory_iterator entry(m_path, error), end; !error && entry != end;
         entry.increment(error)) {
        std::error_code gone; // the engine makes and removes files all the time
        const std::uintmax_t size = entry->is_regular_file(gone) ? entry->file_size(gone) : 0;
        if (!gone)
            sum += size;
    }
    return sum;
}

void WorkFolder::Remove(const std::string& path) {
    std::error_code ignored; // nobody is left to be told
    fs::remove_all(path, ignored);
}

} // namespace standins
