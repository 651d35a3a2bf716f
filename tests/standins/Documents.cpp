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

std::string WorkbookPackage(const std::string& text) {
    const std::string main =
        "xmlns=\"http://schemas.openxmlformats.org/spreadsheetml/2006/main\" xmlns:r=\"" + Office +
        "\"";
    return ZipArchive({
        {"[Content_Types].xml",
         ContentTypes({{"/xl/workbook.xml", "spreadsheetml.sheet.main"},
                       {"/xl/worksheets/sheet1.xml", "spreadsheetml.worksheet"}})},
        {"_rels/.rels", Relationships({{"rId1", "officeDocument", "xl/workbook.xml"}})},
        {"xl/_rels/workbook.xml.rels",
         Relationships({{"rId1", "worksheet", "worksheets/sheet1.xml"}})},
        {"xl/workbook.xml", Xml + "<workbook " + main +
                                "><sheets><sheet name=\"Sheet1\" sheetId=\"1\" r:id=\"rId1\"/>"
                                "</sheets></workbook>"},
        {"xl/worksheets/sheet1.xml",
         Xml + "<worksheet " + main +
             "><sheetData><row r=\"1\"><c r=\"A1\" t=\"inlineStr\"><is><t>" + text +
             "</t></is></c></row></sheetData></worksheet>"},
    });
}

std::string PresentationPackage(const std::string& text, const std::string& contentType) {
    const std::string main =
        "xmlns:p=\"http://schemas.openxmlformats.org/presentationml/2006/main\" "
        "xmlns:a=\"http://schemas.openxmlformats.org/drawingml/2006/main\" xmlns:r=\"" +
        Office + "\"";
    const std::string box = "<p:sp><p:nvSpPr><p:cNvPr id=\"2\" name=\"Text\"/><p:cNvSpPr/><p:nvPr/>"
                            "</p:nvSpPr><p:spPr><a:xfrm><a:off x=\"900000\" y=\"900000\"/>"
                            "<a:ext cx=\"6000000\" cy=\"900000\"/></a:xfrm>"
                            "<a:prstGeom prst=\"rect\"/></p:spPr><p:txBody><a:bodyPr/>"
                            "<a:p><a:r><a:t>" +
                            text + "</a:t></a:r></a:p></p:txBody></p:sp>";
    return ZipArchive({
        {"[Content_Types].xml",
         ContentTypes({{"/ppt/presentation.xml", "presentationml." + contentType + ".main"},
                       {"/ppt/slides/slide1.xml", "presentationml.slide"}})},
        {"_rels/.rels", Relationships({{"rId1", "officeDocument", "ppt/presentation.xml"}})},
        {"ppt/_rels/presentation.xml.rels",
         Relationships({{"rId1", "slide", "slides/slide1.xml"}})},
        {"ppt/presentation.xml", Xml + "<p:presentation " + main +
                                     "><p:sldIdLst><p:sldId id=\"256\" r:id=\"rId1\"/></p:sldIdLst>"
                                     "<p:sldSz cx=\"9144000\" cy=\"6858000\"/></p:presentation>"},
        {"ppt/slides/slide1.xml", Xml + "<p:sld " + main +
                                      "><p:cSld><p:spTree><p:nvGrpSpPr><p:cNvPr id=\"1\" "
                                      "name=\"\"/><p:cNvGrpSpPr/><p:nvPr/></p:nvGrpSpPr>"
                                      "<p:grpSpPr/>" +
                                      box + "</p:spTree></p:cSld></p:sld>"},
    });
}
