#include "standins/inprocess/SupervisedRun.h"
#include "tests/standins/OfficeTest.h"
#include "tests/standins/Packages.h"
#include "tests/standins/Viewers.h"
#include "tests/support/CompoundFile.h"

#include <wx/string.h>

#include <fcntl.h>
#include <gmock/gmock.h>

#include <cstdlib>
#include <string_view>

namespace fs = std::filesystem;
using namespace std::chrono_literals;
using namespace std::string_literals;
using testing::HasSubstr;
using testing::Not;

namespace {

// Each document has a cell with a function of its own macros in it, which is run when the document
// is opened, and shows this word.
constexpr const char* Shown = "macro42";

constexpr std::string_view SpreadsheetWithBasic = R"--(<?xml version="1.0" encoding="UTF-8"?>
<office:document xmlns:office="urn:oasis:names:tc:opendocument:xmlns:office:1.0"
    xmlns:table="urn:oasis:names:tc:opendocument:xmlns:table:1.0"
    xmlns:of="urn:oasis:names:tc:opendocument:xmlns:of:1.2"
    xmlns:script="urn:oasis:names:tc:opendocument:xmlns:script:1.0"
    xmlns:ooo="http://openoffice.org/2004/office" office:version="1.3"
    office:mimetype="application/vnd.oasis.opendocument.spreadsheet">
<office:scripts><office:script script:language="ooo:Basic"><ooo:libraries>
<ooo:library-embedded ooo:name="Standard"><ooo:module ooo:name="Module1"><ooo:source-code>
Function Answer
    Answer = "macro" &amp; 6 * 7
End Function
</ooo:source-code></ooo:module></ooo:library-embedded></ooo:libraries></office:script>
</office:scripts>
<office:body><office:spreadsheet><table:table table:name="A"><table:table-row>
<table:table-cell table:formula="of:=ANSWER()"/></table:table-row></table:table>
</office:spreadsheet></office:body></office:document>)--";

std::string Number(unsigned value, int bytes) {
    std::string number;
    for (; bytes > 0; --bytes, value >>= 8)
        number += static_cast<char>(value & 0xFF);
    return number;
}

/// As VBA packs its streams, with nothing in it that is repeated.
std::string Packed(const std::string& bytes) {
    std::string chunk;
    for (std::size_t place = 0; place < bytes.size(); place += 8)
        chunk += '\0' + bytes.substr(place, 8);
    return '\1' + Number(0xB000U | static_cast<unsigned>(chunk.size() - 1), 2) + chunk;
}

std::string Record(unsigned kind, const std::string& content) {
    return Number(kind, 2) + Number(static_cast<unsigned>(content.size()), 4) + content;
}

/// A project with one module.
std::string VbaProject() {
    const std::string name = "Module1";
    const std::string wideName = "M\0o\0d\0u\0l\0e\0001\0"s;
    const std::string none = Number(0, 4);
    std::string directory = Record(0x01, Number(1, 4)) + Record(0x02, Number(0x409, 4)) +
                            Record(0x14, Number(0x409, 4)) + Record(0x03, Number(1252, 2)) +
                            Record(0x04, "Project") + Record(0x07, none) + Record(0x08, none);
    directory += Number(0x09, 2) + Number(4, 4) + Number(1, 4) + Number(1, 2);
    directory += Record(0x0F, Number(1, 2)) + Record(0x13, Number(0xFFFF, 2));
    directory += Record(0x19, name) + Record(0x47, wideName) + Record(0x1A, name) +
                 Record(0x32, wideName) + Record(0x31, none) + Record(0x1E, none);
    directory += Record(0x2C, Number(0xFFFF, 2)) + Record(0x21, "") + Record(0x2B, "");
    directory += Record(0x10, "");
    CompoundFile file;
    file.AddStream(u"VBA/dir", Packed(directory));
    file.AddStream(u"VBA/_VBA_PROJECT", "\xCC\x61\xFF\xFF\0\0\0"s);
    file.AddStream(u"VBA/Module1", Packed("Attribute VB_Name = \"Module1\"\r\n"
                                          "Function Answer()\r\n"
                                          "Answer = \"macro\" & 6 * 7\r\n"
                                          "End Function\r\n"));
    file.AddStream(u"PROJECT", "Module=Module1\r\nName=\"Project\"\r\n");
    return file.Bytes();
}

/// A workbook with a place for the project.
std::string Workbook() {
    return Package({
        {"[Content_Types].xml", R"(
<Types xmlns="$/package/2006/content-types">
  <Default Extension="rels"
           ContentType="application/vnd.openxmlformats-package.relationships+xml"/>
  <Default Extension="bin" ContentType="application/vnd.ms-office.vbaProject"/>
  <Override PartName="/workbook.xml"
            ContentType="application/vnd.ms-excel.sheet.macroEnabled.main+xml"/>
  <Override PartName="/sheet.xml" ContentType=
            "application/vnd.openxmlformats-officedocument.spreadsheetml.worksheet+xml"/>
</Types>)"},
        {"_rels/.rels", R"(<Relationships xmlns="$/package/2006/relationships"><Relationship
    Id="rId1" Target="workbook.xml"
    Type="$/officeDocument/2006/relationships/officeDocument"/></Relationships>)"},
        {"_rels/workbook.xml.rels", R"(<Relationships xmlns="$/package/2006/relationships">
  <Relationship Id="rId1" Target="sheet.xml" Type="$/officeDocument/2006/relationships/worksheet"/>
  <Relationship Id="rId2" Target="vbaProject.bin"
                Type="http://schemas.microsoft.com/office/2006/relationships/vbaProject"/>
</Relationships>)"},
        {"workbook.xml", R"(
<workbook xmlns="$/spreadsheetml/2006/main" xmlns:r="$/officeDocument/2006/relationships">
  <sheets><sheet name="A" sheetId="1" r:id="rId1"/></sheets>
</workbook>)"},
        {"sheet.xml", R"(
<worksheet xmlns="$/spreadsheetml/2006/main"><sheetData><row r="1">
  <c r="A1"><f>Answer()</f></c></row></sheetData></worksheet>)"},
        {"vbaProject.bin", ""},
    });
}

