#include "tests/standins/LoopbackListener.h"
#include "tests/standins/OfficeTest.h"
#include "tests/standins/Packages.h"
#include "tests/standins/Viewers.h"

#include <wx/base64.h>

#include <functional>

namespace fs = std::filesystem;

namespace {

/// With a LibreOffice for so many documents.
class LinkedContentTest : public OfficeTest, public testing::WithParamInterface<long> {
protected:
    void SetUp() override {
        OfficeTest::SetUp();
        SetLimit("DocumentsPerStart", GetParam());
    }

    void TearDown() override {
        Call("DllUnregisterServer"); // which ends it
        OfficeTest::TearDown();
    }
};

INSTANTIATE_TEST_SUITE_P(Engines, LinkedContentTest, testing::Values(1, 100));

wxString Relationship(const wxString& target, const wxString& type) {
    return R"(<Relationships xmlns="$/package/2006/relationships"><Relationship Id="rId1" Target=")" +
           target + R"(" Type="$/officeDocument/2006/relationships/)" + type +
           R"("/></Relationships>)";
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
        {"_rels/.rels", Relationship("document.xml", "officeDocument")},
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

/// A workbook with a picture in SVG.
std::string WorkbookWithPicture(const std::string& picture) {
    return Package({
        {"[Content_Types].xml", R"(
<Types xmlns="$/package/2006/content-types">
  <Default Extension="rels"
           ContentType="application/vnd.openxmlformats-package.relationships+xml"/>
  <Default Extension="svg" ContentType="image/svg+xml"/>
  <Override PartName="/workbook.xml" ContentType=
            "application/vnd.openxmlformats-officedocument.spreadsheetml.sheet.main+xml"/>
  <Override PartName="/sheet.xml" ContentType=
            "application/vnd.openxmlformats-officedocument.spreadsheetml.worksheet+xml"/>
  <Override PartName="/drawing.xml"
            ContentType="application/vnd.openxmlformats-officedocument.drawing+xml"/>
</Types>)"},
        {"_rels/.rels", Relationship("workbook.xml", "officeDocument")},
        {"_rels/workbook.xml.rels", Relationship("sheet.xml", "worksheet")},
        {"_rels/sheet.xml.rels", Relationship("drawing.xml", "drawing")},
        {"_rels/drawing.xml.rels", Relationship("picture.svg", "image")},
        {"workbook.xml", R"(
<workbook xmlns="$/spreadsheetml/2006/main" xmlns:r="$/officeDocument/2006/relationships">
  <sheets><sheet name="A" sheetId="1" r:id="rId1"/></sheets>
</workbook>)"},
        {"sheet.xml", R"(
<worksheet xmlns="$/spreadsheetml/2006/main" xmlns:r="$/officeDocument/2006/relationships">
  <sheetData/><drawing r:id="rId1"/>
</worksheet>)"},
        {"drawing.xml", R"(
<d:wsDr xmlns:d="$/drawingml/2006/spreadsheetDrawing" xmlns:a="$/drawingml/2006/main"
        xmlns:r="$/officeDocument/2006/relationships"><d:oneCellAnchor>
  <d:from><d:col>0</d:col><d:colOff>0</d:colOff><d:row>0</d:row><d:rowOff>0</d:rowOff></d:from>
  <d:ext cx="1800000" cy="1800000"/>
  <d:pic><d:nvPicPr><d:cNvPr id="1" name="p"/><d:cNvPicPr/></d:nvPicPr>
    <d:blipFill><a:blip r:embed="rId1"/><a:stretch><a:fillRect/></a:stretch></d:blipFill>
    <d:spPr><a:xfrm><a:off x="0" y="0"/><a:ext cx="1800000" cy="1800000"/></a:xfrm>
      <a:prstGeom prst="rect"/></d:spPr></d:pic><d:clientData/>
</d:oneCellAnchor></d:wsDr>)"},
        {"picture.svg", picture},
    });
}

/// A picture in SVG that has others in it, each of which covers it.
std::string PictureOf(const std::vector<std::string>& addresses) {
    std::string picture = R"(<svg xmlns="http://www.w3.org/2000/svg" width="90" height="90"
        xmlns:xlink="http://www.w3.org/1999/xlink"><rect width="50" height="50" fill="#f0f"/>)";
    for (const std::string& address : addresses)
        picture += R"(<image width="90" height="90" xlink:href=")" + address + R"("/>)";
    return picture + "</svg>";
}

const std::string CyanPng = "iVBORw0KGgoAAAANSUhEUgAAAAEAAAABCAIAAACQd1PeAAAADElEQVR4nGNg"
                            "+P8fAAMBAf+2EqLVAAAAAElFTkSuQmCC";

/// Files of the user's, all of them cyan.
std::vector<fs::path> WriteSecrets(const TemporaryFolder& folder) {
    const wxMemoryBuffer png = wxBase64Decode(CyanPng);
    return {
        folder.Write("secret.png", {static_cast<const char*>(png.GetData()), png.GetDataLen()}),
        folder.Write("secret.svg",
                     R"(<svg xmlns="http://www.w3.org/2000/svg" width="90" height="90">
            <rect width="90" height="90" fill="#0ff"/></svg>)"),
        folder.Write("secret.pdf", "%PDF-1.4\n1 0 obj<</Type/Catalog/Pages 2 0 R>>endobj\n"
                                   "2 0 obj<</Type/Pages/Kids[3 0 R]/Count 1>>endobj\n"
                                   "3 0 obj<</Type/Page/Parent 2 0 R/MediaBox[0 0 90 90]"
                                   "/Contents 4 0 R>>endobj\n"
                                   "4 0 obj<</Length 25>>stream\n0 1 1 rg 0 0 90 90 re f  \n"
                                   "endstream endobj\ntrailer<</Root 1 0 R>>\n%%EOF\n"),
    };
}

} // namespace

TEST_P(LinkedContentTest, NothingOfOtherFilesIsPrinted) {
    const LoopbackListener listener;
    std::vector<std::string> others = {"http://127.0.0.1:" + std::to_string(listener.Port()) +
                                       "/picture.png"};
    const TemporaryFolder users;
    for (const fs::path& secret : WriteSecrets(users))
        others.insert(others.end(), {"file://" + secret.string(), secret.string()});
    const std::pair<const char*, std::function<std::string(const std::string&)>> kinds[] = {
        {"docx",
         [](const auto& svg) { return WithPart("letter.docx", "word/media/rId2.png", svg); }},
        {"pptx",
         [](const auto& svg) { return WithPart("deck.pptx", "ppt/media/rId9-1.png", svg); }},
        {"xlsx", WorkbookWithPicture},
    };
    for (const auto& [kind, document] : kinds) {
        const auto ink = [&, name = std::string("picture.") + kind,
                          make = document](const std::vector<std::string>& addresses) {
            const fs::path path = m_files.Write(name, make(PictureOf(addresses)));
            EXPECT_EQ("", Print(path));
            return InkOf(PrintedFile(path));
        };
        const NumbersOfPages without = ink({});
        EXPECT_NE(without, ink({"data:image/png;base64," + CyanPng})) << kind; // its own is printed
        EXPECT_EQ(without, ink(others)) << kind;
    }
    EXPECT_FALSE(listener.HasVisitor());
}

TEST_P(LinkedContentTest, NoRequestLeavesADocument) {
    const LoopbackListener listener;
    const std::string picture =
        "http://127.0.0.1:" + std::to_string(listener.Port()) + "/picture.png";
    EXPECT_EQ("", Print(m_files.Write("link.docx", DocumentWithLink(picture))));
    EXPECT_FALSE(listener.HasVisitor());
}
