#include "host/program/system/PrintServer.h"

// Windows prints documents itself; there is no print server that calls filters.

std::optional<PrintServer::Folders> PrintServer::FindFolders() {
    return std::nullopt;
}

const char* PrintServer::ReloadCommand() {
    return "";
}

std::map<std::string, std::string> PrintServer::ParseOptions(const std::string& /*options*/) {
    return {};
}

std::optional<std::string> PrintServer::ReadInput(std::chrono::milliseconds /*longest*/,
                                                  std::error_code& /*error*/) {
    return std::string();
}
