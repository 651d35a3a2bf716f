// In the place of LibreOffice's main library: it starts the real one, which lies beside it as
// "real", as the file "fault" beside it says.

#include <LibreOfficeKit/LibreOfficeKit.h>
#include <dlfcn.h>
#include <unistd.h>

#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <string>
#include <thread>

namespace fs = std::filesystem;

namespace {

fs::path OwnFolder() {
    Dl_info info{};
    dladdr(reinterpret_cast<void*>(&OwnFolder), &info);
    return fs::path(info.dli_fname).parent_path();
}

} // namespace

extern "C" __attribute__((visibility("default"))) LibreOfficeKit*
libreofficekit_hook_2(const char* installation, const char* profile) {
    std::string fault;
    std::ifstream(OwnFolder() / "fault") >> fault;
    if (fault == "refuses")
        return nullptr;
    if (fault == "aborts")
        std::abort();
    if (fault == "hangs")
        pause();
    if (fault == "threads")
        std::thread([] { pause(); }).detach();
    void* const real = dlopen((OwnFolder() / "real").c_str(), RTLD_LAZY);
    const auto start =
        reinterpret_cast<decltype(&libreofficekit_hook_2)>(dlsym(real, "libreofficekit_hook_2"));
    return start(installation, profile);
}
