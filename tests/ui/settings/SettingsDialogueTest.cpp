#include "host/program/settings/Settings.h"
#include "tests/ui/settings/SettingsWindow.h"
#include "ui/ControlIds.h"

#include <wx/button.h>
#include <wx/checkbox.h>
#include <wx/choice.h>

namespace {

class SettingsDialogueTest : public SettingsWindow {
protected:
    /// The settings of the file by key.
    std::string Value(const wxString& key) const {
        wxString fault;
        const std::optional<Settings> settings = Settings::Load(m_file, fault);
        EXPECT_TRUE(settings) << fault;
        return settings ? settings->Value(key).utf8_string() : "";
    }

    bool IsTicked(int id) const { return dynamic_cast<wxCheckBox*>(Find(id))->GetValue(); }

    /// Activates the check box, and waits for it to follow.
    void Toggle(int id) {
        const bool ticked = IsTicked(id);
        Activate(id);
        EXPECT_TRUE(Until([&] { return IsTicked(id) != ticked; })) << id;
    }

    bool HasClosed() const { return !m_window->IsShown(); }
};

TEST_F(SettingsDialogueTest, ReturnSavesWhatWasPicked) {
    const int end = Open([this] {
        Toggle(ControlId::FrameSlides);
        Choose(ControlId::Print, "Handouts");
        EXPECT_TRUE(Find(ControlId::SlidesPerPage)->IsEnabled());
        Choose(ControlId::SlidesPerPage, "4");
        Choose(ControlId::Printer, "Proofer");
        Press(WXK_RETURN);
        EXPECT_TRUE(Until([this] { return HasClosed(); }));
    });
    EXPECT_EQ(end, wxID_SAVE);
    for (const auto& [key, value] : {std::pair("FRAMESLIDES", "1"),
                                     {"PRINTOUTPUTTYPE", "Handouts"},
                                     {"SLIDESPERPAGE", "4"},
                                     {"PRINTER", "Proofer"},
                                     {"OUTPUTFILETYPEPDF", "1"},
                                     {"SELECTEDDISTILLERPROFILE", "Press Quality.joboptions"}})
        EXPECT_EQ(Value(key), value) << key;
    EXPECT_EQ(Open([this] {
                  EXPECT_TRUE(IsTicked(ControlId::FrameSlides));
                  EXPECT_EQ(dynamic_cast<wxChoice*>(Find(ControlId::Printer))->GetStringSelection(),
                            "Proofer");
              }),
              wxID_NONE)
        << "and the next window shows it";
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
    const std::filesystem::path folder = m_folder / "later";
    m_file = folder / "job.xml";
    const int end = Open([this, &folder] {
        Toggle(ControlId::FrameSlides);
        Activate(ButtonId::Save);
        const wxWindow* fault = nullptr;
        ForEachBelow(m_window, [&fault](wxWindow* each) {
            if (const auto* bar = dynamic_cast<const wxInfoBar*>(each))
                fault = bar;
        });
        EXPECT_TRUE(Until([fault] { return fault->IsShown(); }));
        EXPECT_FALSE(HasClosed());
        EXPECT_TRUE(IsTicked(ControlId::FrameSlides));
        EXPECT_GE(m_window->GetClientSize().y,
                  m_window->ScreenToClient(Place(Find(ButtonId::Save)).GetBottomRight()).y)
            << "the buttons are still there";
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
        "<PRINTER>Sold last year</PRINTER>",
        "<SELECTEDDISTILLERPROFILE>Gone.joboptions</SELECTEDDISTILLERPROFILE>",
        "<PRINTOUTPUTTYPE>\xE9\x85\x8D\xE5\xB8\x83\xE8\xB3\x87\xE6\x96\x99</PRINTOUTPUTTYPE>",
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
        Press(WXK_RETURN);
        EXPECT_TRUE(Until([this] { return HasClosed(); }));
    });
    EXPECT_EQ(end, wxID_SAVE);
    const std::string stored = Stored();
    for (const std::string& each : kept)
        EXPECT_NE(stored.find(each), std::string::npos) << each.substr(0, 80);
    EXPECT_EQ(Value("HIGHQUALITY"), "1");
}

TEST_F(SettingsDialogueTest, TheTabKeyFollowsTheEye) {
    Open([this] {
        Choose(ControlId::Print, "Handouts"); // enables all
        Find(ControlId::Printer)->SetFocus();
        std::vector<wxWindow*> visited;
        for (wxWindow* now = Focused();
             now && std::find(visited.begin(), visited.end(), now) == visited.end();
             now = Focused()) {
            EXPECT_TRUE(dynamic_cast<const wxControl*>(now))
                << "a stop at nothing: " << now->GetId();
            visited.push_back(now);
            Press(WXK_TAB);
            EXPECT_TRUE(Until([&] { return Focused() && Focused() != now; })) << now->GetId();
        }
        for (std::size_t i = 1; i < visited.size(); ++i) {
            const wxRect before = Place(visited[i - 1]);
            const wxRect after = Place(visited[i]);
            const bool sameLine = after.y < before.GetBottom() && before.y < after.GetBottom();
            EXPECT_TRUE(sameLine ? before.x < after.x : before.y < after.y)
                << visited[i - 1]->GetId() << " -> " << visited[i]->GetId();
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
