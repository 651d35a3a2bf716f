#include "host/program/machine/Engines.h"

#include "host/program/machine/StandInKeys.h"
#include "machine/Distiller.h"
#include "machine/RegistryText.h"

namespace {

wxString EngineOf(const char* standIn) {
    return ReadRegistryText(wxRegKey::HKLM, standIn, EngineValue).value_or(wxString());
}

} // namespace

std::optional<EngineIsolation> IsolationOfEngines() {
    const auto read = [](const char* value) {
        return ReadRegistryText(wxRegKey::HKLM, IsolationKey, value);
    };
    const std::optional<wxString> means = read(IsolationMeansValue);
    if (!means)
        return std::nullopt;
    return EngineIsolation{*means, read(IsolationMissingValue).value_or(wxString())};
}

wxString OfficeEngine() {
    return EngineOf(StandInsKey);
}

std::optional<wxString> OfficeEngineKeepingObstacle() {
    return ReadRegistryText(wxRegKey::HKLM, StandInsKey, KeepingObstacleValue);
}

wxString PdfEngine() {
    const wxString standIn = EngineOf(DistillerStandInKey);
    const std::optional<Distiller> distiller = FindDistiller();
    if (!standIn.empty() || !distiller)
        return standIn;
    return ("Acrobat Distiller " + distiller->version).Trim();
}
