#include "tests/standins/SmallFileSystem.h"
#include "tests/standins/Viewers.h"
#include "tests/standins/distiller/BridgeTest.h"

#include <gmock/gmock.h>
#include <sys/stat.h>

#include <cstdlib>

namespace fs = std::filesystem;
using testing::HasSubstr;

namespace {

class ConversionTest : public BridgeTest {};

/// PostScript that defines a TrueType font with one letter, always under the name of "Same".
std::string TrueTypeFont(const std::string& key, const std::string& bytes) {
    constexpr std::size_t LongestString = 65534;
    constexpr char Digits[] = "0123456789ABCDEF";
    std::string data;
    for (std::size_t i = 0; i < bytes.size(); ++i) {
        const auto byte = static_cast<unsigned char>(bytes[i]);
        data += i % LongestString == 0 ? (i == 0 ? "<" : ">\n<") : "";
        data += {Digits[byte / 16], Digits[byte % 16]};
    }
    return "11 dict begin /FontType 42 def /FontName /Same def /PaintType 0 def\n"
           "/FontMatrix [1 0 0 1 0 0] def /FontBBox [0 0 0 0] def\n"
           "/Encoding 256 array def 0 1 255 { Encoding exch /.notdef put } for\n"
           "Encoding 65 /A put /CharStrings << /.notdef 0 /A 36 >> def\n"
           "/sfnts [" +
           data + ">] def " + key + " currentdict end definefont pop\n";
}

} // namespace

TEST_F(ConversionTest, AnyNameWillDo) {
    for (const std::string name : {"a", "Ä %d 😀;'\n", "-dNOSAFER @x %stdout"}) {
        const fs::path pdf = m_files.Write(name + ".pdf", "An earlier file");
        EXPECT_EQ(0, Convert(m_files.Write(name + ".ps", WordsProgram("Some words")), pdf)) << name;
        fs::rename(pdf, m_files / "plain.pdf");
        EXPECT_EQ("Some words", PdfText(m_files / "plain.pdf")) << name;
    }
    EXPECT_TRUE(m_log.empty());
}

TEST_F(ConversionTest, FontsOfOneNameStayFonts) {
    const fs::path folder = "/usr/share/fonts/truetype/liberation";
    if (!fs::exists(folder / "LiberationSans-Bold.ttf"))
        GTEST_SKIP() << "the Liberation fonts are not installed";
    const std::string program =
        "%!PS\n" + TrueTypeFont("/One", ReadBytes(folder / "LiberationSans-Regular.ttf")) +
        TrueTypeFont("/Two", ReadBytes(folder / "LiberationSans-Bold.ttf")) +
        "/One 24 selectfont 72 600 moveto (A) show /Two 24 selectfont (A) show showpage\n";
    ASSERT_EQ(0, Convert(m_files.Write("fonts.ps", program), m_files / "fonts.pdf"));
    EXPECT_EQ("AA", PdfText(m_files / "fonts.pdf"));
    EXPECT_THAT(PdfFonts(m_files / "fonts.pdf"),
                testing::ElementsAre(testing::Pair("Same", true), testing::Pair("Same-1", true)));
}

TEST_F(ConversionTest, ARequestWithoutItsTextsIsRefused) {
    const char16_t half[] = {0xD800, 0};
    const char16_t* const records[][5] = {
        {nullptr, u"/x", u""}, {u"/x", nullptr, u""}, {u"/x", u"/x", nullptr},
        {half, u"/x", u""},    {u"/x", u"", u""},
    };
    EXPECT_EQ(1, CallBridge(nullptr));
    for (const auto& record : records)
        EXPECT_EQ(1, CallBridge(record));
    EXPECT_EQ(6U, m_log.size());
}

TEST_F(ConversionTest, WhatCannotBeReadOrWrittenIsTold) {
    const fs::path good = m_files.Write("good.ps", WordsProgram("Good"));
    const fs::path pdf = m_files / "out.pdf";
    fs::create_directory(m_files / "folder");
    ASSERT_EQ(0, mkfifo((m_files / "pipe").c_str(), 0600));
    struct {
        fs::path postScript;
        fs::path pdf;
        int result;
        const char* reason;
    } const requests[] = {
        {m_files / "missing.ps", pdf, 2, "No such file or directory"},
        {m_files / "pipe", pdf, 2, "not a regular file"},
        {good, m_files / "folder", 6, "Is a directory"},
        {good, m_files / "pipe", 6, "File exists"},
        {good, m_files / std::string(300, 'n'), 6, "File name too long"},
    };
    for (const auto& request : requests) {
        EXPECT_EQ(request.result, Convert(request.postScript, request.pdf)) << request.reason;
        EXPECT_THAT(ReasonUnless(false), HasSubstr(request.reason));
    }
    EXPECT_EQ((std::set<std::string>{"folder", "good.ps", "pipe"}), Names());
}

