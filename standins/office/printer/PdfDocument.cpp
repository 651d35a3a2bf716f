#include "standins/office/printer/PdfDocument.h"

#include <fcntl.h>
#include <poppler.h>

#include <ctime>
#include <stdexcept>

namespace standins {

namespace {

/// @param text GLib's, freed here; may be null
std::string Taken(char* text) {
    const std::unique_ptr<char, decltype(&g_free)> owned(text, g_free);
    return text ? std::string(text) : std::string();
}

/// A date of a PDF as people read it.
std::string ReadableDate(const std::string& date) {
    time_t time = 0;
    std::tm parts{};
    char text[40];
    if (date.empty() || !poppler_date_parse(date.c_str(), &time) || !gmtime_r(&time, &parts) ||
        std::strftime(text, sizeof text, "%Y-%m-%d %H:%M", &parts) == 0)
        return {};
    return text;
}

Comment ReadComment(PopplerAnnotMapping* mapping, int page, double pageHeight) {
    PopplerAnnot* note = mapping->annot;
    return {page,
            mapping->area.x1,
            pageHeight - mapping->area.y2,
            Taken(poppler_annot_markup_get_label(POPPLER_ANNOT_MARKUP(note))),
            ReadableDate(Taken(poppler_annot_get_modified(note))),
            Taken(poppler_annot_get_contents(note))};
}

} // namespace

void PdfDocument::ObjectDeleter::operator()(void* object) const {
    g_object_unref(object);
}

PdfDocument::PdfDocument(int file) {
    GError* error = nullptr;
    // Poppler closes what it is given.
    m_document.reset(
        poppler_document_new_from_fd(fcntl(file, F_DUPFD_CLOEXEC, 3), nullptr, &error));
    if (!m_document) {
        const std::string reason = error ? error->message : "it is no PDF";
        g_clear_error(&error);
        throw std::runtime_error(reason);
    }
    if (PageCount() <= 0)
        throw std::runtime_error("it has no pages");
}

int PdfDocument::PageCount() const {
    return poppler_document_get_n_pages(m_document.get());
}

PdfDocument::Page PdfDocument::PageAt(int page) const {
    Page found(poppler_document_get_page(m_document.get(), page));
    if (!found)
        throw std::runtime_error("page " + std::to_string(page + 1) + " cannot be read");
    return found;
}

Size PdfDocument::PageSize(int page) const {
    Size size{};
    poppler_page_get_size(PageAt(page).get(), &size.width, &size.height);
    return size;
}

void PdfDocument::DrawPage(int page, cairo_t* target) const {
    poppler_page_render_for_printing(PageAt(page).get(), target);
}

std::vector<Comment> PdfDocument::Comments() const {
    std::vector<Comment> comments;
    for (int number = 0; number < PageCount(); ++number) {
        const Page page = PageAt(number);
        GList* mappings = poppler_page_get_annot_mapping(page.get());
        for (const GList* each = mappings; each; each = each->next) {
            auto* mapping = static_cast<PopplerAnnotMapping*>(each->data);
            if (poppler_annot_get_annot_type(mapping->annot) == POPPLER_ANNOT_TEXT)
                comments.push_back(ReadComment(mapping, number, PageSize(number).height));
        }
        poppler_page_free_annot_mapping(mappings);
    }
    return comments;
}

} // namespace standins
