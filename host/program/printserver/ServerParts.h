#pragma once

#include "host/program/base/Fault.h"
#include "host/program/system/PrintServer.h"

#include <filesystem>
#include <optional>
#include <string>
#include <vector>

/// A file that the print server needs to have Office documents converted by this program.
struct ServerPart {
    enum class State {
        Missing,
        InPlace,
        Outdated, ///< of another version, or of a program elsewhere
        Foreign,  ///< somebody else's, who has given it the same name
    };

    const char* meaning; ///< what it is, in English, marked for translation
    std::filesystem::path path;
    std::string text;
    bool isProgram = false;

    State Look() const;

    /// Writes it, in place of what is there.
    std::optional<Fault> PutIn() const;

    std::optional<Fault> TakeOut() const;
};

/// @param program this one's file, or that which is to be called in its place
std::vector<ServerPart> PartsFor(const PrintServer::Folders& folders,
                                 const std::filesystem::path& program);
