// A Word for tests of the host that opens anything and prints one line of PostScript: an in-process
// server, entered in the registry by the test. All of its objects are one.

#include "tests/support/CountedObject.h"

#include <wx/file.h>

namespace {

constexpr CLSID PrintingClass = {
    0x6b1f0a51, 0x2f0e, 0x4d55, {0x9a, 0x01, 0x5e, 0x2d, 0x8c, 0x10, 0x00, 0x09}};
constexpr DISPID PrintOut = 444;
/// What answers an object: Dialog, Documents, Add, Open, Dialogs.
constexpr DISPID Objects[] = {0, 6, 14, 15, 19};

bool Print(const std::vector<std::wstring>& texts) {
    wxFile file;
    return !texts.empty() && file.Create(texts.front(), true) &&
           file.Write(wxString("%!PS-Adobe-3.0\n"));
}

class Word : public CountedDispatch {
public:
    HRESULT STDMETHODCALLTYPE Invoke(DISPID member, REFIID, LCID, WORD flags, DISPPARAMS* arguments,
                                     VARIANT* result, EXCEPINFO*, UINT*) override {
        if (member == PrintOut && !Print(TextsOf(*arguments)))
            return E_INVALIDARG;
        if (result && flags != DISPATCH_PROPERTYPUT)
            for (const DISPID each : Objects)
                if (each == member) {
                    result->vt = VT_DISPATCH;
                    result->pdispVal = this;
                    AddRef();
                }
        return S_OK;
    }
};

} // namespace

STDAPI DllGetClassObject(REFCLSID clsid, REFIID iid, LPVOID* object) {
    static CountedFactory<Word> wordClass;
    *object = nullptr;
    return clsid == PrintingClass ? wordClass.QueryInterface(iid, object)
                                  : CLASS_E_CLASSNOTAVAILABLE;
}

STDAPI DllCanUnloadNow() {
    return S_FALSE;
}
