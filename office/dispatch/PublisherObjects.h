#pragma once

#include "office/dispatch/DispatchWrapper.h"

// Publisher's objects.

namespace publisher {

class Document : public DispatchWrapper {
public:
    using DispatchWrapper::DispatchWrapper;

    void PutActivePrinter(LPCTSTR name);
    void PrintOut(LONG from, LONG to, LPCTSTR printToFile, LONG copies, BOOL collate);
    void Close();
};

class Application : public DispatchWrapper {
public:
    using DispatchWrapper::DispatchWrapper;

    Document Open(LPCTSTR fileName, BOOL readOnly, BOOL addToRecentFiles, LONG saveChanges);
    void Quit();
};

} // namespace publisher
