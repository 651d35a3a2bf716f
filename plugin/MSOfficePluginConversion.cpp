#include "machine/OfficeApplication.h"
#include "office/ExcelDriver.h"
#include "office/PowerPointDriver.h"
#include "office/PublisherDriver.h"
#include "office/WordDriver.h"
#include "plugin/MSOfficePluginImpl.h"
#include "pstools/PS2PDF.h"

#include <wx/filename.h>

int MSOfficePluginImpl::Convert(void* /*reserved*/, const JobItem& item,
                                const wxString& outputFolder, wxString& outputName,
                                ProgressSink* progress) {
    return RunOperation(Result::Failure, [&] {
        if (item.fileName.empty() || item.paths.empty())
            return Result::InputFileNotFound;
        const wxFileName document(item.paths[0]);
        const ResultCode printed = PrintDocument(document, outputFolder, outputName, progress);
        if (printed != Result::Success || m_psOutput)
            return printed;
        return DistillDocument(document, outputFolder, outputName);
    });
}

/// Prints the document into a PostScript file through its application.
ResultCode MSOfficePluginImpl::PrintDocument(const wxFileName& document,
                                             const wxString& outputFolder, wxString& outputName,
                                             ProgressSink* progress) {
    const auto application = ApplicationForExtension(document.GetExt());
    if (!application)
        return Result::InvalidInputFile; // screening makes no such item
    if (!CanConvert())
        return Result::NotInitialized;

    const wxString path = document.GetFullPath();
    switch (*application) {
    case OfficeApplication::Word:
        return PrintWordDocument(path, outputFolder, outputName, progress, &m_printerName);
    case OfficeApplication::Excel:
        return PrintExcelWorkbook(path, outputFolder, outputName, progress, &m_printerName);
    case OfficeApplication::PowerPoint:
        return PrintPowerPointPresentation(path, outputFolder, outputName, progress, &m_printerName,
                                           &m_powerPointOptions);
    case OfficeApplication::Publisher:
        return PrintPublisherDocument(path, outputFolder, outputName, progress, &m_printerName);
    }
    return Result::Failure;
}

/// Makes a PDF file beside the PostScript file that `outputName` names, which stays.
ResultCode MSOfficePluginImpl::DistillDocument(const wxFileName& document,
                                               const wxString& outputFolder, wxString& outputName) {
    const wxString folder = outputFolder + wxFileName::GetPathSeparator();
    const wxString psPath = folder + outputName;
    outputName = document.GetName() + ".pdf";
    return ConvertPS2PDF(psPath, folder + outputName, m_distillerProfile.wc_str())
               ? Result::Success
               : Result::PdfConversionFailed;
}
