#pragma once

#include "host/program/system/Spooler.h"

class ConfigurationValue;

/// How a watched folder's documents are printed.
struct PrintConfiguration {
    PrintTicket ticket;
    bool keepsFiles = false;     ///< which come to the folder for output when they are printed
    bool printsLost = false;     ///< what the server has lost; otherwise a person is asked
    std::size_t mostQueued = 50; ///< jobs of this user's at a time
};

/// Reads a folder's table "print".
/// @throw Misfit see ConfigurationValue
PrintConfiguration ReadPrinting(const ConfigurationValue& table);
