#include "standins/office/engine/Publication.h"

#include "standins/office/GObjectReference.h"

#include <gsf/gsf-infile-msole.h>
#include <gsf/gsf-input-stdio.h>
#include <gsf/gsf-utils.h>

#include <memory>

namespace standins {

bool IsPublication(const std::string& path) {
    gsf_init();
    const GObjectReference<GsfInput> file(gsf_input_stdio_new(path.c_str(), nullptr));
    const GObjectReference<GsfInfile> storage(file ? gsf_infile_msole_new(file.get(), nullptr)
                                                   : nullptr);
    const GObjectReference<GsfInput> contents(
        storage ? gsf_infile_child_by_name(storage.get(), "Contents") : nullptr);
    return contents != nullptr;
}

} // namespace standins
