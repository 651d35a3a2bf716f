#include "standins/office/printer/PostScriptOutput.h"

#include "standins/office/printer/ColourProcedures.h"
#include "standins/office/printer/DscText.h"
#include "standins/shared/FileBytes.h"

#include <cairo-ps.h>

#include <cmath>
#include <string_view>

namespace standins {

namespace {

constexpr std::size_t Gathered = std::size_t{256} << 10;

} // namespace

Size PaperFor(const PrintJob& job) {
    constexpr Size A4{595, 842};
    return job.papers.empty() ? A4 : Size{job.papers.front().width, job.papers.front().height};
}

PostScriptOutput::PostScriptOutput(int file, const PrintJob& job)
    : m_file(file), m_procedures(ColourProcedures(job.colours)),
      m_surface(cairo_ps_surface_create_for_stream(Take, this, 1, 1), cairo_surface_destroy),
      m_sheet(nullptr, cairo_destroy) {
    m_bytes.reserve(Gathered);
    cairo_ps_surface_restrict_to_level(m_surface.get(), CAIRO_PS_LEVEL_3);
    cairo_ps_surface_dsc_comment(m_surface.get(), ("%%Title: " + DscText(job.title)).c_str());
    cairo_ps_surface_dsc_comment(m_surface.get(), ("%%For: " + DscText(job.user)).c_str());
}

PostScriptOutput::~PostScriptOutput() = default;

cairo_t* PostScriptOutput::NewSheet(Size size) {
    ShowSheet();
    // Paper sizes are whole points; cairo would round them up, and A4 would not be A4 any more.
    cairo_ps_surface_set_size(m_surface.get(), std::round(size.width), std::round(size.height));
    m_sheet.reset(cairo_create(m_surface.get()));
    return m_sheet.get();
}

void PostScriptOutput::ShowSheet() {
    if (m_sheet)
        cairo_show_page(m_sheet.get());
    m_sheet.reset();
}

bool PostScriptOutput::IsGood() const {
    return m_error == 0 && cairo_surface_status(m_surface.get()) == CAIRO_STATUS_SUCCESS;
}

Failure PostScriptOutput::Finish() {
    ShowSheet();
    cairo_surface_finish(m_surface.get());
    if (m_error == 0)
        m_error = Flush();
    if (m_error != 0)
        return {ErrorWords(m_error), Fault::Machine};
    const cairo_status_t drawn = cairo_surface_status(m_surface.get());
    return drawn == CAIRO_STATUS_SUCCESS ? Failure() : Failure{cairo_status_to_string(drawn)};
}

cairo_status_t PostScriptOutput::Take(void* output, const unsigned char* bytes, unsigned size) {
    auto* self = static_cast<PostScriptOutput*>(output);
    self->Add(reinterpret_cast<const char*>(bytes), size);
    return self->m_error == 0 ? CAIRO_STATUS_SUCCESS : CAIRO_STATUS_WRITE_ERROR;
}

void PostScriptOutput::Add(const char* bytes, std::size_t size) {
    m_bytes.insert(m_bytes.end(), bytes, bytes + size);
    AddProcedures();
    if (m_bytes.size() >= Gathered && m_error == 0)
        m_error = Flush();
}

/// Cairo draws with procedures that it defines in the prolog. What is defined behind them holds.
void PostScriptOutput::AddProcedures() {
    constexpr std::string_view EndOfProlog = "%%EndProlog\n";
    if (m_procedures.empty())
        return;
    const std::string_view written(m_bytes.data(), m_bytes.size());
    const std::size_t end = written.find(EndOfProlog);
    if (end == std::string_view::npos)
        return;
    m_bytes.insert(m_bytes.begin() + static_cast<std::ptrdiff_t>(end), m_procedures.begin(),
                   m_procedures.end());
    m_procedures.clear();
}

int PostScriptOutput::Flush() {
    const int error = WriteWhole(m_file, m_bytes.data(), m_bytes.size());
    m_bytes.clear();
    return error;
}

} // namespace standins
