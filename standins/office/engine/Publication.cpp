#include "standins/office/engine/Publication.h"

#include <gsf/gsf-infile-msole.h>
#include <gsf/gsf-input-stdio.h>
#include <gsf/gsf-utils.h>

#include <memory>

namespace standins {

namespace {

struct ObjectDeleter {
    void operator()(gpointer object) const { g_object_unref(object); }
};
template <typename Object>
using Reference = std::unique_ptr<Object, ObjectDeleter>;

} // namespace

bool IsPublication(const std::string& path) {
    gsf_init();
    const Reference<GsfInput> file(gsf_input_stdio_new(path.c_str(), nullptr));
    const Reference<GsfInfile> storage(file ? gsf_infile_msole_new(file.get(), nullptr) : nullptr);
    const Reference<GsfInput> contents(storage ? gsf_infile_child_by_name(storage.get(), "Contents")
                                               : nullptr);
    return contents != nullptr;
}

} // namespace standins
