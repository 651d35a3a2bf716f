#include "standins/office/supervisor/CompoundDocument.h"

#include "standins/office/shared/GObjectReference.h"

#include <gsf/gsf-infile-msole.h>
#include <gsf/gsf-input-stdio.h>
#include <gsf/gsf-utils.h>

#include <array>
#include <cstdint>
#include <string_view>

namespace standins {

namespace {

/// @return null when the file is no compound file
GObjectReference<GsfInfile> OpenCompoundFile(const std::string& path) {
    gsf_init();
    const GObjectReference<GsfInput> file(gsf_input_stdio_new(path.c_str(), nullptr));
    return GObjectReference<GsfInfile>(file ? gsf_infile_msole_new(file.get(), nullptr) : nullptr);
}

GObjectReference<GsfInput> OpenStream(GsfInfile* storage, const char* name) {
    return GObjectReference<GsfInput>(gsf_infile_child_by_name(storage, name));
}

/// A document's stream begins with a mark that Word 6 and 95 share, and the number of the format.
bool IsOfWord6Or95(GsfInfile* storage) {
    constexpr std::uint16_t Mark = 0xA5DC;
    constexpr std::uint16_t First = 0x65;
    constexpr std::uint16_t Last = 0x69;
    const GObjectReference<GsfInput> document = OpenStream(storage, "WordDocument");
    std::array<guint8, 4> start{};
    if (!document || !gsf_input_read(document.get(), start.size(), start.data()))
        return false;
    const unsigned mark = start[0] | static_cast<unsigned>(start[1]) << 8U;
    const unsigned format = start[2] | static_cast<unsigned>(start[3]) << 8U;
    return mark == Mark && format >= First && format <= Last;
}

/// A file may hold the presentation in both formats; then the later one is taken.
bool IsOfPowerPoint95(GsfInfile* storage) {
    return !OpenStream(storage, "PowerPoint Document") && OpenStream(storage, "PP40");
}

} // namespace

std::string ImportFilterOf(const std::string& path, const std::string& byEnding) {
    constexpr std::string_view Presentation = "MS PowerPoint 97"; // and " AutoPlay"
    const bool isText = byEnding == "MS Word 97";
    const bool isPresentation = byEnding.compare(0, Presentation.size(), Presentation) == 0;
    if (!isText && !isPresentation)
        return byEnding;
    const GObjectReference<GsfInfile> storage = OpenCompoundFile(path);
    if (storage && isText && IsOfWord6Or95(storage.get()))
        return "MS Word 95";
    if (storage && isPresentation && IsOfPowerPoint95(storage.get()))
        return "PowerPoint 3"; // that is how LibreOffice calls all up to PowerPoint 95
    return byEnding;
}

bool IsPublication(const std::string& path) {
    const GObjectReference<GsfInfile> storage = OpenCompoundFile(path);
    return storage && OpenStream(storage.get(), "Contents");
}

} // namespace standins
