#include "office/dispatch/PublisherObjects.h"

namespace publisher {

void Document::PutActivePrinter(LPCTSTR name) {
    Put(1, VTS_BSTR, name);
}

void Document::PrintOut(LONG from, LONG to, LPCTSTR printToFile, LONG copies, BOOL collate) {
    Call(54, VTS_I4 VTS_I4 VTS_BSTR VTS_I4 VTS_BOOL, from, to, printToFile, copies, collate);
}

void Document::Close() {
    Call(48, VTS_NONE);
}

Document Application::Open(LPCTSTR fileName, BOOL readOnly, BOOL addToRecentFiles,
                           LONG saveChanges) {
    return CallForObject<Document>(38, VTS_BSTR VTS_BOOL VTS_BOOL VTS_I4, fileName, readOnly,
                                   addToRecentFiles, saveChanges);
}

void Application::Quit() {
    Call(39, VTS_NONE);
}

} // namespace publisher
