#include "tests/standins/BareLibreOffice.h"
#include "tests/standins/Documents.h"
#include "tests/standins/LoopbackListener.h"
#include "tests/standins/OfficeClient.h"
#include "tests/standins/OfficeTest.h"

namespace {

class NetworkTest : public OfficeTest {};

/// A document that links one picture in its relationships and one by a field.
std::string DocumentWithLinks(const std::string& server) {
    const std::string picture =
        "<w:p><w:r><w:drawing><wp:inline><wp:extent cx=\"900000\" cy=\"900000\"/>"
        "<wp:docPr id=\"1\" name=\"x\"/><a:graphic><a:graphicData "
        "uri=\"http://schemas.openxmlformats.org/drawingml/2006/picture\"><pic:pic><pic:nvPicPr>"
        "<pic:cNvPr id=\"1\" name=\"x\"/><pic:cNvPicPr/></pic:nvPicPr><pic:blipFill>"
        "<a:blip r:link=\"rId9\"/><a:stretch><a:fillRect/></a:stretch></pic:blipFill><pic:spPr>"
        "<a:xfrm><a:off x=\"0\" y=\"0\"/><a:ext cx=\"900000\" cy=\"900000\"/></a:xfrm>"
        "<a:prstGeom prst=\"rect\"/></pic:spPr></pic:pic></a:graphicData></a:graphic>"
        "</wp:inline></w:drawing></w:r></w:p>";
    const std::string field = "<w:p><w:fldSimple w:instr=\"INCLUDEPICTURE &quot;" + server +
                              "field.png&quot; \\d\"><w:r><w:t>x</w:t></w:r></w:fldSimple></w:p>";
    return WordPackage(Paragraph("A document with links") + picture + field,
                       "<Relationship Id=\"rId9\" Type=\"http://schemas.openxmlformats.org/"
                       "officeDocument/2006/relationships/image\" Target=\"" +
                           server + "picture.png\" TargetMode=\"External\"/>");
}

} // namespace

TEST_F(NetworkTest, NoRequestLeavesTheMachine) {
    NEEDS_LIBREOFFICE();
    const LoopbackListener listener;
    const auto document = m_files.Write("links.docx", DocumentWithLinks(listener.Url()));
    WordClient word;
    EXPECT_EQ(L"", RaisedBy([&] {
                  word::Document opened = word.Open(WidePath(document));
                  PrintDocument(opened, PrintArguments(PathOf("links.ps")));
              }));
    EXPECT_EQ(0, listener.Connections());

    ConvertBare(document, "pdf:writer_pdf_Export"); // with LibreOffice's own settings it would
    EXPECT_GT(listener.Connections(), 0);
}
