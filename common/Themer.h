#pragma once

// The host's theme library, as its filters see it.

#include <wx/colour.h>
#include <wx/font.h>

/// Colours and font of one kind of surface. The order of the members is part of the interface.
struct Theme {
    wxColour backgroundColour;
    wxColour textColour;
    wxColour borderColour;
    wxFont font;
};

/// The process's themes. Needs an initialised GUI, as fonts do.
class Themer {
public:
    static Themer* GetThemeService();

    /// @param name "Default", "Note" or "HeaderView"; any other name gives "Default"
    /// @return the theme as it is now; valid until the process ends
    const Theme& GetTheme(const char* name) const;

    Themer(const Themer&) = delete;
    Themer& operator=(const Themer&) = delete;

private:
    Themer() = default;
    ~Themer() = default;
};
