#include "platform/win32/storage/GsfFileInput.h"

#include <gsf/gsf-input-impl.h>

namespace win32 {

namespace {

// A GObject class, registered by hand: the macros that would write it do not compile cleanly.

struct FileInput {
    GsfInput parent;
    FileWindow* window;
};

const guint8* Read(GsfInput* input, std::size_t size, guint8* buffer) {
    FileWindow& window = *reinterpret_cast<FileInput*>(input)->window;
    const auto offset = static_cast<std::uint64_t>(input->cur_offset);
    if (!buffer)
        return window.At(offset, size);
    return window.ReadInto(buffer, offset, size) ? buffer : nullptr;
}

gboolean Seek(GsfInput* /*input*/, gsf_off_t /*offset*/, GSeekType /*whence*/) {
    return FALSE; // no error: the base class keeps the position
}

GsfInput* Duplicate(GsfInput* input, GError** /*error*/) {
    return NewGsfFileInput(*reinterpret_cast<FileInput*>(input)->window);
}

void InitialiseClass(gpointer memory, gpointer /*data*/) {
    auto* inputClass = static_cast<GsfInputClass*>(memory);
    inputClass->Read = Read;
    inputClass->Seek = Seek;
    inputClass->Dup = Duplicate;
}

GType FileInputType() {
    static const GType type = g_type_register_static_simple(
        gsf_input_get_type(), "QuillonFileInput", sizeof(GsfInputClass), InitialiseClass,
        sizeof(FileInput), nullptr, G_TYPE_FLAG_NONE);
    return type;
}

} // namespace

GsfInput* NewGsfFileInput(FileWindow& window) {
    auto* input = static_cast<FileInput*>(g_object_new(FileInputType(), nullptr));
    input->window = &window;
    gsf_input_set_size(&input->parent, static_cast<gsf_off_t>(window.Size()));
    return &input->parent;
}

} // namespace win32
