#include "tests/standins/LoopbackListener.h"
#include "tests/standins/OfficeTest.h"

#include <wx/mstream.h>
#include <wx/zipstrm.h>

namespace {

class NetworkTest : public OfficeTest {};

/// The bytes of an Open XML package.
/// @param parts by their names; $ in them stands for the address of Open XML's schemas
std::string Package(std::initializer_list<std::pair<const char*, wxString>> parts) {
    wxMemoryOutputStream bytes;
    wxZipOutputStream archive(bytes);
    for (auto [name, content] : parts) {
        content.Replace("$", "http://schemas.openxmlformats.org");
        archive.PutNextEntry(name);
        archive.WriteAll(content.utf8_str(), content.utf8_str().length());
    }
    archive.Close();
    std::string result(bytes.GetSize(), '\0');
    bytes.CopyTo(result.data(), result.size());
    return result;
}

/// A Word document with a picture that lies elsewhere.
std::string DocumentWithLink(const std::string& picture) {
    return Package({
        {"[Content_Types].xml", R"(
<Types xmlns="$/package/2006/content-types">
  <Default Extension="rels"
           ContentType="application/vnd.openxmlformats-package.relationships+xml"/>
  <Override PartName="/document.xml" ContentType=
            "application/vnd.openxmlformats-officedocument.wordprocessingml.document.main+xml"/>
</Types>)"},
        {"_rels/.rels", R"(
<Relationships xmlns="$/package/2006/relationships">
  <Relationship Id="rId1" Target="document.xml"
                Type="$/officeDocument/2006/relationships/officeDocument"/>
</Relationships>)"},
        {"_rels/document.xml.rels", R"(
<Relationships xmlns="$/package/2006/relationships">
  <Relationship Id="rId1" Target=")" + picture +
                                        R"(" TargetMode="External"
                Type="$/officeDocument/2006/relationships/image"/>
</Relationships>)"},
        {"document.xml", R"(
<w:document xmlns:w="$/wordprocessingml/2006/main"
            xmlns:r="$/officeDocument/2006/relationships"
            xmlns:wp="$/drawingml/2006/wordprocessingDrawing"
            xmlns:a="$/drawingml/2006/main" xmlns:pic="$/drawingml/2006/picture">
  <w:body><w:p><w:r><w:drawing><wp:inline>
    <wp:extent cx="900000" cy="900000"/>
    <a:graphic><a:graphicData uri="$/drawingml/2006/picture"><pic:pic>
      <pic:blipFill><a:blip r:link="rId1"/></pic:blipFill>
    </pic:pic></a:graphicData></a:graphic>
  </wp:inline></w:drawing></w:r></w:p></w:body>
</w:document>)"},
    });
}

} // namespace

TEST_F(NetworkTest, NoRequestLeavesADocument) {
    const LoopbackListener listener;
    const std::string picture =
        "http://127.0.0.1:" + std::to_string(listener.Port()) + "/picture.png";
    EXPECT_EQ("", Print(m_files.Write("link.docx", DocumentWithLink(picture))));
    EXPECT_FALSE(listener.HasVisitor());
}
