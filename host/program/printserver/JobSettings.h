#pragma once

#include "host/program/base/Fault.h"

#include <map>
#include <optional>
#include <set>
#include <string>
#include <vector>

/// A job's options by name.
using JobOptions = std::map<std::string, std::string>;

/// The names of the options that a printer has by its description, in capital letters.
/// @param ppd its file; may be missing
std::set<std::string> OptionsOfPrinter(const std::string& ppd);

/// What a job's options say of the settings that documents are printed with. Those that say nothing
/// of them are others' business: the spooler's, the next filter's, the printer's.
/// @param ofPrinter names that are the printer's, whatever setting is called so
/// @param fault receives why there is no result: a setting that does not have this value
/// @return as KEY=VALUE
std::optional<std::vector<std::string>>
SettingsOfJob(const JobOptions& options, const std::set<std::string>& ofPrinter, Fault& fault);
