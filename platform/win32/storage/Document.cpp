#include "platform/win32/storage/Document.h"

#include "platform/win32/storage/GsfFileInput.h"
#include "platform/win32/storage/GsfMessages.h"
#include "platform/win32/storage/StructureCheck.h"
#include "platform/win32/text/CaseFold.h"
#include "platform/win32/text/Utf8.h"

#include <gsf/gsf-infile-impl.h>
#include <gsf/gsf-infile-msole.h>

#include <algorithm>

namespace win32 {

Document::Document(std::shared_ptr<OpenFile> file, std::string name)
    : m_name(std::move(name)), m_window(std::move(file)) {}

HRESULT Document::Load() {
    const std::lock_guard lock(m_mutex);
    const HRESULT checked = CheckStructure(m_window);
    if (FAILED(checked))
        return checked;
    const GsfMessages messages(m_name);
    const GsfInputPointer input(NewGsfFileInput(m_window));
    m_root.reset(gsf_infile_msole_new(input.get(), nullptr));
    return m_root ? S_OK : STG_E_DOCFILECORRUPT;
}

namespace {

/// gsf_infile_child_by_index, but for the warning that it prints when there is no such child.
GsfInput* ChildByIndex(GsfInfile* parent, int index) {
    const auto* parentClass = reinterpret_cast<const GsfInfileClass*>(
        reinterpret_cast<const GTypeInstance*>(parent)->g_class);
    GError* error = nullptr;
    GsfInput* child = parentClass->child_by_index(parent, index, &error);
    g_clear_error(&error);
    return child;
}

} // namespace

/// @return the index of the root storage's child of that name; -1 when there is none
int Document::FindChild(const std::wstring& name) const {
    const int count = gsf_infile_num_children(m_root.get());
    for (int i = 0; i < count; ++i) {
        const char* found = gsf_infile_name_by_index(m_root.get(), i);
        if (found && SameName(FromUtf8(found), name))
            return i;
    }
    return -1;
}

HRESULT Document::OpenStream(const std::wstring& name, GsfInputPointer& stream, std::wstring& key) {
    const std::lock_guard lock(m_mutex);
    if (m_reverted)
        return STG_E_REVERTED;
    const GsfMessages messages(m_name);
    const int found = FindChild(name);
    if (found < 0)
        return STG_E_FILENOTFOUND;
    key = CaseFold(name);
    if (m_openStreams.count(key) > 0)
        return STG_E_ACCESSDENIED;
    GsfInputPointer opened(ChildByIndex(m_root.get(), found));
    if (!opened)
        return STG_E_DOCFILECORRUPT;
    const bool isStorage =
        GSF_IS_INFILE(opened.get()) && gsf_infile_num_children(GSF_INFILE(opened.get())) >= 0;
    if (isStorage)
        return STG_E_FILENOTFOUND;
    m_openStreams.insert(key);
    stream = std::move(opened);
    return S_OK;
}

void Document::CloseStream(GsfInputPointer stream, const std::wstring& key) {
    const std::lock_guard lock(m_mutex);
    stream.reset();
    m_openStreams.erase(key);
}

HRESULT Document::GetLength(GsfInput* stream, std::uint64_t& length) {
    const std::lock_guard lock(m_mutex);
    length = static_cast<std::uint64_t>(gsf_input_size(stream));
    return m_reverted ? STG_E_REVERTED : S_OK;
}

HRESULT Document::Read(GsfInput* stream, std::uint64_t position, void* buffer, ULONG size,
                       ULONG& read) {
    const std::lock_guard lock(m_mutex);
    if (m_reverted)
        return STG_E_REVERTED;
    const auto length = static_cast<std::uint64_t>(gsf_input_size(stream));
    const std::uint64_t left = length - std::min(length, position);
    const std::size_t count = std::min<std::uint64_t>(size, left);
    if (count == 0)
        return S_OK;
    const GsfMessages messages(m_name);
    if (gsf_input_seek(stream, static_cast<gsf_off_t>(position), G_SEEK_SET) ||
        !gsf_input_read(stream, count, static_cast<guint8*>(buffer)))
        return STG_E_READFAULT;
    read = static_cast<ULONG>(count);
    return S_OK;
}

void Document::Revert() {
    const std::lock_guard lock(m_mutex);
    m_reverted = true;
    m_root.reset();
    m_window.Close();
}

} // namespace win32
