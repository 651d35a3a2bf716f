#pragma once

#include "platform/win32/storage/FileWindow.h"

#include <objidl.h>

#include <gsf/gsf-infile.h>

#include <memory>
#include <mutex>
#include <set>
#include <string>

namespace win32 {

struct GObjectRelease {
    void operator()(void* object) const { g_object_unref(object); }
};
using GsfInputPointer = std::unique_ptr<GsfInput, GObjectRelease>;

/// An open compound file, shared by its storage and the streams that were opened from it. The
/// functions lock it; libgsf knows nothing of threads.
class Document {
public:
    /// @param name of the file, for messages
    Document(std::shared_ptr<OpenFile> file, std::string name);

    /// Reads the tables; to be called once, before anything else.
    HRESULT Load();

    /// Opens a stream of the root storage. One can be open once at a time.
    /// @param key receives what CloseStream wants
    HRESULT OpenStream(const std::wstring& name, GsfInputPointer& stream, std::wstring& key);
    void CloseStream(GsfInputPointer stream, const std::wstring& key);

    HRESULT GetLength(GsfInput* stream, std::uint64_t& length);

    /// @param position in the stream, in bytes
    /// @param read receives the number of bytes read, less than `size` at the stream's end
    HRESULT Read(GsfInput* stream, std::uint64_t position, void* buffer, ULONG size, ULONG& read);

    /// The storage is gone: closes the file, and the streams answer STG_E_REVERTED from now on.
    void Revert();

private:
    int FindChild(const std::wstring& name) const;

    std::mutex m_mutex;
    std::string m_name;
    FileWindow m_window;
    std::unique_ptr<GsfInfile, GObjectRelease> m_root; // in front of what it reads through
    std::set<std::wstring> m_openStreams;              // by case-folded name
    bool m_reverted = false;
};

} // namespace win32