class MacroTest : public OfficeTest {
protected:
    MacroTest() {
        m_files.Write("plain.xlsx", Workbook());
        m_vba = m_files.Write("vba.xlsx",
                              WithPart(m_files / "plain.xlsx", "vbaProject.bin", VbaProject()));
        m_basic = m_files.Write("basic.fods", SpreadsheetWithBasic);
    }

    fs::path m_vba;
    fs::path m_basic;
};

/// A LibreOffice of a user's who lets macros run.
class TrustingLibreOffice {
public:
    explicit TrustingLibreOffice(const TemporaryFolder& files) : m_files(files) {
        Run("--terminate_after_init"); // makes the profile
    }

    /// The words of a spreadsheet.
    std::string TextOf(const fs::path& document) const {
        const fs::path pdf = m_files / "control.pdf";
        m_files.Write("profile/user/basic/Standard/Module1.xba",
                      R"--(<?xml version="1.0" encoding="UTF-8"?>
<script:module xmlns:script="http://openoffice.org/2000/script" script:name="Module1"
               script:language="StarBasic">Sub Main
Dim load(1) As New com.sun.star.beans.PropertyValue
load(0).Name = "Hidden"
load(0).Value = True
load(1).Name = "MacroExecutionMode"
load(1).Value = com.sun.star.document.MacroExecMode.ALWAYS_EXECUTE_NO_WARN
document = StarDesktop.loadComponentFromURL("file://)--" +
                          document.string() + R"--(", "_blank", 0, load())
Dim store(0) As New com.sun.star.beans.PropertyValue
store(0).Name = "FilterName"
store(0).Value = "calc_pdf_Export"
document.storeToURL("file://)--" +
                          pdf.string() +
                          R"--(", store())
document.close(True)
StarDesktop.terminate()
End Sub
</script:module>)--");
        Run("macro:///Standard.Module1.Main");
        return PdfText(pdf);
    }

private:
    void Run(const std::string& argument) const {
        const std::string command = "TMPDIR='" + m_files.Path().string() +
                                    "' timeout 60 soffice -env:UserInstallation='file://" +
                                    (m_files / "profile").string() + "' --headless " + argument +
                                    " > /dev/null 2>&1";
        EXPECT_EQ(0, std::system(command.c_str())); // NOLINT(concurrency-mt-unsafe,cert-env33-c)
    }

    const TemporaryFolder& m_files;
};

} // namespace

TEST_F(MacroTest, RunsWhereItsUserAllowsIt) {
    const TrustingLibreOffice control(m_files);
    EXPECT_THAT(control.TextOf(m_basic), HasSubstr(Shown));
    EXPECT_THAT(control.TextOf(m_vba), HasSubstr(Shown));
}

TEST_F(MacroTest, OfAWorkbookIsNotRun) {
    for (const long documents : {1, 100}) {
        SetLimit("DocumentsPerStart", documents);
        EXPECT_EQ("", Print(m_vba));
        const std::string text = PostScriptText(PrintedFile(m_vba));
        EXPECT_THAT(text, HasSubstr("#")) << "the cell is not there"; // it shows an error
        EXPECT_THAT(text, Not(HasSubstr(Shown)));
    }
    Call("DllUnregisterServer"); // ends what is kept started
}

/// No application of Office's has such documents, so the engine is asked for one by itself.
TEST_F(MacroTest, InBasicIsNotRun) {
    const standins::Descriptor document(open(m_basic.c_str(), O_RDONLY | O_CLOEXEC));
    standins::SupervisedRun run;
    run.engine = "LibreOffice";
    run.supervisor = STANDINS_FOLDER "/office-engine";
    run.arguments = {"--program=" LIBREOFFICE_PROGRAM, "--document=" + m_basic.string(),
                     "--extension=fods", "--import=OpenDocument Spreadsheet Flat XML",
                     "--export=pdf:calc_pdf_Export"};
    run.descriptors = {document.Get()};
    run.folder = standins::WorkFolder::NewPath("test");
    run.limits = {60s, 60s};
    run.mostMemory = std::uint64_t{1} << 31;
    const standins::Message result = standins::RunSupervised(run);
    ASSERT_EQ(standins::MessageKind::Done, result.kind) << result.text;
    const fs::path pdf = m_files / "basic.pdf";
    fs::copy_file("/proc/self/fd/" + std::to_string(result.attachment.Get()), pdf);
    const std::string text = PdfText(pdf);
    EXPECT_THAT(text, HasSubstr("#")) << "the cell is not there";
    EXPECT_THAT(text, Not(HasSubstr(Shown)));
}
