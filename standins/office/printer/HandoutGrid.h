#pragma once

#include "standins/office/printer/PostScriptOutput.h"

namespace standins {

/// An area of a sheet, in points from its top left corner.
struct Area {
    double x;
    double y;
    double width;
    double height;
};

/// Where the slides of a handout stand on the paper.
class HandoutGrid {
public:
    /// @param slides on a sheet: 1, 2, 3, 4, 6 or 9
    /// @param downFirst column by column, not row by row
    HandoutGrid(int slides, bool downFirst, Size paper);

    int Slides() const { return m_columns * m_rows; }
    /// Beside each slide there is room to write.
    bool HasLines() const { return m_hasLines; }

    /// @param place in the sheet's order, counted from 0
    Area SlideArea(int place) const;
    /// Where the lines beside the slide are ruled.
    Area LinesArea(int place) const;

private:
    Area Cell(int column, int row) const;

    int m_columns;
    int m_rows;
    bool m_hasLines;
    bool m_downFirst;
    Size m_paper;
};

/// The largest area within another that has the proportion of `size`, in its middle.
Area FitInto(const Area& area, Size size);

} // namespace standins
