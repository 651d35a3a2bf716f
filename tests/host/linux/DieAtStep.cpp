// Loaded in front of the program's libraries: ends `quillon watch` or `quillon serve` before its
// Nth step that a file system keeps, as a power failure does at any moment.

#include <dlfcn.h>
#include <sys/stat.h>
#include <unistd.h>

#include <atomic>
#include <csignal>
#include <cstdio>
#include <cstdlib>
#include <cstring>

namespace {

/// Its workers have the same environment, and are not meant.
bool IsService() {
    char arguments[4096] = {};
    std::FILE* const file = std::fopen("/proc/self/cmdline", "r");
    const std::size_t read = file ? std::fread(arguments, 1, sizeof arguments - 1, file) : 0;
    if (file)
        std::fclose(file);
    for (const char* word = arguments; word < arguments + read; word += std::strlen(word) + 1)
        if (std::strcmp(word, "watch") == 0 || std::strcmp(word, "serve") == 0)
            return true;
    return false;
}

long StepToDieAt() {
    const char* const step = std::getenv("TEST_DIE_AT_STEP");
    return step && IsService() ? std::strtol(step, nullptr, 10) : 0;
}

void Step() {
    static const long s_last = StepToDieAt();
    static std::atomic<long> s_steps{0};
    if (++s_steps == s_last)
        kill(getpid(), SIGKILL);
}

template <typename Function>
Function* Next(const char* name) {
    return reinterpret_cast<Function*>(dlsym(RTLD_NEXT, name));
}

} // namespace

extern "C" int fsync(int file) {
    Step();
    return Next<int(int)>("fsync")(file);
}

extern "C" int fdatasync(int file) {
    Step();
    return Next<int(int)>("fdatasync")(file);
}

extern "C" int rename(const char* from, const char* to) {
    Step();
    return Next<int(const char*, const char*)>("rename")(from, to);
}

extern "C" int renameat2(int fromFolder, const char* from, int toFolder, const char* to,
                         unsigned flags) {
    Step();
    return Next<int(int, const char*, int, const char*, unsigned)>("renameat2")(
        fromFolder, from, toFolder, to, flags);
}

extern "C" int unlink(const char* path) {
    Step();
    return Next<int(const char*)>("unlink")(path);
}

extern "C" int remove(const char* path) {
    Step();
    return Next<int(const char*)>("remove")(path);
}

extern "C" int unlinkat(int folder, const char* path, int flags) {
    Step();
    return Next<int(int, const char*, int)>("unlinkat")(folder, path, flags);
}

extern "C" int mkdir(const char* path, mode_t mode) {
    Step();
    return Next<int(const char*, mode_t)>("mkdir")(path, mode);
}
