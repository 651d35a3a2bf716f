#pragma once

#include <optional>
#include <string>

namespace standins {

/// What the host of LibreOffice is asked to have a child do in a work folder. Paths are full.
struct HostOrder {
    std::string folder;       ///< the work folder
    std::string document;     ///< the document there
    std::string openedPath;   ///< by which LibreOffice opens it: fields and headers print it
    std::string importFilter; ///< LibreOffice's name of the document's type
    std::string exportTo;     ///< extension, colon, LibreOffice's filter with options if any
    std::string output;       ///< what is made of it
    std::string hiddenTo; ///< like exportTo, with hidden slides; empty when that is not asked for
    std::string hiddenOutput; ///< what is made of it with hidden slides; the same if it has none
};

/// An order as the text of a message.
std::string Encode(const HostOrder& order);
/// @return nothing for a text that is no order
std::optional<HostOrder> DecodeHostOrder(const std::string& text);

} // namespace standins
