#include "common/Themer.h"
#include "plugin/interface/ControlIds.h"
#include "tests/ui/settings/SettingsWindow.h"

#include <wx/bitmap.h>
#include <wx/button.h>
#include <wx/checkbox.h>
#include <wx/choice.h>
#include <wx/dcmemory.h>
#include <wx/dcscreen.h>
#include <wx/image.h>
#include <wx/radiobut.h>
#include <wx/stattext.h>
#include <wx/utils.h>

#include <set>

namespace {

/// Pictures of the window, for people to look at; and what can be said of them without one.
class PictureTest : public SettingsWindow {
protected:
    wxImage Photograph() const {
        const wxRect place(m_window->ClientToScreen(wxPoint()), m_window->GetClientSize());
        wxBitmap bitmap(place.GetSize());
        wxMemoryDC picture(bitmap);
        wxScreenDC screen;
        ReadAnew(screen);
        picture.Blit(wxPoint(), place.GetSize(), &screen, place.GetPosition());
        picture.SelectObject(wxNullBitmap);
        return bitmap.ConvertToImage();
    }

    static wxColour ColourAt(const wxImage& picture, wxPoint at) {
        return {picture.GetRed(at.x, at.y), picture.GetGreen(at.x, at.y),
                picture.GetBlue(at.x, at.y)};
    }

    static void Keep(const wxImage& picture, const wxString& language) {
        wxString scale;
        const bool large = wxGetEnv("GDK_DPI_SCALE", &scale);
        std::filesystem::create_directories(SCREENSHOTS);
        EXPECT_TRUE(picture.SaveFile(SCREENSHOTS "/settings-" + language +
                                         (large ? "-text-times-" + scale : wxString()) + ".bmp",
                                     wxBITMAP_TYPE_BMP));
    }
};

bool HasText(const wxWindow* window) {
    return dynamic_cast<const wxStaticText*>(window) || dynamic_cast<const wxCheckBox*>(window) ||
           dynamic_cast<const wxRadioButton*>(window) || dynamic_cast<const wxButton*>(window);
}

/// Nothing is cut off: each control is as large as it needs to be, and inside its parent.
void ExpectWhole(wxWindow* window) {
    const wxSize size = window->GetSize();
    if (HasText(window)) {
        const wxSize needed = window->GetBestSize();
        EXPECT_TRUE(needed.x <= size.x && needed.y <= size.y) << window->GetLabel();
    }
    if (const auto* choice = dynamic_cast<const wxChoice*>(window)) {
        for (const wxString& entry : choice->GetStrings())
            EXPECT_LE(choice->GetSizeFromTextSize(choice->GetTextExtent(entry).x).x, size.x)
                << entry;
        EXPECT_LE(choice->GetBestSize().y, size.y) << choice->GetStringSelection();
    }
    const wxSize room = window->GetParent()->GetVirtualSize();
    if (window->IsShownOnScreen()) {
        EXPECT_LE(window->GetRect().GetRight(), room.x) << window->GetLabel();
        EXPECT_LE(window->GetRect().GetBottom(), room.y) << window->GetLabel();
    }
}

void ExpectOneColumn(const wxWindow* window, std::initializer_list<int> ids) {
    std::set<int> edges;
    for (const int id : ids)
        edges.insert(window->FindWindow(id)->GetScreenPosition().x);
    EXPECT_EQ(edges.size(), 1U);
}

TEST_F(PictureTest, TheWindowIsWholeInEveryLanguage) {
    for (const char* language : {"en", "de", "fr", "es", "ja"}) {
        SCOPED_TRACE(language);
        Speak(language);
        Open([this, language] {
            const wxPoint strip(m_window->GetClientSize().x / 2, 10);
            const wxColour stripColour =
                Themer::GetThemeService()->GetTheme("HeaderView").backgroundColour;
            wxImage picture;
            EXPECT_TRUE(Until([&] {
                picture = Photograph();
                const bool hasControls = picture.CountColours() > 20; // letters, frames, boxes
                return hasControls && ColourAt(picture, strip) == stripColour;
            })) << ColourAt(picture, strip).GetAsString();
            Keep(picture, language);
            ForEachBelow(m_window, ExpectWhole);
            ExpectOneColumn(m_window, {ControlId::Printer, ControlId::Print, ControlId::Colour,
                                       ControlId::SlidesPerPage, ControlId::OrderHorizontal,
                                       ControlId::DistillerProfile});
            const wxRect screen = wxGetClientDisplayRect();
            EXPECT_TRUE(screen.Contains(Place(m_window)));
        });
    }
}

TEST_F(PictureTest, TheHeadersLettersFitIntoItsStrip) {
    wxScreenDC screen;
    screen.SetFont(Themer::GetThemeService()->GetTheme("HeaderView").font);
    EXPECT_LE(4 + screen.GetTextExtent("Microsoft, ygj").y, 22);
}

} // namespace
