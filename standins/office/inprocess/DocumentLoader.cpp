#include "standins/office/inprocess/DocumentLoader.h"

#include "standins/inprocess/HostRecord.h"
#include "standins/office/inprocess/Call.h"
#include "standins/office/inprocess/EngineRun.h"
#include "standins/office/inprocess/Protection.h"
#include "standins/shared/Text.h"

namespace standins {

namespace {

[[noreturn]] void RaiseCannotOpen(const std::wstring& path, const Failure& failure) {
    throw Raised{FileName(path) + L" cannot be opened: " + FromUtf8(failure.reason) + L".",
                 failure};
}

[[noreturn]] void RaiseCannotLoad(const std::wstring& path, const Failure& failure) {
    const bool isProtected = failure.fault == Fault::Document && IsPasswordProtected(path);
    RaiseCannotOpen(path, isProtected ? Failure{"it is protected by a password"} : failure);
}

/// Not again when it is known.
Export LoadOnce(const std::wstring& path, const DocumentFile& document,
                const DocumentFormat& format) {
    ExportCache& cache = ExportCache::Instance();
    if (Export known = cache.Find(path, document, format))
        return known;
    EngineResult result = RunEngine(path, document, format);
    if (result.failure)
        RaiseCannotLoad(path, result.failure);
    Export output =
        std::make_shared<const MadeFile>(MadeFile{std::move(result.output), result.fonts});
    cache.Add(path, document, format, result.sha256, output);
    if (result.hiddenOutput.IsOpen()) {
        DocumentFormat hidden = format;
        hidden.exportTo = format.hiddenTo;
        cache.Add(path, document, hidden, result.sha256,
                  std::make_shared<const MadeFile>(
                      MadeFile{std::move(result.hiddenOutput), result.fonts}));
    }
    return output;
}

} // namespace

const DocumentFormat& FormatOf(const std::wstring& path,
                               const std::vector<DocumentFormat>& formats) {
    const DocumentFormat* format = FindFormat(formats, path);
    if (!format)
        RaiseCannotOpen(path, {"it is not a document of this application"});
    return *format;
}

DocumentFile OpenDocument(const std::wstring& path) {
    Failure failure;
    DocumentFile document = OpenDocumentFile(path, failure);
    if (!document.descriptor.IsOpen())
        RaiseCannotOpen(path, failure);
    return document;
}

Export LoadDocument(const std::wstring& path, const DocumentFile& document,
                    const DocumentFormat& format) {
    Export output = LoadOnce(path, document, format);
    LeaveFonts(output->fonts);
    return output;
}

} // namespace standins
