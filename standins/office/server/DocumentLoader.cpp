#include "standins/office/server/DocumentLoader.h"

#include "standins/module/Text.h"
#include "standins/office/server/Call.h"
#include "standins/office/server/EngineRun.h"
#include "standins/office/server/Protection.h"

#include <windows.h>

namespace standins {

namespace {

[[noreturn]] void RaiseCannotOpen(const std::wstring& path, const std::wstring& reason) {
    throw Raised{FileName(path) + L" cannot be opened: " + reason + L"."};
}

[[noreturn]] void RaiseCannotLoad(const std::wstring& path, const std::wstring& reason) {
    if (!IsPasswordProtected(path))
        RaiseCannotOpen(path, reason);
    OutputDebugStringW((path + L": protected by a password").c_str());
    RaiseCannotOpen(path, L"it is protected by a password");
}

} // namespace

Pdf LoadDocument(const std::wstring& path, const std::vector<DocumentFormat>& formats) {
    const DocumentFormat* format = FindFormat(formats, path);
    if (!format)
        RaiseCannotOpen(path, L"it is not a document of this application");
    std::wstring failure;
    const DocumentFile document = OpenDocumentFile(path, failure);
    if (!document.descriptor.IsOpen())
        RaiseCannotOpen(path, failure);

    PdfCache& cache = PdfCache::Instance();
    if (Pdf known = cache.Find(document, *format))
        return known;
    EngineResult result = RunEngine(document, *format);
    if (!result.pdf.IsOpen())
        RaiseCannotLoad(path, result.failure);
    Pdf pdf = std::make_shared<const Descriptor>(std::move(result.pdf));
    cache.Add(document, *format, result.sha256, pdf);
    return pdf;
}

} // namespace standins
