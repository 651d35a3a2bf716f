#pragma once

#include "standins/office/printer/HandoutGrid.h"
#include "standins/office/printer/PdfDocument.h"
#include "standins/office/printer/Sheets.h"

namespace standins {

/// The pages of a PDF: each on a sheet of its own, or several on one as a handout.
class PdfSheets : public Sheets {
public:
    /// @param comments are marked in the pages with their numbers
    PdfSheets(const PdfDocument& document, const PrintJob& job, std::vector<Comment> comments);

    int Count() const override;
    void Print(int number, PostScriptOutput& output) const override;

private:
    void PrintPage(int page, PostScriptOutput& output) const;
    void PrintHandout(int first, PostScriptOutput& output) const;
    void DrawPage(int page, const Area& area, cairo_t* sheet) const;
    void DrawMarkers(int page, cairo_t* sheet) const;

    const PdfDocument& m_document;
    const PrintJob& m_job;
    HandoutGrid m_grid;
    std::vector<Comment> m_comments;
};

} // namespace standins
