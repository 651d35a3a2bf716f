#include "standins/process/Words.h"

namespace standins {

std::string JoinWords(const std::vector<std::string>& words) {
    std::string text;
    for (const std::string& word : words)
        text.append(word).push_back('\0');
    return text;
}

std::vector<std::string> SplitWords(const std::string& text) {
    std::vector<std::string> words;
    for (std::size_t start = 0; start < text.size();) {
        const std::size_t end = text.find('\0', start);
        words.push_back(text.substr(start, end - start));
        start = end == std::string::npos ? text.size() : end + 1;
    }
    return words;
}

} // namespace standins
