#include "standins/office/shared/HostOrder.h"

#include "standins/shared/Channel.h"

namespace standins {

std::string Encode(const HostOrder& order) {
    return JoinWords({order.folder, order.document, order.openedPath, order.importFilter,
                      order.exportTo, order.output, order.hiddenTo, order.hiddenOutput});
}

std::optional<HostOrder> DecodeHostOrder(const std::string& text) {
    std::vector<std::string> words = SplitWords(text);
    constexpr std::size_t Members = 8;
    if (words.size() != Members)
        return std::nullopt;
    return HostOrder{std::move(words[0]), std::move(words[1]), std::move(words[2]),
                     std::move(words[3]), std::move(words[4]), std::move(words[5]),
                     std::move(words[6]), std::move(words[7])};
}

} // namespace standins
