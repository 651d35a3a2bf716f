#include "standins/office/printer/DscText.h"

#include "standins/shared/Text.h"

#include <algorithm>
#include <array>
#include <cstdio>
#include <vector>

namespace standins {

namespace {

constexpr std::size_t LongestText = 200; // a comment line has 255 characters, with its keyword

std::string Octal(unsigned byte) {
    std::array<char, 5> digits{};
    std::snprintf(digits.data(), digits.size(), "\\%03o", byte & 0xFFU);
    return digits.data();
}

// The pieces of the line that must not be torn where it is shortened.

std::vector<std::string> AsciiPieces(const std::string& text) {
    std::vector<std::string> pieces;
    for (const char character : text) {
        // A parenthesis at the start would make it a text in parentheses.
        const bool isPlain = character >= ' ' && character <= '~' && character != '\\' &&
                             !(character == '(' && pieces.empty());
        pieces.push_back(isPlain ? std::string(1, character)
                                 : Octal(static_cast<unsigned char>(character)));
    }
    return pieces;
}

std::vector<std::string> Utf16Pieces(const std::string& text) {
    std::vector<std::string> pieces{Octal(0xFE) + Octal(0xFF)};
    for (const char16_t unit : ToUtf16(text)) {
        const bool isLowSurrogate = unit >= 0xDC00 && unit < 0xE000;
        if (!isLowSurrogate)
            pieces.emplace_back();
        pieces.back() += Octal(unit >> 8U) + Octal(unit);
    }
    return pieces;
}

bool IsAscii(const std::string& text) {
    return std::all_of(text.begin(), text.end(),
                       [](unsigned char character) { return character < 0x80; });
}

} // namespace

std::string DscText(const std::string& text) {
    std::string line;
    for (const std::string& piece : IsAscii(text) ? AsciiPieces(text) : Utf16Pieces(text)) {
        if (line.size() + piece.size() > LongestText)
            break;
        line += piece;
    }
    return line;
}

} // namespace standins
