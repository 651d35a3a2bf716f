#include "standins/office/server/word/WordDialogs.h"

#include "standins/office/server/word/PrintSetupDialog.h"

namespace standins {

const std::vector<Member>& WordDialogs::Members() const {
    static const std::vector<Member> members = {
        {DISPID_VALUE, DISPATCH_METHOD, L"Item", 1, 1, Handle<&WordDialogs::Item>},
    };
    return members;
}

void WordDialogs::Item(Call& call) {
    constexpr LONG FilePrintSetup = 97; // wdDialogFilePrintSetup
    const LONG index = call.Number(0);
    if (index != FilePrintSetup)
        throw Raised{L"There is no dialog number " + std::to_wstring(index) + L"."};
    call.Return(MakeObject<PrintSetupDialog>(TheSession()));
}

} // namespace standins
