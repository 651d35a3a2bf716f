#pragma once

#include <string>

namespace standins {

/// How a document is printed.
struct PrintJob {
    std::string title; ///< UTF-8; any characters
    std::string user;  ///< UTF-8
    int copies = 1;
    bool collate = true; ///< whole copies one after the other, not each page `copies` times
};

} // namespace standins
