#pragma once

#include "standins/office/printer/HandoutGrid.h"
#include "standins/office/printer/Sheets.h"

#include <pango/pangocairo.h>

#include <memory>
#include <string>
#include <vector>

namespace standins {

/// A paragraph of plain text.
struct Paragraph {
    std::string text;  ///< UTF-8
    std::string mark;  ///< hangs in front of the text: a bullet, a number
    double indent = 0; ///< of the text, in points
    double size = 12;  ///< of the font, in points
    bool isBold = false;
    double spaceAbove = 0; ///< in points, not at the top of a sheet
};

/// Paragraphs on as many sheets as they need.
class TextSheets : public Sheets {
public:
    TextSheets(std::vector<Paragraph> paragraphs, Size paper);

    int Count() const override { return static_cast<int>(m_sheets.size()); }
    void Print(int number, PostScriptOutput& output) const override;

private:
    /// Lines of a paragraph that stand together on a sheet.
    struct Piece {
        std::size_t paragraph;
        int firstLine;
        int endLine;
        double y; ///< of the first line's top
    };
    struct ObjectDeleter {
        void operator()(void* object) const;
    };
    using Layout = std::unique_ptr<PangoLayout, ObjectDeleter>;

    Layout MakeLayout(const Paragraph& paragraph) const;
    void Place(std::size_t paragraph);
    void DrawPiece(const Piece& piece, cairo_t* sheet) const;

    std::vector<Paragraph> m_paragraphs;
    Size m_paper;
    std::unique_ptr<PangoContext, ObjectDeleter> m_context;
    std::vector<std::vector<Piece>> m_sheets;
    double m_next; ///< where the next paragraph goes while they are placed
};

/// Draws a short text in the middle of an area.
void DrawCentred(const std::string& text, const Area& area, cairo_t* target);

} // namespace standins
