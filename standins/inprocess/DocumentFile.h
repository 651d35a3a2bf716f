#pragma once

#include "standins/shared/Descriptor.h"
#include "standins/shared/Failure.h"

#include <cstdint>
#include <string>

namespace standins {

/// A document's file, open for reading: a regular file with something in it.
struct DocumentFile {
    Descriptor descriptor;
    std::uint64_t size = 0; ///< in bytes
};

/// Opens a document. Never waits for a writer, as a named pipe would make it.
/// @param failure receives what is wrong
/// @return a closed descriptor when the document cannot be opened
DocumentFile OpenDocumentFile(const std::wstring& path, Failure& failure);

} // namespace standins
