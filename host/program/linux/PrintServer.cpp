#include "host/program/system/PrintServer.h"

#include <cups/cups.h>
#include <poll.h>
#include <unistd.h>

#include <array>
#include <cerrno>
#include <cstdio>
#include <memory>

namespace fs = std::filesystem;

namespace {

/// @param option of the program that tells how the print server was built; not everybody has it
fs::path AskConfig(const char* option) {
    const std::string command = std::string("cups-config ") + option + " 2>/dev/null";
    const std::unique_ptr<std::FILE, int (*)(std::FILE*)> answer(popen(command.c_str(), "r"),
                                                                 pclose);
    std::array<char, 4096> line = {};
    if (!answer || !std::fgets(line.data(), static_cast<int>(line.size()), answer.get()))
        return {};
    const std::string path = line.data();
    return path.substr(0, path.find('\n'));
}

/// @return the first that is there; empty if none is
fs::path FirstFolder(std::initializer_list<fs::path> folders) {
    std::error_code ignored;
    for (const fs::path& folder : folders)
        if (!folder.empty() && fs::is_directory(folder, ignored))
            return folder;
    return {};
}

} // namespace

std::optional<PrintServer::Folders> PrintServer::FindFolders() {
    Folders folders;
    folders.root = FirstFolder({AskConfig("--serverroot"), "/etc/cups", "/usr/local/etc/cups"});
    folders.bin = FirstFolder({AskConfig("--serverbin"), "/usr/lib/cups", "/usr/libexec/cups",
                               "/usr/lib64/cups", "/usr/local/libexec/cups"});
    return folders.root.empty() || folders.bin.empty() ? std::nullopt : std::optional(folders);
}

const char* PrintServer::ReloadCommand() {
    return "systemctl restart cups";
}

std::map<std::string, std::string> PrintServer::ParseOptions(const std::string& options) {
    cups_option_t* parsed = nullptr;
    const int count = cupsParseOptions(options.c_str(), 0, &parsed);
    std::map<std::string, std::string> values;
    for (int i = 0; i < count; ++i)
        values[parsed[i].name] = parsed[i].value;
    cupsFreeOptions(count, parsed);
    return values;
}

std::optional<std::string> PrintServer::ReadInput(std::chrono::milliseconds longest,
                                                  std::error_code& error) {
    pollfd input{STDIN_FILENO, POLLIN, 0};
    if (poll(&input, 1, static_cast<int>(longest.count())) == 0)
        return std::nullopt;
    std::string bytes(1 << 16, '\0');
    const ssize_t size = read(STDIN_FILENO, bytes.data(), bytes.size());
    if (size < 0) {
        if (errno != EINTR)
            error = {errno, std::generic_category()};
        return std::nullopt;
    }
    bytes.resize(static_cast<std::size_t>(size));
    return bytes;
}
