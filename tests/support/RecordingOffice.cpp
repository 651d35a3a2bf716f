#include "tests/support/RecordingOffice.h"

#include "tests/support/CountedObject.h"
#include "tests/support/RegistryText.h"

#include <wx/string.h>

#include <gtest/gtest.h>

#include <utility>

struct RecordingOffice::State {
    std::vector<std::string> journal;
    std::map<std::pair<std::string, DISPID>, Action> actions;
    std::size_t liveObjects = 0;
    std::function<void()> onStart = [] {};
    std::function<std::string()> noteAtReleases = [] { return std::string(); };
};

namespace {

/// Which object a member answers; every other member answers nothing.
struct AnsweredObject {
    const char* object;
    DISPID member;
    WORD kind;
    const char* answer;
};

const AnsweredObject AnsweredObjects[] = {
    {"Word", 6, DISPATCH_PROPERTYGET, "Documents"},
    {"Documents", 14, DISPATCH_METHOD, "AddedDocument"},
    {"Documents", 15, DISPATCH_METHOD, "Document"},
    {"Word", 19, DISPATCH_PROPERTYGET, "Dialogs"},
    {"Dialogs", 0, DISPATCH_METHOD, "Dialog"},
    {"Excel", 572, DISPATCH_PROPERTYGET, "Workbooks"},
    {"Workbooks", 682, DISPATCH_METHOD, "Workbook"},
    {"PowerPoint", 2001, DISPATCH_PROPERTYGET, "Presentations"},
    {"Presentations", 2004, DISPATCH_METHOD, "Presentation"},
    {"Presentation", 2033, DISPATCH_PROPERTYGET, "PrintOptions"},
    {"Publisher", 38, DISPATCH_METHOD, "Publication"},
};

std::string Utf8(const wchar_t* text) {
    return std::string(wxString(text ? text : L"").utf8_str());
}

std::string Described(const VARIANT& value) {
    switch (value.vt) {
    case VT_VARIANT | VT_BYREF:
        return "&" + Described(*value.pvarVal);
    case VT_I2:
        return "I2 " + std::to_string(value.iVal);
    case VT_I4:
        return "I4 " + std::to_string(value.lVal);
    case VT_BOOL:
        return value.boolVal == VARIANT_TRUE    ? "true"
               : value.boolVal == VARIANT_FALSE ? "false"
                                                : "BOOL " + std::to_string(value.boolVal);
    case VT_BSTR:
        return '"' + Utf8(value.bstrVal) + '"';
    case VT_ERROR:
        return value.scode == DISP_E_PARAMNOTFOUND ? "omitted" : "another error";
    default:
        return "type " + std::to_string(value.vt);
    }
}

const char* KindName(WORD flags) {
    switch (flags) {
    case DISPATCH_METHOD:
        return "method";
    case DISPATCH_PROPERTYGET:
        return "get";
    case DISPATCH_PROPERTYPUT:
        return "put";
    default:
        return "another kind";
    }
}

using SharedState = std::shared_ptr<RecordingOffice::State>;

class RecordingObject final : public CountedDispatch {
public:
    RecordingObject(std::string name, SharedState state)
        : m_name(std::move(name)), m_state(std::move(state)) {
        ++m_state->liveObjects;
    }

    HRESULT STDMETHODCALLTYPE Invoke(DISPID member, REFIID /*reserved*/, LCID /*locale*/,
                                     WORD flags, DISPPARAMS* arguments, VARIANT* result,
                                     EXCEPINFO* exception, UINT* /*badArgument*/) override {
        Note(member, flags, *arguments);
        try {
            const auto action = m_state->actions.find({m_name, member});
            if (action != m_state->actions.end())
                action->second(TextsOf(*arguments));
        } catch (const RecordingOffice::Raise& raised) {
            exception->bstrSource = SysAllocString(L"Recording Office");
            exception->bstrDescription = SysAllocString(raised.description.c_str());
            exception->scode = E_FAIL;
            return DISP_E_EXCEPTION;
        } catch (const RecordingOffice::Fail& failed) {
            return failed.result;
        }
        Answer(member, flags, result);
        return S_OK;
    }

private:
    void LastReferenceGone() override {
        m_state->journal.push_back("~" + m_name + m_state->noteAtReleases());
        --m_state->liveObjects;
        delete this;
    }

