#include "standins/confinement/FileRules.h"

#include <fcntl.h>
#include <linux/landlock.h>
#include <sys/prctl.h>
#include <sys/stat.h>
#include <sys/syscall.h>
#include <unistd.h>

#include <algorithm>
#include <array>
#include <cerrno>

namespace standins {

namespace {

// What the headers of Linux 6.1 do not have.
constexpr std::uint64_t Truncate = 1ULL << 14;  // LANDLOCK_ACCESS_FS_TRUNCATE
constexpr std::uint64_t UseDevice = 1ULL << 15; // LANDLOCK_ACCESS_FS_IOCTL_DEV
constexpr std::uint64_t AllNetwork = 0b11;      // LANDLOCK_ACCESS_NET_BIND_TCP, …_CONNECT_TCP
constexpr std::uint64_t AllScopes =
    0b11; // LANDLOCK_SCOPE_ABSTRACT_UNIX_SOCKET, LANDLOCK_SCOPE_SIGNAL

/// struct landlock_ruleset_attr as of version 6; a kernel minds no more than it knows, as long as
/// the rest is 0.
struct RulesetAttributes {
    std::uint64_t files = 0;
    std::uint64_t network = 0; ///< from version 4 on
    std::uint64_t scopes = 0;  ///< from version 6 on
};

constexpr std::uint64_t Read =
    LANDLOCK_ACCESS_FS_EXECUTE | LANDLOCK_ACCESS_FS_READ_FILE | LANDLOCK_ACCESS_FS_READ_DIR;
constexpr std::uint64_t Write = LANDLOCK_ACCESS_FS_WRITE_FILE | Truncate;
/// What there is a rule for on a file that is no folder.
constexpr std::uint64_t OnFile =
    LANDLOCK_ACCESS_FS_EXECUTE | LANDLOCK_ACCESS_FS_READ_FILE | Write | UseDevice;
constexpr std::uint64_t MakeDevices = LANDLOCK_ACCESS_FS_MAKE_CHAR | LANDLOCK_ACCESS_FS_MAKE_BLOCK;

/// All that can be denied to a path.
std::uint64_t AllOf(int version) {
    constexpr std::uint64_t OfFirst = LANDLOCK_ACCESS_FS_REFER - 1;
    constexpr std::array<std::uint64_t, 5> Of = {
        OfFirst,
        OfFirst | LANDLOCK_ACCESS_FS_REFER,
        OfFirst | LANDLOCK_ACCESS_FS_REFER | Truncate,
        OfFirst | LANDLOCK_ACCESS_FS_REFER | Truncate,
        OfFirst | LANDLOCK_ACCESS_FS_REFER | Truncate | UseDevice,
    };
    return Of.at(std::min(static_cast<std::size_t>(version), Of.size()) - 1);
}

Descriptor MakeRuleset(int version, std::uint64_t files) {
    const RulesetAttributes attributes{files, version >= 4 ? AllNetwork : 0,
                                       version >= 6 ? AllScopes : 0};
    return Descriptor(
        static_cast<int>(syscall(SYS_landlock_create_ruleset, &attributes, sizeof attributes, 0)));
}

bool IsFolder(int file) {
    struct stat status {};
    return fstat(file, &status) == 0 && S_ISDIR(status.st_mode);
}

} // namespace

FileRules::FileRules(int version)
    : m_handled(AllOf(version)), m_ruleset(MakeRuleset(version, m_handled)) {}

bool FileRules::AllowReading(const std::string& path) {
    return Allow(path, Read);
}

bool FileRules::AllowDevice(const std::string& path) {
    return Allow(path, LANDLOCK_ACCESS_FS_READ_FILE | LANDLOCK_ACCESS_FS_WRITE_FILE);
}

bool FileRules::AllowFolder(const std::string& path) {
    const Descriptor folder(open(path.c_str(), O_PATH | O_DIRECTORY | O_CLOEXEC));
    return folder.IsOpen() && Add(folder.Get(), ~MakeDevices);
}

bool FileRules::AllowSockets(const std::string& path) {
    return Allow(path, LANDLOCK_ACCESS_FS_MAKE_SOCK);
}

bool FileRules::AllowFile(int file) {
    const bool isToRead = (fcntl(file, F_GETFL) & O_ACCMODE) == O_RDONLY;
    return Add(file, LANDLOCK_ACCESS_FS_READ_FILE | (isToRead ? 0 : Write));
}

/// What cannot be opened here is out of the process's reach without a rule, too.
bool FileRules::Allow(const std::string& path, std::uint64_t access) {
    const Descriptor file(open(path.c_str(), O_PATH | O_CLOEXEC));
    return !file.IsOpen() || Add(file.Get(), access);
}

bool FileRules::Add(int file, std::uint64_t access) {
    landlock_path_beneath_attr rule{};
    rule.allowed_access = access & m_handled & (IsFolder(file) ? ~0ULL : OnFile);
    rule.parent_fd = file;
    return syscall(SYS_landlock_add_rule, m_ruleset.Get(), LANDLOCK_RULE_PATH_BENEATH, &rule, 0) ==
           0;
}

bool FileRules::Enforce() const {
    return prctl(PR_SET_NO_NEW_PRIVS, 1, 0, 0, 0) == 0 &&
           syscall(SYS_landlock_restrict_self, m_ruleset.Get(), 0) == 0;
}

} // namespace standins
