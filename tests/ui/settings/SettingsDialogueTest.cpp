#include "host/program/machine/MissingParts.h"
#include "host/program/settings/RunSettings.h"
#include "host/program/window/MessageBar.h"
#include "plugin/interface/ControlIds.h"
#include "plugin/settings/FilterSettings.h"
#include "tests/ui/settings/SettingsWindow.h"

#include <wx/button.h>
#include <wx/checkbox.h>
#include <wx/choice.h>

#include <gmock/gmock.h>

namespace {

class SettingsDialogueTest : public SettingsWindow {
protected:
    /// The settings of the file by key.
    std::string Value(const wxString& key) const {
        Fault fault;
        const std::optional<Settings> settings = Settings::Load(m_file, fault);
        EXPECT_TRUE(settings) << fault.what;
        return settings ? settings->Value(key).utf8_string() : "";
    }

    /// Activates the check box, and waits for it to follow.
    void Toggle(int id) {
        const bool ticked = IsTicked(id);
        Activate(id);
        EXPECT_TRUE(Until([&] { return IsTicked(id) != ticked; })) << id;
    }

    bool HasClosed() const { return !m_window->IsShown(); }

    void Save() {
        Press(WXK_RETURN);
        EXPECT_TRUE(Until([this] { return HasClosed(); }));
    }

    /// As on a small screen.
    void MakeLow() {
        m_window->SetMinSize(wxSize(1, 1));
        m_window->SetSize(m_window->GetSize().x, 300);
        EXPECT_TRUE(Until([this] { return m_window->GetSize().y == 300; }));
    }

    bool CanBeSeen(const wxWindow* control) const {
        const wxWindow* const area = Find(ControlId::Printer)->GetParent()->GetParent();
        const wxWindow* const around =
            area->IsDescendant(const_cast<wxWindow*>(control)) ? area : control->GetParent();
        return Place(around).Contains(Place(control));
    }

    /// What the window says in a bar, all of it to be seen, without its spaces, at which it wraps.
    wxString Said() const {
        wxString said;
        ForEachBelow(m_window, [&](wxWindow* each) {
            const bool isInBar = dynamic_cast<const MessageBar*>(each->GetParent());
            if (!isInBar || !dynamic_cast<const wxStaticText*>(each) || !each->IsShownOnScreen())
                return;
            said = WithoutSpaces(each->GetLabel());
            const wxSize needed = each->GetBestSize();
            EXPECT_TRUE(needed.x <= each->GetSize().x && needed.y <= each->GetSize().y);
            EXPECT_TRUE(Place(m_window).Contains(Place(each)));
        });
        return said;
    }

