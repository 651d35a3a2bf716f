#pragma once

#include <string>
#include <vector>

class wxWindow;

/// The windows below `window`, one line each, indented by their depth: class, identifier, label or
/// entries, and what sets it apart (disabled, hidden, ticked). Identifiers that wxWidgets gave are
/// left out.
std::vector<std::string> WindowTree(const wxWindow* window);
