#include "common/Themer.h"

#include "host/themer/Palette.h"

#include <wx/app.h>
#include <wx/settings.h>

#include <optional>

namespace {

constexpr int ConsolePointSize = 10;

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

wxFont Font(Surface surface) {
    const wxFont font = HasDesktop() ? wxSystemSettings::GetFont(wxSYS_DEFAULT_GUI_FONT)
                                     : wxFont(wxFontInfo(ConsolePointSize));
    switch (surface) {
    case Surface::HeaderView:
        return font.Scaled(1.3F).Bold();
    case Surface::Note:
        return font.Scaled(0.95F);
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
