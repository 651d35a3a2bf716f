#include "tests/ui/settings/SettingsWindow.h"

#include <cairo.h>
#include <dlfcn.h>

// wxWidgets loses sight of the focus within a choice. The toolkit has it, but not its headers.
wxWindow* FocusedIn(wxWindow* window) {
    using GetPart = void* (*)(void*);
    static const auto s_getFocus =
        reinterpret_cast<GetPart>(dlsym(RTLD_DEFAULT, "gtk_window_get_focus"));
    static const auto s_getParent =
        reinterpret_cast<GetPart>(dlsym(RTLD_DEFAULT, "gtk_widget_get_parent"));
    for (void* widget = s_getFocus(window->GetHandle()); widget; widget = s_getParent(widget)) {
        wxWindow* found = nullptr;
        ForEachBelow(window, [&](wxWindow* each) {
            found = each->GetHandle() == static_cast<WXWidget>(widget) ? each : found;
        });
        if (found)
            return found;
    }
    return nullptr;
}

void ReadAnew(wxScreenDC& screen) {
    cairo_surface_mark_dirty(cairo_get_target(static_cast<cairo_t*>(screen.GetHandle())));
}
