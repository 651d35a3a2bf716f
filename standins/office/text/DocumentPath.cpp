// LibreOffice takes a document's name from the path that it opens. It asks the system for files by
// the functions here, and finds these in front of the system's.

#include "standins/office/text/DocumentPath.h"

#include <dlfcn.h>
#include <fcntl.h>
#include <sys/stat.h>
#include <sys/statfs.h>

#include <cstdarg>
#include <cstring>
#include <string>

namespace standins {

namespace {

struct Paths {
    std::string known;
    std::string copy;
};

/// Never destroyed: files are opened to the very end.
Paths& ThePaths() {
    static auto& s_paths = *new Paths;
    return s_paths;
}

/// Where the file is to be found that is asked for by a path.
const char* Found(const char* path) {
    const Paths& paths = ThePaths();
    return path && !paths.known.empty() && paths.known == path ? paths.copy.c_str() : path;
}

template <typename Function>
Function Next(Function /*own*/, const char* name) {
    return reinterpret_cast<Function>(dlsym(RTLD_NEXT, name));
}

} // namespace

void SetDocumentPath(const char* known, const char* copy) {
    ThePaths() = {known, copy};
}

} // namespace standins

#define IN_FRONT extern "C" __attribute__((visibility("default"))) int

IN_FRONT open(const char* path, int flags, ...) {
    static const auto s_next = standins::Next(&open, "open");
    mode_t mode = 0;
    if ((flags & (O_CREAT | O_TMPFILE)) != 0) {
        va_list arguments;
        va_start(arguments, flags);
        // The analyser does not see that va_start has set it.
        mode = va_arg(arguments, mode_t); // NOLINT(clang-analyzer-valist.Uninitialized)
        va_end(arguments);
    }
    return s_next(standins::Found(path), flags, mode);
}

IN_FRONT access(const char* path, int mode) noexcept {
    static const auto s_next = standins::Next(&access, "access");
    return s_next(standins::Found(path), mode);
}

IN_FRONT stat(const char* path, struct stat* status) noexcept {
    static const auto s_next =
        standins::Next(static_cast<int (*)(const char*, struct stat*)>(&stat), "stat");
    return s_next(standins::Found(path), status);
}

IN_FRONT lstat(const char* path, struct stat* status) noexcept {
    static const auto s_next = standins::Next(&lstat, "lstat");
    return s_next(standins::Found(path), status);
}

IN_FRONT statfs(const char* path, struct statfs* status) noexcept {
    static const auto s_next =
        standins::Next(static_cast<int (*)(const char*, struct statfs*)>(&statfs), "statfs");
    return s_next(standins::Found(path), status);
}
