#pragma once

#include <functional>
#include <memory>

class wxChoice;
class wxTopLevelWindow;
class wxWindow;

// What wxWidgets does not tell of the controls of every system.

/// Tells, as long as it lives, of each control of a window that keys go to from then on.
class FocusWatch {
public:
    using OnFocus = std::function<void(wxWindow& control)>;

    /// @param window outlives this object
    FocusWatch(wxTopLevelWindow& window, OnFocus onFocus);
    ~FocusWatch();

private:
    class Connection;
    std::unique_ptr<Connection> m_connection;
};

/// Whether the choice shows its entries, so that what goes to the choice is meant for them.
bool ShowsEntries(const wxChoice& choice);
