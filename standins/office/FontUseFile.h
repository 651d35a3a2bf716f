#pragma once

namespace standins {

/// Where in its work folder an engine says which fonts were asked for and used, see
/// text/FontUse.h.
constexpr const char* FontUseFile = "fonts.txt";

} // namespace standins
