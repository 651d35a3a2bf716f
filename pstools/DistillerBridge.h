#pragma once

// The bridge library's interface: what it exports and is given.

#include <cstdint>

/// One conversion to be made. The texts are UTF-16 with a terminating zero; they and the record
/// belong to the caller and last as long as the call.
struct DistillerRequest {
    const char16_t* psPath;  ///< full path of the PostScript file
    const char16_t* pdfPath; ///< full path of the PDF file to be made
    const char16_t* profile; ///< the job options' file name; may be empty, never null
    std::uint64_t reserved1 = 0;
    std::uint64_t reserved2 = 0;
};

static_assert(sizeof(DistillerRequest) == 40, "the bridge reads this record by its offsets");

/// @return 0 when the PDF file was made
using DistConvertFile = std::int32_t(const DistillerRequest* request);

constexpr char DistillerBridgeExport[] = "DIST_convertFile";
