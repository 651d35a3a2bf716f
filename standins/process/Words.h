#pragma once

#include <string>
#include <vector>

namespace standins {

// Words as one text: each ends with a zero, which no argument of a program can hold.

std::string JoinWords(const std::vector<std::string>& words);
std::vector<std::string> SplitWords(const std::string& text);

} // namespace standins
