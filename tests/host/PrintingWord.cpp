// A stand-in for tests of the host: a Word that opens anything and prints one line of PostScript,
// as an in-process server. All of its objects are one.

#include "tests/support/CountedObject.h"

#include <windows.h>

#include <wx/file.h>
// After the strings, which it takes for granted.
#include <wx/msw/registry.h>

namespace {

constexpr CLSID PrintingClass = {
    0x6b1f0a51, 0x2f0e, 0x4d55, {0x9a, 0x01, 0x5e, 0x2d, 0x8c, 0x10, 0x00, 0x09}};
#define CLASS_TEXT "{6B1F0A51-2F0E-4D55-9A01-5E2D8C100009}"
constexpr char ClassText[] = CLASS_TEXT;
constexpr char ClassKey[] = "CLSID\\" CLASS_TEXT;
constexpr char ServerKey[] = "CLSID\\" CLASS_TEXT "\\InprocServer32";
constexpr char ProgId[] = "Word.Application";
constexpr DISPID PrintOut = 444;
/// What answers an object: Dialog, Documents, Add, Open, Dialogs.
constexpr DISPID Objects[] = {0, 6, 14, 15, 19};

/// The first text of a call's arguments, which are the last first.
const wchar_t* FirstText(const DISPPARAMS& arguments) {
    for (UINT i = arguments.cArgs; i-- > 0;) {
        const VARIANT* value = &arguments.rgvarg[i];
        if (value->vt == (VT_VARIANT | VT_BYREF))
            value = value->pvarVal;
        if (value->vt == VT_BSTR && value->bstrVal)
            return value->bstrVal;
    }
    return nullptr;
}

class Word : public CountedDispatch {
public:
    HRESULT STDMETHODCALLTYPE Invoke(DISPID member, REFIID, LCID, WORD flags, DISPPARAMS* arguments,
                                     VARIANT* result, EXCEPINFO*, UINT*) override {
        if (member == PrintOut && !Print(FirstText(*arguments)))
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

private:
    static bool Print(const wchar_t* path) {
        wxFile file;
        return path && file.Create(path, true) && file.Write(wxString("%!PS-Adobe-3.0\n"));
    }
};

void Enter(const wxString& keyName, const char* valueName, const wxString& text) {
    wxRegKey key(wxRegKey::HKCR, keyName);
    key.Create();
    key.SetValue(valueName, text);
}

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

STDAPI DllRegisterServer() {
    const wxString progId = ProgId;
    Enter(ServerKey, "", SERVER_FILE);
    Enter(ServerKey, "ThreadingModel", "Both");
    Enter(progId, "", "A Word that prints");
    Enter(progId + "\\CLSID", "", ClassText);
    Enter(progId + "\\CurVer", "", progId + ".16");
    return S_OK;
}

STDAPI DllUnregisterServer() {
    for (const char* key : {ProgId, ClassKey})
        wxRegKey(wxRegKey::HKCR, key).DeleteSelf();
    return S_OK;
}
