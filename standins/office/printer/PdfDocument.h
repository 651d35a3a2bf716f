#pragma once

#include "standins/office/printer/PostScriptOutput.h"

#include <memory>
#include <string>
#include <vector>

struct _PopplerDocument;
struct _PopplerPage;

namespace standins {

/// A note that somebody has stuck to a page.
struct Comment {
    int page; ///< counted from 0
    double x; ///< where it is stuck, in points from the page's top left corner
    double y;
    std::string author; ///< UTF-8
    std::string date;   ///< for people; may be empty
    std::string text;
};

/// The PDF to be printed.
class PdfDocument {
public:
    /// @param file open for reading, a regular file
    /// @throws std::runtime_error when it is no PDF, or has no pages
    explicit PdfDocument(int file);

    int PageCount() const;

    // Pages are counted from 0.
    // @throws std::runtime_error when the page cannot be read

    /// As a viewer shows it.
    Size PageSize(int page) const;
    /// Draws the page as large as it is.
    void DrawPage(int page, cairo_t* target) const;
    /// In the order of the pages.
    std::vector<Comment> Comments() const;

private:
    struct ObjectDeleter {
        void operator()(void* object) const;
    };
    using Page = std::unique_ptr<_PopplerPage, ObjectDeleter>;

    Page PageAt(int page) const;

    std::unique_ptr<_PopplerDocument, ObjectDeleter> m_document;
};

} // namespace standins
