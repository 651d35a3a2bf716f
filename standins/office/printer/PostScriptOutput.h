#pragma once

#include "standins/office/printer/PrintJob.h"
#include "standins/shared/Failure.h"

#include <cairo.h>

#include <memory>
#include <string>
#include <vector>

namespace standins {

/// The size of a sheet or an area, in points.
struct Size {
    double width;
    double height;
};

/// The paper, upright, that what is laid out here is laid out for: the printer's usual one.
Size PaperFor(const PrintJob& job);

/// A PostScript file of level 3 in the making.
class PostScriptOutput {
public:
    /// Makes the temporary file that cairo gathers the sheets in, too.
    /// @param file open for writing
    PostScriptOutput(int file, const PrintJob& job);
    ~PostScriptOutput();
    PostScriptOutput(const PostScriptOutput&) = delete;
    PostScriptOutput& operator=(const PostScriptOutput&) = delete;

    /// Starts a sheet; the one before is done.
    /// @return what to draw on, in points from the top left corner; valid until the next sheet
    cairo_t* NewSheet(Size size);

    /// Whether it makes sense to go on.
    bool IsGood() const;

    /// To be called last.
    /// @return no failure when all is written
    Failure Finish();

private:
    static cairo_status_t Take(void* output, const unsigned char* bytes, unsigned size);
    void Add(const char* bytes, std::size_t size);
    void AddProcedures();
    void ShowSheet();
    int Flush();

    int m_file;
    int m_error = 0;
    std::vector<char> m_bytes; ///< cairo's come in small pieces, so they are gathered
    std::string m_procedures;  ///< still to be written, behind the ones of cairo
    std::unique_ptr<cairo_surface_t, void (*)(cairo_surface_t*)> m_surface;
    std::unique_ptr<cairo_t, void (*)(cairo_t*)> m_sheet;
};

} // namespace standins
