#include "tests/standins/Packages.h"

#include "tests/standins/OfficeTest.h"

#include <wx/mstream.h>
#include <wx/wfstream.h>
#include <wx/zipstrm.h>

#include <algorithm>
#include <memory>
#include <string_view>

namespace {

std::string BytesOf(const wxMemoryOutputStream& stream) {
    std::string bytes(stream.GetSize(), '\0');
    stream.CopyTo(bytes.data(), bytes.size());
    return bytes;
}

} // namespace

std::string WithPart(const std::string& sample, const wxString& part, const std::string& content) {
    wxFileInputStream file(FilterPath(Sample(sample)));
    wxZipInputStream parts(file);
    wxMemoryOutputStream bytes;
    wxZipOutputStream archive(bytes);
    while (std::unique_ptr<wxZipEntry> entry{parts.GetNextEntry()}) {
        if (entry->GetName() != part) {
            archive.CopyEntry(entry.release(), parts);
            continue;
        }
        archive.PutNextEntry(part);
        archive.Write(content.data(), content.size());
    }
    archive.Close();
    return BytesOf(bytes);
}

std::string TestText(const std::string& name, const std::string& value) {
    wxString text = wxString::FromUTF8(ReadBytes(DOCUMENTS_FOLDER "/" + name));
    text.Replace("{}", wxString::FromUTF8(value));
    return text.utf8_string();
}

std::string Package(const std::string& name, const std::string& value) {
    constexpr std::string_view Begin = "\n-- ";
    constexpr std::string_view End = " --\n";
    wxMemoryOutputStream bytes;
    wxZipOutputStream archive(bytes);
    const std::string text = TestText(name + ".txtar", value);
    for (std::size_t at = text.find(Begin); at != std::string::npos;) {
        const std::size_t part = at + Begin.size();
        const std::size_t content = text.find(End, part) + End.size();
        at = text.find(Begin, content - 1);
        archive.PutNextEntry(wxString::FromUTF8(text.substr(part, content - End.size() - part)));
        archive.WriteAll(text.data() + content, std::min(at, text.size()) - content);
    }
    archive.Close();
    return BytesOf(bytes);
}
