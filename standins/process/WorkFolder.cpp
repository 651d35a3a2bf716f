#include "standins/process/WorkFolder.h"

#include <glib.h>
#include <sys/stat.h>
#include <unistd.h>

#include <cstdio>
#include <filesystem>
#include <memory>
#include <random>

namespace fs = std::filesystem;

namespace standins {

namespace {

std::string UrlOfProfile(const std::string& folder) {
    // Everything but plain characters is escaped: LibreOffice would expand a $ in the address.
    const std::unique_ptr<char, decltype(&g_free)> path(
        g_uri_escape_string(folder.c_str(), "/", FALSE), g_free);
    return std::string("file://") + path.get() + "/profile";
}

/// The name that LibreOffice gives to the socket by which a second start with the same profile
/// finds the first: the MD5 sum of the profile's address in UTF-16, each byte in as few hexadecimal
/// digits as it needs.
std::string SocketName(const std::string& profileUrl) {
    const std::u16string address(profileUrl.begin(), profileUrl.end());
    const std::unique_ptr<GChecksum, decltype(&g_checksum_free)> sum(g_checksum_new(G_CHECKSUM_MD5),
                                                                     g_checksum_free);
    g_checksum_update(sum.get(), reinterpret_cast<const guchar*>(address.data()),
                      static_cast<gssize>(address.size() * sizeof(char16_t)));
    guint8 digest[16];
    gsize size = sizeof digest;
    g_checksum_get_digest(sum.get(), digest, &size);
    std::string name = "OSL_PIPE_" + std::to_string(getuid()) + "_SingleOfficeIPC_";
    for (const guint8 byte : digest) {
        char digits[3];
        std::snprintf(digits, sizeof digits, "%x", byte);
        name += digits;
    }
    return name;
}

} // namespace

std::string WorkFolder::NewPath() {
    std::error_code error;
    fs::path base = fs::temp_directory_path(error);
    if (error)
        base = "/tmp";
    std::random_device random;
    const std::uint64_t number = (static_cast<std::uint64_t>(random()) << 32) | random();
    return fs::absolute(
        base / ("quillon-office-" + std::to_string(getpid()) + "-" + std::to_string(number)));
}

WorkFolder::WorkFolder(std::string path)
    : m_path(std::move(path)), m_isMade(mkdir(m_path.c_str(), S_IRWXU) == 0) {}

WorkFolder::~WorkFolder() {
    if (m_isMade)
        Remove(m_path);
}

std::string WorkFolder::ProfileUrl() const {
    return UrlOfProfile(m_path);
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
    const std::string socket = SocketName(UrlOfProfile(path));
    for (const char* folder : {"/tmp/", "/var/tmp/"})
        unlink((folder + socket).c_str());
}

} // namespace standins
