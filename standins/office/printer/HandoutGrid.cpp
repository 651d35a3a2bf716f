#include "standins/office/printer/HandoutGrid.h"

#include <algorithm>

namespace standins {

namespace {

constexpr double Margin = 45;
constexpr double Gap = 24; ///< between slides

int ColumnsFor(int slides) {
    return slides <= 3 ? 1 : slides <= 6 ? 2 : 3;
}

} // namespace

HandoutGrid::HandoutGrid(int slides, bool downFirst, Size paper)
    : m_columns(ColumnsFor(slides)), m_rows(slides / m_columns), m_hasLines(slides == 3),
      m_downFirst(downFirst), m_paper(paper) {}

Area HandoutGrid::SlideArea(int place) const {
    return m_downFirst ? Cell(place / m_rows, place % m_rows)
                       : Cell(place % m_columns, place / m_columns);
}

Area HandoutGrid::LinesArea(int place) const {
    Area area = Cell(1, place);
    area.y += area.height * 0.1;
    area.height *= 0.8;
    return area;
}

/// @param column one more than there are for the lines
Area HandoutGrid::Cell(int column, int row) const {
    const int columns = m_columns + (m_hasLines ? 1 : 0);
    const double width = (m_paper.width - 2 * Margin - (columns - 1) * Gap) / columns;
    const double height = (m_paper.height - 2 * Margin - (m_rows - 1) * Gap) / m_rows;
    return {Margin + column * (width + Gap), Margin + row * (height + Gap), width, height};
}

Area FitInto(const Area& area, Size size) {
    const double scale = std::min(area.width / size.width, area.height / size.height);
    const double width = size.width * scale;
    const double height = size.height * scale;
    return {area.x + (area.width - width) / 2, area.y + (area.height - height) / 2, width, height};
}

} // namespace standins
