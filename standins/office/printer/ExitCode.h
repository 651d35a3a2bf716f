#pragma once

namespace standins {

/// The PostScript writer's exit code when it is not the document that fails, but the writing.
constexpr int CannotWrite = 2;

} // namespace standins
