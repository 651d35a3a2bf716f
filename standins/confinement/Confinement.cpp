#include "standins/confinement/Confinement.h"

#include "standins/confinement/CallFilter.h"
#include "standins/confinement/FileRules.h"
#include "standins/shared/Isolation.h"

#include <linux/capability.h>
#include <sys/prctl.h>
#include <sys/syscall.h>
#include <unistd.h>

#include <algorithm>
#include <filesystem>

namespace fs = std::filesystem;

namespace standins {

namespace {

void Append(std::vector<std::string>& paths, const std::vector<std::string>& more) {
    paths.insert(paths.end(), more.begin(), more.end());
}

bool HasOneThread() {
    std::error_code error;
    const fs::directory_iterator threads("/proc/self/task", error);
    return !error && std::distance(begin(threads), end(threads)) == 1;
}

template <typename Item, typename Allow>
bool AllowAll(const std::vector<Item>& items, const Allow& allow) {
    return std::all_of(items.begin(), items.end(), allow);
}

bool ConfineToFiles(const Reach& reach) {
    const int version = LandlockVersion();
    if (version == 0)
        return true;
    FileRules rules(version);
    return AllowAll(reach.readable, [&](const auto& path) { return rules.AllowReading(path); }) &&
           AllowAll(reach.files, [&](int file) { return rules.AllowFile(file); }) &&
           AllowAll(reach.socketFolders,
                    [&](const auto& path) { return rules.AllowSockets(path); }) &&
           (!reach.mayFork || rules.AllowReading("/proc")) && // a child's own is another than here
           (reach.workFolder.empty() || rules.AllowFolder(reach.workFolder)) &&
           rules.AllowDevice("/dev/null") && rules.Enforce();
}

/// The system's administrator has rights that no rule takes away. Without new privileges, exec
/// does not bring them back.
bool DropRights() {
    __user_cap_header_struct header{_LINUX_CAPABILITY_VERSION_3, 0};
    const __user_cap_data_struct none[_LINUX_CAPABILITY_U32S_3] = {};
    return prctl(PR_SET_NO_NEW_PRIVS, 1, 0, 0, 0) == 0 && syscall(SYS_capset, &header, none) == 0;
}

} // namespace

void AllowSystem(Reach& reach) {
    Append(reach.readable,
           {"/lib", "/lib64", "/usr/lib", "/usr/lib64", "/usr/local/lib", "/usr/share",
            "/etc/localtime", "/etc/timezone", "/etc/ld.so.cache", "/etc/papersize", "/proc/self",
            "/proc/meminfo", "/dev/urandom", "/dev/random", "/sys/devices/system/cpu"});
}

void AllowFonts(Reach& reach, const std::vector<std::string>& folders) {
    Append(reach.readable, {"/etc/fonts", "/usr/share/fontconfig", "/var/cache/fontconfig"});
    Append(reach.readable, folders);
}

bool Confine(const Reach& reach) {
    return HasOneThread() && ConfineToFiles(reach) && DropRights() &&
           (!HasCallFilters() || DenyCalls(reach.mayFork));
}

} // namespace standins
