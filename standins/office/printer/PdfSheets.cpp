#include "standins/office/printer/PdfSheets.h"

#include "standins/office/printer/Text.h"

#include <algorithm>
#include <cmath>

namespace standins {

namespace {

/// What printers leave white at the edges.
constexpr double PaperMargin = 18;

/// Turned as a page is.
Area Turned(Size paper, Size page) {
    const bool isWide = page.width > page.height;
    return {0, 0, isWide ? paper.height : paper.width, isWide ? paper.width : paper.height};
}

bool IsAlike(double a, double b) {
    constexpr double Alike = 4; // such as A4 as one program rounds it and the other
    return std::abs(a - b) <= Alike;
}

bool HasPaper(const std::vector<PrinterPaper>& papers, Size page) {
    return std::any_of(papers.begin(), papers.end(), [page](const PrinterPaper& paper) {
        return (IsAlike(paper.width, page.width) && IsAlike(paper.height, page.height)) ||
               (IsAlike(paper.height, page.width) && IsAlike(paper.width, page.height));
    });
}

/// Where a page stands on a sheet.
struct Place {
    Size sheet;
    Area page;
};

/// On the printer's own paper, turned as the page is: what is too large is made smaller.
Place PlaceOn(const PrinterPaper& paper, Size page, bool fills) {
    Place place = {{paper.width, paper.height},
                   {paper.left, paper.top, paper.width - paper.left - paper.right,
                    paper.height - paper.top - paper.bottom}};
    if (page.width > page.height) { // whichever way the printer turns it
        const double side = std::max(paper.top, paper.bottom);
        const double edge = std::max(paper.left, paper.right);
        place = {{paper.height, paper.width},
                 {side, edge, paper.height - 2 * side, paper.width - 2 * edge}};
    }
    const Area& white = place.page;
    if (fills || page.width > white.width || page.height > white.height)
        place.page = FitInto(white, page);
    else
        place.page = {white.x + (white.width - page.width) / 2,
                      white.y + (white.height - page.height) / 2, page.width, page.height};
    return place;
}

Area WithoutMargin(const Area& area) {
    return {area.x + PaperMargin, area.y + PaperMargin, area.width - 2 * PaperMargin,
            area.height - 2 * PaperMargin};
}

void DrawFrame(const Area& area, cairo_t* sheet) {
    cairo_rectangle(sheet, area.x, area.y, area.width, area.height);
    cairo_set_source_rgb(sheet, 0, 0, 0);
    cairo_set_line_width(sheet, 1);
    cairo_stroke(sheet);
}

void RuleLines(const Area& area, cairo_t* sheet) {
    constexpr double Distance = 26;
    cairo_set_source_rgb(sheet, 0, 0, 0);
    cairo_set_line_width(sheet, 0.5);
    const int lines = static_cast<int>(area.height / Distance);
    for (int line = 0; line <= lines; ++line) {
        const double y = area.y + area.height - line * Distance;
        cairo_move_to(sheet, area.x, y);
        cairo_line_to(sheet, area.x + area.width, y);
    }
    cairo_stroke(sheet);
}

} // namespace

PdfSheets::PdfSheets(const PdfDocument& document, const PrintJob& job,
                     std::vector<Comment> comments)
    : m_document(document), m_job(job), m_grid(job.slidesPerSheet, job.downFirst, PaperFor(job)),
      m_comments(std::move(comments)) {}

int PdfSheets::Count() const {
    const int pages = m_document.PageCount();
    return m_job.contents == Contents::Handouts ? (pages + m_grid.Slides() - 1) / m_grid.Slides()
                                                : pages;
}

void PdfSheets::Print(int number, PostScriptOutput& output) const {
    if (m_job.contents == Contents::Handouts)
        PrintHandout(number * m_grid.Slides(), output);
    else
        PrintPage(number, output);
}

void PdfSheets::PrintPage(int page, PostScriptOutput& output) const {
    const Size size = m_document.PageSize(page);
    if (m_job.onlyThesePapers && (m_job.fitToPaper || !HasPaper(m_job.papers, size))) {
        const Place place = PlaceOn(m_job.papers.front(), size, m_job.fitToPaper);
        DrawPage(page, place.page, output.NewSheet(place.sheet));
        return;
    }
    const Area paper =
        m_job.fitToPaper ? Turned(PaperFor(m_job), size) : Area{0, 0, size.width, size.height};
    cairo_t* sheet = output.NewSheet({paper.width, paper.height});
    DrawPage(page, m_job.fitToPaper ? FitInto(WithoutMargin(paper), size) : paper, sheet);
}

void PdfSheets::PrintHandout(int first, PostScriptOutput& output) const {
    cairo_t* sheet = output.NewSheet(PaperFor(m_job));
    const int end = std::min(first + m_grid.Slides(), m_document.PageCount());
    for (int page = first; page < end; ++page) {
        const Area place = m_grid.SlideArea(page - first);
        DrawPage(page, FitInto(place, m_document.PageSize(page)), sheet);
        if (m_grid.HasLines())
            RuleLines(m_grid.LinesArea(page - first), sheet);
    }
}

void PdfSheets::DrawPage(int page, const Area& area, cairo_t* sheet) const {
    const double scale = area.width / m_document.PageSize(page).width;
    cairo_save(sheet);
    cairo_rectangle(sheet, area.x, area.y, area.width, area.height);
    cairo_clip(sheet); // what sticks out of a slide is not seen on it
    cairo_translate(sheet, area.x, area.y);
    cairo_scale(sheet, scale, scale);
    m_document.DrawPage(page, sheet);
    DrawMarkers(page, sheet);
    cairo_restore(sheet);
    if (m_job.frames)
        DrawFrame(area, sheet);
}

/// The number under which a comment is found on the sheets of comments.
void PdfSheets::DrawMarkers(int page, cairo_t* sheet) const {
    constexpr double Side = 18;
    for (std::size_t i = 0; i < m_comments.size(); ++i) {
        const Comment& comment = m_comments[i];
        if (comment.page != page)
            continue;
        cairo_rectangle(sheet, comment.x, comment.y, Side, Side);
        cairo_set_source_rgb(sheet, 1, 0.95, 0.6);
        cairo_fill_preserve(sheet);
        cairo_set_source_rgb(sheet, 0, 0, 0);
        cairo_set_line_width(sheet, 1);
        cairo_stroke(sheet);
        DrawCentred(std::to_string(i + 1), {comment.x, comment.y, Side, Side}, sheet);
    }
}

} // namespace standins
