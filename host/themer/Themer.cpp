#include "common/Themer.h"

#include "host/themer/Palette.h"

#include <wx/app.h>
#include <wx/settings.h>

#include <optional>

namespace {

constexpr int ConsolePointSize = 10;
constexpr int MostHeaderPixels = 13;

bool HasDesktop() {
    const wxAppConsole* const app = wxAppConsole::GetInstance(); // wxTheApp believes it is a wxApp
    return app && app->IsGUI();
}

bool DesktopIsDark() {
    return HasDesktop() && wxSystemSettings::GetAppearance().IsDark();
}

wxColour Colour(unsigned rgb) {
    return {static_cast<unsigned char>(rgb >> 16U), static_cast<unsigned char>(rgb >> 8U),
            static_cast<unsigned char>(rgb)};
}

/// The strips that the header's font is for have room for one line of it and do not grow.
wxFont Bounded(wxFont font) {
    if (HasDesktop() && font.GetPixelSize().y > MostHeaderPixels)
        font.SetPixelSize(wxSize(0, MostHeaderPixels));
    return font;
}

wxFont Font(Surface surface) {
    const wxFont font = HasDesktop() ? wxSystemSettings::GetFont(wxSYS_DEFAULT_GUI_FONT)
                                     : wxFont(wxFontInfo(ConsolePointSize));
    switch (surface) {
    case Surface::HeaderView:
        return Bounded(font.Bold());
    case Surface::Note:
        return font.Bold();
    case Surface::Default:
        break;
    }
    return font;
}

Theme MakeTheme(Surface surface, bool dark) {
    const Palette& palette = PaletteOf(surface, dark);
    return {Colour(palette.background), Colour(palette.text), Colour(palette.border),
            Font(surface)};
}

} // namespace

Themer* Themer::GetThemeService() {
    static Themer s_themer;
    return &s_themer;
}

const Theme& Themer::GetTheme(const char* name) const {
    // Never destroyed: fonts must not outlive the toolkit, and panels keep references to the end.
    static auto* const s_themes = new std::optional<Theme>[SurfaceCount][2];
    const Surface surface = SurfaceNamed(name ? name : "");
    const bool dark = DesktopIsDark();
    std::optional<Theme>& theme = s_themes[static_cast<int>(surface)][dark ? 1 : 0];
    if (!theme)
        theme = MakeTheme(surface, dark);
    return *theme;
}
