#pragma once

#include "standins/office/printer/Text.h"

namespace standins {

/// The outline of a presentation: each slide's number and title, and the texts of its outline
/// placeholders below it. Other texts, pictures and tables are no part of it.
/// @param presentation an OpenDocument file, open for reading
/// @param withHidden hidden slides too
/// @throws std::runtime_error when it cannot be read
std::vector<Paragraph> ReadOutline(int presentation, bool withHidden);

} // namespace standins
