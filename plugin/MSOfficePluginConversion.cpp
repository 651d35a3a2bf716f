#include "office/OfficeApplication.h"
#include "office/WordDriver.h"
#include "plugin/Boundary.h"
#include "plugin/MSOfficePluginImpl.h"

#include <wx/filename.h>

int MSOfficePluginImpl::Convert(void* /*reserved*/, const JobItem& item,
                                const wxString& outputFolder, wxString& outputName,
                                ProgressSink* progress) {
    return AtBoundary(Result::Failure, [&] {
        if (item.fileName.empty() || item.paths.empty())
            return m_lastResult = Result::InputFileNotFound;
        const wxFileName input(item.paths[0]);
        m_lastResult = PrintDocument(input, outputFolder, outputName, progress);
        return m_lastResult;
    });
}

ResultCode MSOfficePluginImpl::PrintDocument(const wxFileName& input, const wxString& outputFolder,
                                             wxString& outputName, ProgressSink* progress) {
    const auto application = ApplicationForExtension(input.GetExt());
    if (!application)
        return Result::InvalidInputFile; // screening makes no such item
    if (!CanConvert())
        return Result::NotInitialized;

    const wxString path = input.GetFullPath();
    switch (*application) {
    case OfficeApplication::Word:
        return PrintWordDocument(path, outputFolder, outputName, progress, &m_printerName);
    default:
        return Result::ConversionFailed;
    }
}
