#include "host/program/watch/PrinterPdf.h"

#include "host/program/base/PathText.h"
#include "host/program/printing/Submission.h"
#include "host/program/settings/Settings.h"
#include "plugin/settings/FilterSettings.h"

namespace fs = std::filesystem;

bool AskForPdf(std::string& xml) {
    Fault ignored;
    std::optional<Settings> settings = Settings::FromXml(xml, ignored);
    if (!settings)
        return false;
    const bool didNot = settings->Value(FilterSettings::OutputPS.key) == "1";
    settings->Set(FilterSettings::OutputPS.key, "0");
    settings->Set(FilterSettings::OutputPDF.key, "1");
    xml = settings->Xml();
    return didNot;
}

void SetPdfAside(Job& job) {
    const fs::path made = job.workplace / FromText(job.product);
    fs::path postScript = made;
    postScript.replace_extension(".ps");
    std::error_code error;
    if (made == postScript || !fs::is_regular_file(postScript, error))
        return; // there is nothing else to deliver
    const fs::path folder = job.workplace / ForPrinterFolder;
    fs::create_directory(folder, error);
    fs::rename(made, folder / made.filename(), error);
    if (!error)
        job.product = ToText(postScript.filename());
}
