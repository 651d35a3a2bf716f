#include "tests/standins/Packages.h"

#include "tests/standins/OfficeTest.h"

#include <wx/mstream.h>
#include <wx/wfstream.h>
#include <wx/zipstrm.h>

#include <memory>

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

std::string Package(std::initializer_list<std::pair<const char*, wxString>> parts) {
    wxMemoryOutputStream bytes;
    wxZipOutputStream archive(bytes);
    for (auto [name, content] : parts) {
        content.Replace("$", "http://schemas.openxmlformats.org");
        archive.PutNextEntry(name);
        archive.WriteAll(content.utf8_str(), content.utf8_str().length());
    }
    archive.Close();
    return BytesOf(bytes);
}
