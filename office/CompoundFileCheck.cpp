#include "office/CompoundFileCheck.h"

#include "office/AutomationScope.h"
#include "office/ComPointer.h"
#include "plugin/interface/ResultCodes.h"

#include <ole2.h>

#include <initializer_list>

namespace {

/// @param streamNames the streams that a document may be kept in; one suffices
int CheckForStream(const wxString& path, std::initializer_list<const wchar_t*> streamNames) {
    ComPointer<IStorage> storage;
    if (FAILED(StgOpenStorage(path.wc_str(), nullptr, STGM_READ | STGM_SHARE_DENY_WRITE, nullptr, 0,
                              storage.Receive())))
        return Result::InvalidInputFile;

    ComPointer<IStream> stream;
    for (const wchar_t* name : streamNames)
        if (SUCCEEDED(storage->OpenStream(name, nullptr, STGM_READ | STGM_SHARE_EXCLUSIVE, 0,
                                          stream.Receive())))
            return Result::Success;
    return Result::InvalidInputFile;
}

} // namespace

int CheckWordCompoundFile(const wxString& path) {
    if (path.empty())
        return Result::InputFileNotFound;
    const AutomationScope scope;
    return CheckForStream(path, {L"WordDocument"});
}

int CheckExcelCompoundFile(const wxString& path) {
    if (path.empty())
        return Result::InputFileNotFound;
    const AutomationScope scope;
    if (!scope.IsComInitialised()) // Excel's files alone are not looked at without COM
        return Result::InvalidInputFile;
    return CheckForStream(path, {L"Workbook", L"Book"});
}

int CheckPowerPointCompoundFile(const wxString& path) {
    if (path.empty())
        return Result::InputFileNotFound;
    const AutomationScope scope;
    return CheckForStream(path, {L"PowerPoint Document", L"PP40"});
}

int CheckPublisherFile(const wxString& path) {
    if (path.empty())
        return Result::InputFileNotFound;
    const AutomationScope scope;
    return CheckForStream(path, {L"Contents"});
}
