#include "standins/module/SearchPath.h"

#include <cstdlib>
#include <sstream>

namespace standins {

std::vector<std::string> SearchPath() {
    const char* path = std::getenv("PATH"); // NOLINT(concurrency-mt-unsafe): nobody changes it
    std::istringstream list(path ? path : "/usr/local/bin:/usr/bin:/bin");
    std::vector<std::string> folders;
    for (std::string folder; std::getline(list, folder, ':');)
        folders.push_back(folder);
    return folders;
}

} // namespace standins
