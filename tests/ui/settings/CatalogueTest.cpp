#include "host/program/window/MessageBar.h"
#include "host/services/CatalogueLoader.h"
#include "plugin/interface/ControlIds.h"
#include "plugin/settings/FilterSettings.h"
#include "tests/ui/settings/SettingsWindow.h"

#include <wx/button.h>
#include <wx/choice.h>
#include <wx/control.h>

#include <set>

namespace {

const char* const Languages[] = {"de", "es", "fr", "ja"};

class CatalogueTest : public SettingsWindow {
protected:
    /// What a bar says is put together.
    static bool InBar(const wxWindow* window) {
        return dynamic_cast<const MessageBar*>(window->GetParent());
    }

    /// Collects what the window shows and what is no name of this machine's.
    void CollectFromWindow() {
        Open([this] {
            ForEachBelow(m_window, [this](wxWindow* each) {
                const auto* choice = dynamic_cast<const wxChoice*>(each);
                const bool holdsNames = each->GetId() == ControlId::Printer ||
                                        each->GetId() == ControlId::DistillerProfile ||
                                        each->GetId() == ControlId::InputTypes;
                if (holdsNames)
                    return;
                if (choice)
                    for (const wxString& entry : choice->GetStrings())
                        Add(entry);
                else if (dynamic_cast<const wxControl*>(each) && !InBar(each))
                    Add(each->GetLabel());
            });
        });
    }

    void Add(wxString text) {
        text.Replace("\n", " "); // where the toolkit wraps it
        if (!text.empty() && !text.IsNumber())
            m_keys.insert(text);
    }

    std::set<wxString> m_keys;
};

TEST_F(CatalogueTest, HasEveryTextThatTheProgramShows) {
    CollectFromWindow();
    m_printers.clear();
    CollectFromWindow();
    m_office.reset();
    CollectFromWindow();
    EXPECT_GT(m_keys.size(), 30U) << "labels, entries, notes and buttons";
    const FilterSet filters(QUILLON_FILTERS);
    for (int code = -2000; code < 2000; ++code)
        Add(filters.ErrorText(code));
    EXPECT_GT(m_keys.size(), 60U) << "and result codes";
    for (const char* language : Languages) {
        Speak(language);
        for (const wxString& key : m_keys)
            EXPECT_TRUE(wxTranslations::Get()->GetTranslatedString(key)) << language << ": " << key;
        std::set<wxString> entries;
        for (const Setting* const setting : {&FilterSettings::OutputType, &FilterSettings::Colour})
            for (const SettingChoice& choice : setting->choices)
                entries.insert(wxGetTranslation(choice.text));
        EXPECT_EQ(entries.size(), 7U) << language << ": a stored entry must say which it is";
    }
}

} // namespace
