#pragma once

#include <wx/string.h>

#include <optional>
#include <vector>

/// Acrobat Distiller as the registry tells of it.
struct Distiller {
    wxString version; ///< "9.0"; empty when only a user's settings tell of it
    std::optional<wxString> jobOptionsFolder; ///< where its profiles lie
};

/// Looks for the newest Distiller, whatever else it has entered.
std::optional<Distiller> FindDistiller();

/// The folder of the user's own profiles.
/// @return empty when there is none
wxString UserProfilesFolder();

/// Lists the profiles (job options) that Distiller can be told to use: the user's own in the order
/// of the folder, then Distiller's in alphabetical order.
/// @return file names with extension, without folder; one that is in both places occurs twice
std::vector<wxString> ListDistillerProfiles();