TEST_F(ConversionTest, ABrokenProgramLeavesAnEarlierFileAlone) {
    const fs::path pdf = m_files.Write("failed.pdf", "An earlier file");
    const std::pair<std::string, const char*> programs[] = {
        {"no PostScript (at all", "found an error in it: undefined in no"},
        {WordsProgram("First") + "unknown\n", "found an error in it: undefined in unknown"},
        {WordsProgram("First") + "(Error: /other in text) print 1 (x) add\n",
         ": typecheck in --add--"},
        {std::string("%!PS\n\x80\x00\xff", 8), "found an error in it: "},
    };
    for (const auto& [program, reason] : programs)
        EXPECT_THAT(Failure(program), HasSubstr(reason)) << program;
    EXPECT_EQ("An earlier file", ReadBytes(pdf));
}

TEST_F(ConversionTest, AHostileProgramReachesNoOtherFile) {
    const std::string other = m_files.Write("other", "Secret words\n");
    const std::string made = m_files / "made";
    const std::string text = "/Helvetica 24 selectfont 72 600 moveto ";
    const std::string programs[] = {
        text + "{(" + other + ") (r) file 100 string readline pop show} stopped showpage",
        text + "(" + other + ") (r) file 100 string readline pop show showpage",
        text + "(%os%" + other + ") (r) file 100 string readline pop show showpage",
        text + "(%pipe%cat " + other + ") (r) file 100 string readline pop show showpage",
        "(" + other + ") run showpage",
        "(" + other + ") (w) file closefile showpage",
        "(" + other + ") (a) file (x) writestring showpage",
        "(" + made + ") (w) file closefile showpage",
        "(" + other + ") deletefile showpage",
        "(" + other + ") (" + made + ") renamefile showpage",
        "(/dev/fd/3) (" + made + ") renamefile showpage",
        "<< /OutputFile (" + made + ") >> setpagedevice showpage",
        "(png16m) selectdevice << /OutputFile (" + made + ") >> setpagedevice showpage",
        "(/proc/self/environ) (r) file 100 string readstring showpage",
        "(/dev/fd/../../etc/passwd) (r) file 100 string readline showpage",
        "/PermitFileReading [(*)] .setuserparams2 (" + other + ") (r) file showpage",
        "(/) .addcontrolpath (" + other + ") (r) file showpage",
    };
    const std::set<std::string> names{"hostile.ps", "other"};
    for (const std::string& program : programs) { // it fails, or draws a page of nothing
        Convert(m_files.Write("hostile.ps", "%!PS\n" + program + "\n"), m_files / "hostile.pdf");
        EXPECT_EQ("", PdfText(m_files / "hostile.pdf")) << program;
        fs::remove(m_files / "hostile.pdf");
        EXPECT_EQ(names, Names()) << program;
        EXPECT_EQ("Secret words\n", ReadBytes(other)) << program;
    }
}

TEST_F(ConversionTest, AFullDiskIsTold) {
    const SmallFileSystem fileSystem(m_files / "small", std::size_t{64} << 10);
    NEEDS_MOUNT(fileSystem);
    const fs::path postScript = m_files.Write("picture.ps", PictureProgram); // 150 KB of PDF
    const fs::path pdf = m_files.Write("small/picture.pdf", "An earlier file");
    EXPECT_EQ(5, Convert(postScript, pdf));
    setenv("TMPDIR", (m_files / "small").c_str(), 1);
    EXPECT_EQ(5, Convert(postScript, m_files / "picture.pdf"));
    setenv("TMPDIR", m_temporary.Path().c_str(), 1);
    EXPECT_THAT(m_log, testing::ElementsAre(
                           HasSubstr("there is no room left in the folder of the PDF file"),
                           HasSubstr("there is no room left in " + (m_files / "small").string())));
    EXPECT_EQ("An earlier file", ReadBytes(pdf));
    EXPECT_EQ((std::set<std::string>{"picture.ps", "small", "small/picture.pdf"}), Names());
}
