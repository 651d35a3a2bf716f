#include "tests/ui/UiTest.h"

#include "tests/support/RegistryText.h"

#include <wx/app.h>
#include <wx/checkbox.h>
#include <wx/radiobut.h>
#include <wx/utils.h>

#include <chrono>

namespace {

constexpr wchar_t DistillerKey[] = L"SOFTWARE\\Adobe\\Acrobat Distiller\\9.0";

} // namespace

UiTest::UiTest() {
    RegDeleteTreeW(HKEY_LOCAL_MACHINE, DistillerKey);
}

UiTest::~UiTest() {
    RegDeleteTreeW(HKEY_LOCAL_MACHINE, DistillerKey);
}

void UiTest::Install(const Machine& machine) {
    m_office.emplace(machine.applications, machine.officeVersion);
    m_printers.clear();
    const std::wstring ppd = m_folder.Write("a.ppd", "x").wstring();
    for (const std::wstring& printer : machine.printers)
        m_printers.push_back(std::make_unique<TestPrinter>(printer, L"Test driver", ppd));
    const std::filesystem::path profiles = m_folder / "profiles";
    std::filesystem::create_directories(profiles);
    for (const char* profile : machine.profiles)
        m_folder.Write(profiles / profile, "x");
    WriteRegistryText(HKEY_LOCAL_MACHINE, DistillerKey, L"JobOptionsFolder", profiles.wstring());
}

wxWindow* UiTest::Find(int id) const {
    wxWindow* const window = Window()->FindWindow(id);
    EXPECT_TRUE(window) << id;
    return window;
}

bool UiTest::IsTicked(int id) const {
    if (const auto* box = dynamic_cast<const wxCheckBox*>(Find(id)))
        return box->GetValue();
    return dynamic_cast<wxRadioButton*>(Find(id))->GetValue();
}

std::string UiTest::Selection(int id) const {
    return Choice(id)->GetStringSelection().utf8_string();
}

void UiTest::Choose(int id, const wxString& entry) {
    ASSERT_TRUE(Choice(id)->SetStringSelection(entry)) << entry;
    Tell(wxEVT_CHOICE, id, Choice(id)->GetSelection());
}

void UiTest::Tell(wxEventType type, int id, int value) {
    wxCommandEvent event(type, id);
    event.SetEventObject(Find(id));
    event.SetInt(value);
    Find(id)->ProcessWindowEvent(event);
}

bool UiTest::Until(const std::function<bool()>& condition) {
    const auto end = std::chrono::steady_clock::now() + std::chrono::seconds(10);
    while (!condition() && std::chrono::steady_clock::now() < end) {
        wxTheApp->Yield(true);
        wxMilliSleep(1);
    }
    return condition();
}
