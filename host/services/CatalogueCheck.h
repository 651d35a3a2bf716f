#pragma once

#include <string_view>

/// Whether the bytes are a gettext catalogue in which nothing lies outside the file. wxWidgets
/// believes the places that a catalogue names.
bool IsSoundCatalogue(std::string_view bytes);
