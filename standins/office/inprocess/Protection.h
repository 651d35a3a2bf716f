#pragma once

#include <string>

namespace standins {

/// Whether a document that could not be loaded is encrypted with a password. The Office Open XML
/// package is then a stream of a compound file; the binary formats have a mark in a stream.
bool IsPasswordProtected(const std::wstring& path);

} // namespace standins
