#include "standins/shared/Isolation.h"

#include <linux/landlock.h>
#include <linux/seccomp.h>
#include <sys/syscall.h>
#include <unistd.h>

#include <algorithm>
#include <cerrno>
#include <system_error>

namespace standins {

namespace {

std::string WhyNoLandlock(int error) {
    switch (error) {
    case ENOSYS:
        return "the kernel has no Landlock, which needs Linux 5.13, or a container keeps it away";
    case EOPNOTSUPP:
        return "Landlock is switched off, and must be named in the kernel's parameter lsm=";
    default:
        return "Landlock cannot be used: " + std::generic_category().message(error);
    }
}

void Add(std::string& list, const std::string& text, const char* separator) {
    list += (list.empty() ? "" : separator) + text;
}

} // namespace

int LandlockVersion() {
    const long version =
        syscall(SYS_landlock_create_ruleset, nullptr, 0, LANDLOCK_CREATE_RULESET_VERSION);
    return static_cast<int>(std::max(version, 0L));
}

bool HasCallFilters() {
    const unsigned action = SECCOMP_RET_ERRNO;
    return syscall(SYS_seccomp, SECCOMP_GET_ACTION_AVAIL, 0, &action) == 0;
}

Isolation LookAtIsolation() {
    Isolation isolation;
    if (const int version = LandlockVersion())
        Add(isolation.means, "Landlock " + std::to_string(version), ", ");
    else
        Add(isolation.missing, "files are not kept from documents: " + WhyNoLandlock(errno), "; ");
    if (HasCallFilters())
        Add(isolation.means, "seccomp", ", ");
    else
        Add(isolation.missing,
            "network and processes are not kept from documents: the kernel has no seccomp", "; ");
    return isolation;
}

} // namespace standins
