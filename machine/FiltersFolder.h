#pragma once

#include <wx/string.h>

#include <optional>

/// Under HKEY_LOCAL_MACHINE: the host. Its folder has the folder of filters in it.
constexpr char HostKey[] = "SOFTWARE\\Orvanta\\Marlo Quillon";
constexpr char InstallPathValue[] = "InstallPath";

/// The library in the folder of filters that hands PostScript files to Distiller.
constexpr char DistillerBridgeFile[] = "orv_dist.dll";

/// Looks for the host's folder of filters.
/// @return its path, without a separator at its end; nothing when the host has not entered where it
/// is installed
std::optional<wxString> FindFiltersFolder();