    static wxString WithoutSpaces(wxString text) {
        text.Replace(" ", "");
        text.Replace("\n", "");
        return text;
    }
};

TEST_F(SettingsDialogueTest, ReturnSavesWhatWasPicked) {
    const int end = Open([this] {
        EXPECT_EQ(m_window->GetTitle(), "job.xml - Print Settings");
        Toggle(ControlId::FrameSlides);
        Choose(ControlId::Print, "Handouts");
        EXPECT_TRUE(Find(ControlId::SlidesPerPage)->IsEnabled());
        Choose(ControlId::SlidesPerPage, "4");
        Choose(ControlId::Printer, "Proofer");
        Choose(ControlId::DistillerProfile, "Print.joboptions");
        Save();
    });
    EXPECT_EQ(end, wxID_SAVE);
    for (const auto& [key, value] : {std::pair("FRAMESLIDES", "1"),
                                     {"PRINTOUTPUTTYPE", "Handouts"},
                                     {"SLIDESPERPAGE", "4"},
                                     {"PRINTER", "Proofer"},
                                     {"OUTPUTFILETYPEPDF", "1"},
                                     {"SELECTEDDISTILLERPROFILE", "Print.joboptions"}})
        EXPECT_EQ(Value(key), value) << key;
    EXPECT_EQ(Open([this] {
                  EXPECT_TRUE(IsTicked(ControlId::FrameSlides));
                  EXPECT_EQ(Selection(ControlId::Printer), "Proofer");
                  EXPECT_EQ(Selection(ControlId::DistillerProfile), "Print.joboptions");
              }),
              wxID_NONE)
        << "and the next window shows it";
}

TEST_F(SettingsDialogueTest, ANewFileAndRestoredDefaultsSayWhatHoldsWithoutAFile) {
    Settings none;
    FillIn(none);
    const auto expectSame = [&](const char* when) {
        for (const Setting* const setting : FilterSettings::All)
            EXPECT_EQ(Value(setting->key), none.Value(setting->key).utf8_string())
                << when << setting->key;
    };
    Open([this] { Save(); });
    expectSame("a new file ");
    m_folder.Write("job.xml", "<UI><PRINTER>Proofer</PRINTER><OUTPUTFILETYPEPS>1</OUTPUTFILETYPEPS>"
                              "<SELECTEDDISTILLERPROFILE>Print</SELECTEDDISTILLERPROFILE>"
                              "<PRINTOUTPUTTYPE>Handouts</PRINTOUTPUTTYPE><COLOR>Farbe</COLOR>"
                              "<HANDOUTSVERTICAL>1</HANDOUTSVERTICAL>"
                              "<PRINTHIDDENSLIDES>1</PRINTHIDDENSLIDES></UI>");
    Open([this] {
        EXPECT_EQ(Selection(ControlId::DistillerProfile), "Print.joboptions");
        Activate(ButtonId::Restore);
        EXPECT_TRUE(Until([this] { return Selection(ControlId::Print) == "Slides"; }));
        Find(ControlId::Print)->SetFocus();
        Save();
    });
    expectSame("restored ");
}

TEST_F(SettingsDialogueTest, WhatIsNoLongerThereStaysChosenUnderItsName) {
    m_folder.Write("job.xml", "<UI><PRINTER>Sold last year</PRINTER><SELECTEDDISTILLERPROFILE>Gone"
                              "</SELECTEDDISTILLERPROFILE></UI>");
    for (const bool touched : {false, true}) {
        Open([this, touched] {
            const std::tuple<int, const char*, const char*> choices[] = {
                {ControlId::Printer, "Sold last year (not available)", "Proofer"},
                {ControlId::DistillerProfile, "Gone (not available)", "Print.joboptions"}};
            for (const auto& [id, marked, other] : choices) {
                EXPECT_EQ(Selection(id), marked);
                EXPECT_LE(Choice(id)->GetTextExtent(marked).x, Choice(id)->GetSize().x);
                if (touched) {
                    Choose(id, other);
                    Choose(id, marked);
                }
            }
            Save();
        });
        EXPECT_EQ(Value("PRINTER"), "Sold last year");
        EXPECT_EQ(Value("SELECTEDDISTILLERPROFILE"), "Gone");
    }
}

TEST_F(SettingsDialogueTest, AChoiceOfAnotherLanguageIsTheSameOne) {
    m_folder.Write("job.xml",
                   "<UI><PRINTOUTPUTTYPE>\xE9\x85\x8D\xE5\xB8\x83\xE8\xB3\x87\xE6\x96\x99"
                   "</PRINTOUTPUTTYPE><COLOR>Grayscale</COLOR></UI>");
    Speak("de");
    Open([this] {
        EXPECT_EQ(Selection(ControlId::Print), "Handzettel");
        EXPECT_EQ(Selection(ControlId::Colour), "Graustufen");
        EXPECT_TRUE(Find(ControlId::SlidesPerPage)->IsEnabled());
    });
}

TEST_F(SettingsDialogueTest, SaysWhyItIsGreyedOutAsStatusDoes) {
    Open([this] { EXPECT_EQ(Said(), ""); });
    m_office.reset();
    m_office.emplace(std::vector<std::wstring>{L"Word.Application"});
    Open([this] {
        EXPECT_FALSE(Find(ControlId::HighQuality)->IsEnabled());
        EXPECT_TRUE(Said().Contains(WithoutSpaces(FindMissingFor("pptx")->Text()))) << Said();
    });
    m_office.reset();
    Open([this] {
        EXPECT_FALSE(Find(ControlId::Printer)->IsEnabled());
        EXPECT_TRUE(Said().Contains(WithoutSpaces(FindMissingForPanel()->Text()))) << Said();
        EXPECT_FALSE(Find(ButtonId::Restore)->IsEnabled());
    });
}

TEST_F(SettingsDialogueTest, TheMouseWheelScrollsAndChangesNoChoice) {
    Open([this] {
        MakeLow();
        wxChoice* const choice = Choice(ControlId::Printer);
        const int top = Place(choice).y;
        wxMouseEvent wheel(wxEVT_MOUSEWHEEL);
        wheel.SetEventObject(choice);
        wheel.m_wheelDelta = 120;
        wheel.m_wheelRotation = -120;
        wheel.m_linesPerAction = 3;
        EXPECT_TRUE(choice->GetEventHandler()->ProcessEvent(wheel)) << "else the toolkit has it";
        EXPECT_TRUE(Until([&] { return Place(choice).y < top; }));
    });
}

TEST_F(SettingsDialogueTest, LeavesTheFileAloneUnlessItIsToldToSave) {
    const std::string before = "<a><UI><FRAMESLIDES>0</FRAMESLIDES></UI></a>";
    const std::pair<const char*, std::function<void()>> ways[] = {
        {"Escape", [this] { Press(WXK_ESCAPE); }},
        {"Cancel", [this] { Activate(ButtonId::Cancel); }},
        {"Return on Cancel",
         [this] {
             Find(ButtonId::Cancel)->SetFocus();
             Press(WXK_RETURN);
         }},
        {"closed from outside", [this] { m_window->Close(); }},
    };
    for (const auto& [way, leave] : ways) {
        m_folder.Write("job.xml", before);
        const int end = Open([this, leave = leave] {
            Toggle(ControlId::FrameSlides);
            leave();
            EXPECT_TRUE(Until([this] { return HasClosed(); }));
        });
        EXPECT_EQ(end, wxID_CANCEL) << way;
        EXPECT_EQ(Stored(), before) << way;
    }
}

TEST_F(SettingsDialogueTest, StaysOpenWhenTheFileCannotBeWritten) {
    Speak("de");
    const std::filesystem::path folder = m_folder / std::string(100, 'w');
    std::filesystem::create_directory(folder);
    m_file = folder / "job.xml";
    const int end = Open([this, &folder] {
        std::filesystem::remove(folder);
        Toggle(ControlId::FrameSlides);
        const int height = m_window->GetSize().y;
        Activate(ButtonId::Save);
        EXPECT_TRUE(Until([&] { return m_window->GetSize().y > height; })) << "for the fault";
        EXPECT_TRUE(Until([this] { return CanBeSeen(Find(ButtonId::Save)); }));
        EXPECT_TRUE(Said().Contains(WithoutSpaces(m_file.wstring()))) << Said();
        EXPECT_FALSE(HasClosed());
        EXPECT_TRUE(IsTicked(ControlId::FrameSlides));
        Activate(ButtonId::Understood);
        EXPECT_TRUE(Until([&] { return m_window->GetSize().y == height; }));
        std::filesystem::create_directory(folder);
        Activate(ButtonId::Save);
        EXPECT_TRUE(Until([this] { return HasClosed(); }));
    });
    EXPECT_EQ(end, wxID_SAVE);
    EXPECT_EQ(Value("FRAMESLIDES"), "1");
}

TEST_F(SettingsDialogueTest, KeepsWhatItDoesNotUnderstand) {
    std::string many;
    for (int i = 0; i < 10000; ++i)
        many += "<KEY" + std::to_string(i) + ">value</KEY" + std::to_string(i) + ">";
    const std::string kept[] = {
        "<PRINTOUTPUTTYPE>Posters</PRINTOUTPUTTYPE>",
        "<COLOR>Ultraviolet</COLOR>",
        "<SLIDESPERPAGE>-7</SLIDESPERPAGE>",
        "<HANDOUTSHORIZONTAL>1</HANDOUTSHORIZONTAL>",
        many,
    };
    std::string file = "<?xml version=\"1.0\" encoding=\"UTF-8\"?>\n<job><UI>";
    for (const std::string& each : kept)
        file += each;
    m_folder.Write("job.xml", file + "</UI></job>\n");
    const int end = Open([this] {
        Toggle(ControlId::HighQuality);
        Save();
    });
    EXPECT_EQ(end, wxID_SAVE);
    const std::string stored = Stored();
    for (const std::string& each : kept)
        EXPECT_THAT(stored, testing::HasSubstr(each)) << each.substr(0, 80);
    EXPECT_EQ(Value("HIGHQUALITY"), "1");
}

TEST_F(SettingsDialogueTest, TheTabKeyFollowsTheEyeAndTheWindowTheTabKey) {
    Open([this] {
        Choose(ControlId::Print, "Handouts"); // enables all
        MakeLow();
        Find(ControlId::Printer)->SetFocus();
        std::vector<wxWindow*> visited;
        for (wxWindow* now = Focused();
             now && std::find(visited.begin(), visited.end(), now) == visited.end();
             now = Focused()) {
            EXPECT_TRUE(dynamic_cast<const wxControl*>(now))
                << "a stop at nothing: " << now->GetId();
            EXPECT_TRUE(Until([&] { return CanBeSeen(now); })) << now->GetId();
            if (!visited.empty()) {
                const wxRect before = Place(visited.back());
                const wxRect after = Place(now);
                const bool sameLine = after.y < before.GetBottom() && before.y < after.GetBottom();
                EXPECT_TRUE(sameLine ? before.x < after.x : before.y < after.y)
                    << visited.back()->GetId() << " -> " << now->GetId();
            }
            visited.push_back(now);
            Press(WXK_TAB);
            EXPECT_TRUE(Until([&] { return Focused() && Focused() != now; })) << now->GetId();
        }
        ForEachBelow(m_window, [&visited](wxWindow* each) {
            const bool takesPart =
                each->IsEnabled() && each->IsShownOnScreen() &&
                (dynamic_cast<const wxChoice*>(each) || dynamic_cast<const wxCheckBox*>(each) ||
                 dynamic_cast<const wxButton*>(each));
            EXPECT_TRUE(!takesPart || std::count(visited.begin(), visited.end(), each) == 1)
                << each->GetId();
        });
    });
}

} // namespace