    void Note(DISPID member, WORD flags, const DISPPARAMS& arguments) {
        std::string line = m_name + "." + std::to_string(member) + " " + KindName(flags);
        if (flags == DISPATCH_PROPERTYPUT &&
            (arguments.cNamedArgs != 1 || arguments.rgdispidNamedArgs[0] != DISPID_PROPERTYPUT))
            line += " unnamed";
        for (UINT i = arguments.cArgs; i-- > 0;)
            line += (i + 1 == arguments.cArgs ? " (" : ", ") + Described(arguments.rgvarg[i]);
        m_state->journal.push_back(line + (arguments.cArgs > 0 ? ")" : ""));
    }

    void Answer(DISPID member, WORD flags, VARIANT* result) {
        for (const AnsweredObject& answered : AnsweredObjects) {
            if (result && m_name == answered.object && member == answered.member &&
                flags == answered.kind) {
                result->vt = VT_DISPATCH;
                result->pdispVal = new RecordingObject(answered.answer, m_state);
            }
        }
    }

    std::string m_name;
    SharedState m_state;
};

class RecordingClass final : public Counted<IClassFactory> {
public:
    RecordingClass(std::string name, SharedState state)
        : Counted(IID_IClassFactory), m_name(std::move(name)), m_state(std::move(state)) {}

    HRESULT STDMETHODCALLTYPE CreateInstance(IUnknown* /*outer*/, REFIID iid,
                                             void** object) override {
        try {
            m_state->onStart();
        } catch (const RecordingOffice::Fail& failed) {
            return failed.result;
        }
        auto* created = new RecordingObject(m_name, m_state);
        const HRESULT result = created->QueryInterface(iid, object);
        created->Release();
        return result;
    }
    HRESULT STDMETHODCALLTYPE LockServer(BOOL /*lock*/) override { return S_OK; }

private:
    void LastReferenceGone() override { delete this; }

    std::string m_name;
    SharedState m_state;
};

/// A class id that no other application of this process has had.
CLSID NewClassId() {
    static CLSID last = {
        0x6b1f0a51, 0x2f0e, 0x4d55, {0x9a, 0x01, 0x5e, 0x2d, 0x8c, 0x10, 0x00, 0x01}};
    ++last.Data1;
    return last;
}

void EnterProgId(const std::wstring& progId, const CLSID& clsid, int version) {
    wchar_t classId[40];
    StringFromGUID2(clsid, classId, 40);
    WriteRegistryText(HKEY_CLASSES_ROOT, progId, L"", L"Recording " + progId);
    WriteRegistryText(HKEY_CLASSES_ROOT, progId + L"\\CLSID", L"", classId);
    if (version != 0)
        WriteRegistryText(HKEY_CLASSES_ROOT, progId + L"\\CurVer", L"",
                          progId + L"." + std::to_wstring(version));
}

} // namespace

RecordingOffice::RecordingOffice(const std::vector<std::wstring>& progIds, int version)
    : m_state(std::make_shared<State>()), m_progIds(progIds) {
    CoInitialize(nullptr);
    for (const std::wstring& progId : progIds) {
        const CLSID clsid = NewClassId();
        EnterProgId(progId, clsid, version);
        const wxString object = wxString(progId).BeforeFirst('.'); // Word of Word.Application
        auto* classObject = new RecordingClass(object.ToStdString(), m_state);
        DWORD cookie = 0;
        EXPECT_EQ(S_OK, CoRegisterClassObject(clsid, classObject, CLSCTX_INPROC_SERVER,
                                              REGCLS_MULTIPLEUSE, &cookie));
        classObject->Release();
        m_cookies.push_back(cookie);
    }
}

RecordingOffice::~RecordingOffice() {
    for (const DWORD cookie : m_cookies)
        CoRevokeClassObject(cookie);
    for (const std::wstring& progId : m_progIds)
        RegDeleteTreeW(HKEY_CLASSES_ROOT, progId.c_str());
    CoUninitialize();
}

void RecordingOffice::On(const std::string& object, DISPID member, Action action) {
    m_state->actions[{object, member}] = std::move(action);
}

void RecordingOffice::OnStart(std::function<void()> action) {
    m_state->onStart = std::move(action);
}

void RecordingOffice::NoteAtReleases(std::function<std::string()> note) {
    m_state->noteAtReleases = std::move(note);
}

const std::vector<std::string>& RecordingOffice::Journal() const {
    return m_state->journal;
}

std::vector<std::string> RecordingOffice::JournalInShort() const {
    std::vector<std::string> lines;
    for (const std::string& line : m_state->journal)
        lines.push_back(line.substr(0, line.find(' ')));
    return lines;
}

std::size_t RecordingOffice::LiveObjects() const {
    return m_state->liveObjects;
}
