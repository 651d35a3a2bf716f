#include "standins/inprocess/SupervisedRun.h"
#include "tests/standins/OfficeTest.h"
#include "tests/standins/Packages.h"
#include "tests/standins/Viewers.h"
#include "tests/support/CompoundFile.h"

#include <fcntl.h>
#include <gmock/gmock.h>

#include <cstdlib>

namespace fs = std::filesystem;
using namespace std::chrono_literals;
using namespace std::string_literals;
using testing::HasSubstr;
using testing::Not;

namespace {

// Each document has a cell with a function of its own macros in it, which is run when the document
// is opened, and shows this word.
constexpr const char* Shown = "macro42";

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

class MacroTest : public OfficeTest {
protected:
    MacroTest() {
        m_files.Write("plain.xlsx", Package("macro-workbook"));
        m_vba = m_files.Write("vba.xlsx",
                              WithPart(m_files / "plain.xlsx", "vbaProject.bin", VbaProject()));
        m_basic = m_files.Write("basic.fods", TestText("basic.fods"));
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
        m_files.Write("profile/user/basic/Standard/Module1.xba",
                      TestText("export-with-macros.xba", document.string()));
        Run("macro:///Standard.Module1.Main");
        return PdfText(document.string() + ".pdf");
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
