#include "tests/standins/Documents.h"

#include <wx/mstream.h>
#include <wx/zipstrm.h>

namespace {

const std::string Xml = R"(<?xml version="1.0" encoding="UTF-8" standalone="yes"?>)";
const std::string Office = "http://schemas.openxmlformats.org/officeDocument/2006/relationships";
const std::string Package = "http://schemas.openxmlformats.org/package/2006";
const std::string Types = "application/vnd.openxmlformats-officedocument.";

struct Relationship {
    std::string id, type, target;
};

std::string Relationships(const std::vector<Relationship>& relationships,
                          const std::string& further = "") {
    std::string xml = Xml + "<Relationships xmlns=\"" + Package + "/relationships\">";
    for (const Relationship& each : relationships)
        xml += "<Relationship Id=\"" + each.id + "\" Type=\"" + Office + "/" + each.type +
               "\" Target=\"" + each.target + "\"/>";
    return xml + further + "</Relationships>";
}

std::string ContentTypes(const std::vector<std::pair<std::string, std::string>>& parts) {
    std::string xml = Xml + "<Types xmlns=\"" + Package + "/content-types\">" +
                      "<Default Extension=\"rels\" ContentType=\""
                      "application/vnd.openxmlformats-package.relationships+xml\"/>";
    for (const auto& [name, type] : parts)
        xml.append("<Override PartName=\"")
            .append(name)
            .append("\" ContentType=\"")
            .append(Types)
            .append(type)
            .append("+xml\"/>");
    return xml + "</Types>";
}

} // namespace

std::string ZipArchive(const std::vector<std::pair<std::string, std::string>>& files) {
    wxMemoryOutputStream bytes;
    wxZipOutputStream archive(bytes);
    for (const auto& [name, content] : files) {
        archive.PutNextEntry(wxString::FromUTF8(name));
        archive.WriteAll(content.data(), content.size());
    }
    archive.Close();
    std::string result(bytes.GetSize(), '\0');
    bytes.CopyTo(result.data(), result.size());
    return result;
}

std::string WordPackage(const std::string& body, const std::string& relationships) {
    return ZipArchive({
        {"[Content_Types].xml",
         ContentTypes({{"/word/document.xml", "wordprocessingml.document.main"}})},
        {"_rels/.rels", Relationships({{"rId1", "officeDocument", "word/document.xml"}})},
        {"word/_rels/document.xml.rels", Relationships({}, relationships)},
        {"word/document.xml",
         Xml +
             "<w:document "
             "xmlns:w=\"http://schemas.openxmlformats.org/wordprocessingml/2006/main\" "
             "xmlns:r=\"" +
             Office +
             "\" "
             "xmlns:wp=\"http://schemas.openxmlformats.org/drawingml/2006/wordprocessingDrawing\" "
             "xmlns:a=\"http://schemas.openxmlformats.org/drawingml/2006/main\" "
             "xmlns:pic=\"http://schemas.openxmlformats.org/drawingml/2006/picture\">"
             "<w:body>" +
             body + "</w:body></w:document>"},
    });
}

std::string Paragraph(const std::string& text) {
    return "<w:p><w:r><w:t>" + text + "</w:t></w:r></w:p>";
}
