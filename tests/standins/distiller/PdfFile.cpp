#include "tests/standins/distiller/PdfFile.h"

#include <cairo.h>
#include <gtest/gtest.h>
#include <poppler.h>

#include <memory>

namespace {

struct ObjectDeleter {
    void operator()(gpointer object) const { g_object_unref(object); }
};
using Document = std::unique_ptr<PopplerDocument, ObjectDeleter>;
using Page = std::unique_ptr<PopplerPage, ObjectDeleter>;

std::string Name(PopplerFontsIter* font) {
    const char* name = poppler_fonts_iter_get_name(font);
    return name ? name : "(none)";
}

void ReadFonts(PopplerDocument* document, PdfFile& file) {
    const std::unique_ptr<PopplerFontInfo, ObjectDeleter> fonts(poppler_font_info_new(document));
    PopplerFontsIter* font = nullptr;
    if (!poppler_font_info_scan(fonts.get(), file.pages, &font) || !font)
        return;
    do
        file.embeddedFonts[Name(font)] = poppler_fonts_iter_is_embedded(font);
    while (poppler_fonts_iter_next(font));
    poppler_fonts_iter_free(font);
}

void ReadPage(PopplerPage* page, PdfFile& file) {
    const std::unique_ptr<char, decltype(&g_free)> text(poppler_page_get_text(page), g_free);
    file.text += text.get();
    GList* const pictures = poppler_page_get_image_mapping(page);
    for (const GList* entry = pictures; entry; entry = entry->next) {
        cairo_surface_t* const picture = poppler_page_get_image(
            page, static_cast<const PopplerImageMapping*>(entry->data)->image_id);
        file.pictureWidth = cairo_image_surface_get_width(picture);
        cairo_surface_destroy(picture);
    }
    poppler_page_free_image_mapping(pictures);
}

} // namespace

PdfFile ReadPdf(const std::filesystem::path& path) {
    PdfFile file;
    const Document document(
        poppler_document_new_from_file(("file://" + path.string()).c_str(), nullptr, nullptr));
    if (!document)
        return file;
    guint major = 0;
    guint minor = 0;
    poppler_document_get_pdf_version(document.get(), &major, &minor);
    file.version = std::to_string(major) + "." + std::to_string(minor);
    file.pages = poppler_document_get_n_pages(document.get());
    ReadFonts(document.get(), file);
    for (int i = 0; i < file.pages; ++i)
        ReadPage(Page(poppler_document_get_page(document.get(), i)).get(), file);
    return file;
}
