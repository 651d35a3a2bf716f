#include "standins/office/printer/Text.h"

#include <cairo-ps.h>

namespace standins {

namespace {

constexpr double Margin = 60;

struct FontDeleter {
    void operator()(PangoFontDescription* font) const { pango_font_description_free(font); }
};

void SetFont(PangoLayout* layout, double size, bool isBold) {
    const std::unique_ptr<PangoFontDescription, FontDeleter> font(
        pango_font_description_from_string("Carlito, Sans"));
    pango_font_description_set_absolute_size(font.get(), size * PANGO_SCALE);
    pango_font_description_set_weight(font.get(), isBold ? PANGO_WEIGHT_BOLD : PANGO_WEIGHT_NORMAL);
    pango_layout_set_font_description(layout, font.get());
    // PostScript has no way to tell which characters a ligature stands for.
    PangoAttrList* attributes = pango_attr_list_new();
    pango_attr_list_insert(attributes, pango_attr_font_features_new("liga=0, clig=0"));
    pango_layout_set_attributes(layout, attributes);
    pango_attr_list_unref(attributes);
}

void SetText(PangoLayout* layout, const std::string& text) {
    pango_layout_set_text(layout, text.data(), static_cast<int>(text.size()));
}

double LineHeight(PangoLayoutLine* line) {
    PangoRectangle extents{};
    pango_layout_line_get_extents(line, nullptr, &extents);
    return static_cast<double>(extents.height) / PANGO_SCALE;
}

/// Draws a line whose top is at `y`.
void DrawLine(PangoLayoutLine* line, double x, double y, cairo_t* target) {
    PangoRectangle extents{};
    pango_layout_line_get_extents(line, nullptr, &extents);
    cairo_move_to(target, x, y - static_cast<double>(extents.y) / PANGO_SCALE);
    pango_cairo_show_layout_line(target, line);
}

} // namespace

void TextSheets::ObjectDeleter::operator()(void* object) const {
    g_object_unref(object);
}

TextSheets::TextSheets(std::vector<Paragraph> paragraphs, Size paper)
    : m_paragraphs(std::move(paragraphs)), m_paper(paper),
      m_context(pango_font_map_create_context(pango_cairo_font_map_get_default())), m_next(Margin) {
    // Lines break alike wherever they are printed.
    const std::unique_ptr<cairo_font_options_t, decltype(&cairo_font_options_destroy)> options(
        cairo_font_options_create(), cairo_font_options_destroy);
    cairo_font_options_set_hint_metrics(options.get(), CAIRO_HINT_METRICS_OFF);
    cairo_font_options_set_hint_style(options.get(), CAIRO_HINT_STYLE_NONE);
    pango_cairo_context_set_font_options(m_context.get(), options.get());
    for (std::size_t i = 0; i < m_paragraphs.size(); ++i)
        Place(i);
}

TextSheets::Layout TextSheets::MakeLayout(const Paragraph& paragraph) const {
    Layout layout(pango_layout_new(m_context.get()));
    SetFont(layout.get(), paragraph.size, paragraph.isBold);
    SetText(layout.get(), paragraph.text);
    const double width = m_paper.width - 2 * Margin - paragraph.indent;
    pango_layout_set_width(layout.get(), static_cast<int>(width * PANGO_SCALE));
    pango_layout_set_wrap(layout.get(), PANGO_WRAP_WORD_CHAR);
    return layout;
}

/// Where the paragraph does not fit on a sheet it goes on at the top of the next one.
void TextSheets::Place(std::size_t paragraph) {
    const Layout layout = MakeLayout(m_paragraphs[paragraph]);
    m_next += m_paragraphs[paragraph].spaceAbove;
    const int lines = pango_layout_get_line_count(layout.get());
    for (int line = 0; line < lines; ++line) {
        const double height = LineHeight(pango_layout_get_line_readonly(layout.get(), line));
        const bool isNewSheet = m_sheets.empty() || m_next + height > m_paper.height - Margin;
        if (isNewSheet) {
            m_sheets.emplace_back();
            m_next = Margin;
        }
        if (isNewSheet || line == 0)
            m_sheets.back().push_back({paragraph, line, line, m_next});
        m_sheets.back().back().endLine = line + 1;
        m_next += height;
    }
}

void TextSheets::Print(int number, PostScriptOutput& output) const {
    cairo_t* sheet = output.NewSheet(m_paper);
    for (const Piece& piece : m_sheets[static_cast<std::size_t>(number)])
        DrawPiece(piece, sheet);
}

void TextSheets::DrawPiece(const Piece& piece, cairo_t* sheet) const {
    const Paragraph& paragraph = m_paragraphs[piece.paragraph];
    const Layout layout = MakeLayout(paragraph);
    double y = piece.y;
    for (int line = piece.firstLine; line < piece.endLine; ++line) {
        PangoLayoutLine* words = pango_layout_get_line_readonly(layout.get(), line);
        DrawLine(words, Margin + paragraph.indent, y, sheet);
        y += LineHeight(words);
    }
    if (piece.firstLine > 0 || paragraph.mark.empty())
        return;
    SetText(layout.get(), paragraph.mark);
    constexpr double MarkRoom = 18;
    DrawLine(pango_layout_get_line_readonly(layout.get(), 0), Margin + paragraph.indent - MarkRoom,
             piece.y, sheet);
}

void DrawCentred(const std::string& text, const Area& area, cairo_t* target) {
    const std::unique_ptr<PangoLayout, decltype(&g_object_unref)> layout(
        pango_cairo_create_layout(target), g_object_unref);
    SetFont(layout.get(), area.height * 0.7, true);
    SetText(layout.get(), text);
    PangoRectangle extents{};
    pango_layout_get_extents(layout.get(), nullptr, &extents);
    cairo_move_to(target, area.x + (area.width - extents.width / double{PANGO_SCALE}) / 2,
                  area.y + (area.height - extents.height / double{PANGO_SCALE}) / 2);
    pango_cairo_show_layout(target, layout.get());
}

} // namespace standins
