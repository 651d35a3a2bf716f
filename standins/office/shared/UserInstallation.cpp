#include "standins/office/shared/UserInstallation.h"

#include <glib.h>
#include <unistd.h>

#include <cstdio>
#include <memory>

namespace standins {

namespace {

/// How LibreOffice tells the profile in the name of the socket by which a second start with the
/// same profile finds the first: by the MD5 sum of the profile's address in UTF-16, each byte in as
/// few hexadecimal digits as it needs.
std::string SocketId(const std::string& profileUrl) {
    const std::u16string address(profileUrl.begin(), profileUrl.end());
    const std::unique_ptr<GChecksum, decltype(&g_checksum_free)> sum(g_checksum_new(G_CHECKSUM_MD5),
                                                                     g_checksum_free);
    g_checksum_update(sum.get(), reinterpret_cast<const guchar*>(address.data()),
                      static_cast<gssize>(address.size() * sizeof(char16_t)));
    guint8 digest[16];
    gsize size = sizeof digest;
    g_checksum_get_digest(sum.get(), digest, &size);
    std::string id;
    for (const guint8 byte : digest) {
        char digits[3];
        std::snprintf(digits, sizeof digits, "%x", byte);
        id += digits;
    }
    return id;
}

} // namespace

std::string UserInstallationUrl(const std::string& workFolder) {
    // Everything but plain characters is escaped: LibreOffice would expand a $ in the address.
    const std::unique_ptr<char, decltype(&g_free)> path(
        g_uri_escape_string(workFolder.c_str(), "/", FALSE), g_free);
    return std::string("file://") + path.get() + "/profile";
}

std::vector<std::string> SocketFolders() {
    return {"/tmp", "/var/tmp"};
}

void RemoveSocket(const std::string& workFolder) {
    const std::string name = "SingleOfficeIPC_" + SocketId(UserInstallationUrl(workFolder));
    // The user's number is not in it where LibreOffice cannot learn who the user is.
    for (const std::string& socket : {std::to_string(getuid()) + "_" + name, name})
        for (std::string path : SocketFolders())
            unlink(path.append("/OSL_PIPE_").append(socket).c_str());
}

} // namespace standins
