#include "tests/ui/settings/SettingsWindow.h"

#include "common/WQServices.h"
#include "host/program/settings/ChoiceTexts.h"
#include "host/program/settings/RunSettings.h"
#include "host/services/CatalogueLoader.h"
#include "tests/support/RegistryText.h"

#include <wx/app.h>
#include <wx/choice.h>
#include <wx/utils.h>

#include <chrono>

namespace {

constexpr wchar_t DistillerKey[] = L"SOFTWARE\\Adobe\\Acrobat Distiller\\9.0";

} // namespace

SettingsWindow::SettingsWindow() {
    Speak("en");
    WQTranslations::GetInstance().ReadFolder(QUILLON_BIN "/locale");
    m_office.emplace(std::vector<std::wstring>{L"Word.Application", L"PowerPoint.Application"});
    const std::wstring ppd = m_folder.Write("a.ppd", "x").wstring();
    m_printers[0].emplace(L"Quillon PostScript File Printer", L"Test driver", ppd);
    m_printers[1].emplace(L"Proofer", L"Test driver", ppd);
    std::filesystem::create_directory(m_folder / "profiles");
    m_folder.Write("profiles/Press Quality.joboptions", "x");
    m_folder.Write("profiles/Print.joboptions", "x");
    WriteRegistryText(HKEY_LOCAL_MACHINE, DistillerKey, L"JobOptionsFolder",
                      (m_folder / "profiles").wstring());
}

SettingsWindow::~SettingsWindow() {
    RegDeleteTreeW(HKEY_LOCAL_MACHINE, DistillerKey);
    Speak("en");
}

void SettingsWindow::Speak(const wxString& language) {
    auto* translations = new wxTranslations;
    wxTranslations::Set(translations); // owns it
    translations->SetLoader(new CatalogueLoader(QUILLON_BIN "/locale"));
    translations->SetLanguage(language);
    translations->AddCatalog(CatalogueDomain);
}

int SettingsWindow::Open(const std::function<void()>& user) {
    const FilterSet filters(QUILLON_FILTERS);
    Fault fault;
    std::optional<Settings> settings = Settings::LoadForEditing(m_file, fault);
    EXPECT_TRUE(settings) << fault.what;
    if (!settings)
        return wxID_NONE;
    FillIn(*settings);
    TranslateChoices(*settings);
    SettingsDialogue window(filters, *settings, m_file);
    m_window = &window;
    window.CallAfter([this, &user] {
        EXPECT_TRUE(Until([this] { return m_window->IsShownOnScreen(); }));
        // Without a window manager, the keys go to the window under the mouse.
        wxUIActionSimulator().MouseMove(m_window->GetScreenPosition() + wxPoint(30, 12));
        EXPECT_TRUE(Until([this] { return m_window->IsActive() && Focused(); }));
        user();
        if (m_window->IsShown())
            m_window->EndModal(wxID_NONE);
    });
    const int end = window.ShowModal();
    m_window = nullptr;
    return end;
}

wxWindow* SettingsWindow::Find(int id) const {
    wxWindow* const window = m_window->FindWindow(id);
    EXPECT_TRUE(window) << id;
    return window;
}

wxRect SettingsWindow::Place(const wxWindow* window) const {
    return {window->GetScreenPosition(), window->GetSize()};
}

void SettingsWindow::Activate(int id) {
    Find(id)->SetFocus();
    EXPECT_TRUE(Until([&] { return Focused() == Find(id); })) << id;
    Press(WXK_SPACE);
}

void SettingsWindow::Press(int key) {
    wxUIActionSimulator().Char(key);
}

void SettingsWindow::Choose(int id, const wxString& entry) {
    auto* choice = dynamic_cast<wxChoice*>(Find(id));
    ASSERT_TRUE(choice->SetStringSelection(entry)) << entry;
    wxCommandEvent event(wxEVT_CHOICE, id);
    event.SetEventObject(choice);
    event.SetInt(choice->GetSelection());
    choice->ProcessWindowEvent(event);
}

bool SettingsWindow::Until(const std::function<bool()>& condition) {
    const auto end = std::chrono::steady_clock::now() + std::chrono::seconds(10);
    while (!condition() && std::chrono::steady_clock::now() < end) {
        wxTheApp->Yield(true);
        wxMilliSleep(1);
    }
    return condition();
}

void ForEachBelow(wxWindow* window, const std::function<void(wxWindow*)>& visit) {
    for (wxWindow* child : window->GetChildren()) {
        visit(child);
        ForEachBelow(child, visit);
    }
}
