#include "pstools/DistillerDiscovery.h"

#include "machine/Distiller.h"
#include "machine/FiltersFolder.h"

void GetFiltersFolder(wxString& folder) {
    folder = FindFiltersFolder().value_or(folder);
}

void GetJobOptionsFolder(wxString& folder) {
    const std::optional<Distiller> distiller = FindDistiller();
    if (distiller && distiller->jobOptionsFolder)
        folder = *distiller->jobOptionsFolder;
}

void GetDistillerProfiles(wxArrayString& profiles) {
    for (const wxString& profile : ListDistillerProfiles())
        profiles.Add(profile);
}
