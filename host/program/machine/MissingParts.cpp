#include "host/program/machine/MissingParts.h"

#include "host/program/base/PathText.h"
#include "host/program/base/Reasons.h"
#include "host/program/machine/Engines.h"
#include "host/program/machine/FilePrinter.h"
#include "host/program/system/InstallAdvice.h"
#include "machine/FiltersFolder.h"
#include "machine/InstalledOffice.h"
#include "plugin/interface/ResultCodes.h"

#include <wx/filename.h>
#include <wx/intl.h>

#include <algorithm>
#include <iterator>

namespace {

Fault Missing(const wxString& what, const wxString& advice, int code = Result::NotInitialized) {
    return {what, Blame::Machine, code, advice};
}

wxString OrPostScript(const wxString& advice) {
    return wxString::Format(_("%s; or ask for PostScript with --ps"), advice);
}

int NotInstalledCode(OfficeApplication application) {
    switch (application) {
    case OfficeApplication::Word:
        return Result::WordNotInstalled;
    case OfficeApplication::Excel:
        return Result::ExcelNotInstalled;
    case OfficeApplication::PowerPoint:
        return Result::PowerPointNotInstalled;
    case OfficeApplication::Publisher:
        return Result::PublisherNotInstalled;
    }
    return Result::NotInitialized;
}

bool IsDrivable(OfficeApplication application) {
    return InstallationOf(application) == OfficeInstallation::Drivable;
}

std::optional<Fault> FindMissingVersion(OfficeApplication application, const wxString& extension) {
    if (!IsOpenXmlExtension(extension) || ReadsOpenXml(application))
        return std::nullopt;
    const unsigned long version = RegisteredVersionOf(application);
    const wxString found =
        version ? wxString::Format(_("%s is version %lu"), NameOf(application), version)
                : wxString::Format(_("%s does not say its version"), NameOf(application));
    return Missing(
        wxString::Format(_("%s, and .%s files need version 12 or later"), found, extension.Lower()),
        InstallAdvice(ProgIdOf(application)));
}

} // namespace

std::optional<Fault> FindMissingOffice() {
    if (std::any_of(std::begin(AllOfficeApplications), std::end(AllOfficeApplications), IsDrivable))
        return std::nullopt;
    return Missing(IsOfficeInstalled() ? _("The only Office application is a Publisher of Office "
                                           "97 or 2000, too old to be driven")
                                       : _("No Office application is installed"),
                   InstallAdvice({}));
}

std::optional<Fault> FindMissingApplication(OfficeApplication application) {
    if (IsDrivable(application))
        return std::nullopt;
    const wxString name = NameOf(application);
    const wxString advice = InstallAdvice(ProgIdOf(application));
    return IsInstalled(application)
               ? Missing(
                     wxString::Format(_("%s is of Office 97 or 2000, too old to be driven"), name),
                     advice, Result::PublisherTooOld)
               : Missing(wxString::Format(_("%s is not installed"), name), advice,
                         NotInstalledCode(application));
}

std::optional<Fault> FindMissingPrinter() {
    if (PreferredPrinter(ListPrinters()))
        return std::nullopt;
    return Missing(_("There is no PostScript printer"),
                   _("Install the program anew, which brings one, or add one to the system"));
}

std::optional<Fault> FindMissingPdfMaker() {
    const std::filesystem::path bridge =
        FromText(FindFiltersFolder().value_or(wxString()) + wxFileName::GetPathSeparator() +
                 DistillerBridgeFile);
    std::error_code ignored;
    if (!std::filesystem::is_regular_file(bridge, ignored))
        return Missing(
            wxString::Format(_("The library that makes PDF files is missing: %s"), Shown(bridge)),
            OrPostScript(_("Install the program anew")), Result::PdfConversionFailed);
    if (PdfEngine().empty())
        return Missing(_("There is nothing to make PDF files with"),
                       OrPostScript(PdfInstallAdvice()), Result::PdfConversionFailed);
    return std::nullopt;
}

std::optional<Fault> FindMissingIsolation() {
    const std::optional<EngineIsolation> isolation = IsolationOfEngines();
    if (isolation && isolation->missing.empty())
        return std::nullopt;
    return Missing(isolation ? TranslateReason(isolation->missing)
                             : _("the applications open documents with all rights of the user"),
                   _("Work on a system that has what is missing, or without --require-isolation"));
}

std::optional<Fault> FindMissingFor(const wxString& extension) {
    const std::optional<OfficeApplication> application = ApplicationForExtension(extension);
    if (!application)
        return std::nullopt;
    std::optional<Fault> missing = FindMissingApplication(*application);
    if (!missing)
        missing = FindMissingVersion(*application, extension);
    return missing ? missing : FindMissingPrinter();
}

std::optional<Fault> FindMissingForPanel() {
    // With a server as new as the one that the host speaks of, a missing printer disables nothing.
    if (IsOfficeInstalled())
        return std::nullopt;
    return Missing(_("no Office application is installed"), InstallAdvice({}));
}
