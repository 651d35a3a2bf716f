#include "tests/ui/settings/SettingsWindow.h"

#include "common/WQServices.h"
#include "host/program/settings/ChoiceTexts.h"
#include "host/program/settings/RunSettings.h"
#include "host/services/CatalogueLoader.h"

SettingsWindow::SettingsWindow() {
    Speak("en");
    WQTranslations::GetInstance().ReadFolder(QUILLON_BIN "/locale");
    Install({{L"Word.Application", L"PowerPoint.Application"},
             16,
             {L"Quillon PostScript File Printer", L"Proofer"},
             {"Press Quality.joboptions", "Print.joboptions"}});
}

SettingsWindow::~SettingsWindow() {
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

void ForEachBelow(wxWindow* window, const std::function<void(wxWindow*)>& visit) {
    for (wxWindow* child : window->GetChildren()) {
        visit(child);
        ForEachBelow(child, visit);
    }
}
