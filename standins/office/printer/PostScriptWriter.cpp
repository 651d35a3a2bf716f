#include "standins/office/printer/PostScriptWriter.h"

#include "standins/office/printer/DscText.h"
#include "standins/process/FileBytes.h"

#include <cairo-ps.h>
#include <fcntl.h>
#include <poppler.h>
#include <unistd.h>

#include <cmath>
#include <memory>
#include <system_error>
#include <vector>

namespace standins {

namespace {

struct ObjectDeleter {
    void operator()(gpointer object) const { g_object_unref(object); }
};
using Document = std::unique_ptr<PopplerDocument, ObjectDeleter>;
using Page = std::unique_ptr<PopplerPage, ObjectDeleter>;
using Surface = std::unique_ptr<cairo_surface_t, decltype(&cairo_surface_destroy)>;
using Context = std::unique_ptr<cairo_t, decltype(&cairo_destroy)>;

/// Where cairo's bytes go: they come in small pieces, so they are gathered.
class Output {
public:
    explicit Output(int file) : m_file(file) { m_bytes.reserve(Gathered); }

    static cairo_status_t Take(void* output, const unsigned char* bytes, unsigned size) {
        return static_cast<Output*>(output)->Add(bytes, size);
    }
    cairo_status_t Flush() {
        if (m_error == 0)
            m_error = WriteWhole(m_file, m_bytes.data(), m_bytes.size());
        m_bytes.clear();
        return m_error == 0 ? CAIRO_STATUS_SUCCESS : CAIRO_STATUS_WRITE_ERROR;
    }
    int Error() const { return m_error; }

private:
    static constexpr std::size_t Gathered = std::size_t{256} << 10;

    cairo_status_t Add(const unsigned char* bytes, unsigned size) {
        m_bytes.insert(m_bytes.end(), bytes, bytes + size);
        return m_bytes.size() < Gathered ? CAIRO_STATUS_SUCCESS : Flush();
    }

    int m_file;
    int m_error = 0;
    std::vector<char> m_bytes;
};

Document OpenDocument(int pdf, std::string& failure) {
    GError* error = nullptr;
    // Poppler closes what it is given.
    Document document(
        poppler_document_new_from_fd(fcntl(pdf, F_DUPFD_CLOEXEC, 3), nullptr, &error));
    if (!document) {
        failure = error ? error->message : "it is no PDF";
        g_clear_error(&error);
    }
    return document;
}

/// The pages' numbers in the order in which they are printed.
std::vector<int> PagesInOrder(int count, const PrintJob& job) {
    std::vector<int> pages;
    const int outer = job.collate ? job.copies : count;
    const int inner = job.collate ? count : job.copies;
    for (int i = 0; i < outer; ++i) {
        for (int j = 0; j < inner; ++j)
            pages.push_back(job.collate ? j : i);
    }
    return pages;
}

void PrintPage(PopplerPage* page, cairo_surface_t* surface) {
    double width = 0;
    double height = 0;
    poppler_page_get_size(page, &width, &height);
    // Paper sizes are whole points; cairo would round them up, and A4 would not be A4 any more.
    cairo_ps_surface_set_size(surface, std::round(width), std::round(height));
    const Context context(cairo_create(surface), cairo_destroy);
    poppler_page_render_for_printing(page, context.get());
    cairo_show_page(context.get());
}

std::string Describe(cairo_status_t status, const Output& output) {
    if (output.Error() != 0)
        return std::generic_category().message(output.Error());
    return status == CAIRO_STATUS_SUCCESS ? std::string() : cairo_status_to_string(status);
}

} // namespace

std::string WritePostScript(int pdf, int postScript, const PrintJob& job) {
    std::string failure;
    const Document document = OpenDocument(pdf, failure);
    if (!document)
        return failure;
    const int count = poppler_document_get_n_pages(document.get());
    if (count <= 0)
        return "it has no pages";

    Output output(postScript);
    const Surface surface(cairo_ps_surface_create_for_stream(Output::Take, &output, 1, 1),
                          cairo_surface_destroy);
    cairo_ps_surface_restrict_to_level(surface.get(), CAIRO_PS_LEVEL_3);
    cairo_ps_surface_dsc_comment(surface.get(), ("%%Title: " + DscText(job.title)).c_str());
    cairo_ps_surface_dsc_comment(surface.get(), ("%%For: " + DscText(job.user)).c_str());
    for (const int number : PagesInOrder(count, job)) {
        const Page page(poppler_document_get_page(document.get(), number));
        if (!page)
            return "page " + std::to_string(number + 1) + " cannot be read";
        PrintPage(page.get(), surface.get());
        if (cairo_surface_status(surface.get()) != CAIRO_STATUS_SUCCESS)
            break;
    }
    cairo_surface_finish(surface.get());
    const cairo_status_t written = output.Flush();
    const cairo_status_t drawn = cairo_surface_status(surface.get());
    return Describe(drawn == CAIRO_STATUS_SUCCESS ? written : drawn, output);
}

} // namespace standins
