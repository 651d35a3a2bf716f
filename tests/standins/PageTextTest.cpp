#include "machine/RegistryText.h"
#include "tests/standins/FakeEngine.h"
#include "tests/standins/OfficeTest.h"
#include "tests/standins/Packages.h"
#include "tests/standins/Viewers.h"
#include "tests/support/CompoundFile.h"

#include <gmock/gmock.h>

namespace fs = std::filesystem;
using testing::HasSubstr;
using testing::Not;

namespace {

class PageTextTest : public OfficeTest {};

/// What the stand-ins have left for the host of the fonts that are not there. It is gone
/// afterwards.
std::string TakeFontsLeft() {
    const char* const key = "SOFTWARE\\Orvanta\\Stand-Ins\\Last Fonts";
    const auto fonts = ReadRegistryText(wxRegKey::HKCU, key, "Fonts");
    wxRegKey(wxRegKey::HKCU, key).DeleteSelf();
    return fonts.value_or(wxString()).utf8_string();
}

std::string Letter(const std::string& paragraphs) {
    return WithPart("letter.docx", "word/document.xml",
                    "<w:document xmlns:w=\"http://schemas.openxmlformats.org/wordprocessingml/"
                    "2006/main\"><w:body><w:p>" +
                        paragraphs + "</w:p></w:body></w:document>");
}

std::string TextIn(const std::string& font) {
    return "<w:r><w:rPr><w:rFonts w:ascii=\"" + font + "\" w:hAnsi=\"" + font +
           "\"/></w:rPr><w:t>Text</w:t></w:r>";
}

std::string Field(const std::string& instruction) {
    return "<w:r><w:fldChar w:fldCharType=\"begin\"/></w:r><w:r><w:instrText>" + instruction +
           "</w:instrText></w:r><w:r><w:fldChar w:fldCharType=\"separate\"/></w:r><w:r><w:t>stale"
           "</w:t></w:r><w:r><w:fldChar w:fldCharType=\"end\"/></w:r><w:r><w:t>; </w:t></w:r>";
}

/// A letter as Word 95 writes it: the head of the document's stream and the text behind it.
std::string LetterOfWord95(const std::string& text) {
    const auto size = static_cast<char>(text.size());
    std::string stream(0x300, '\0');
    stream.replace(0, 4, {'\xDC', '\xA5', '\x68', '\0'}); // the mark, and the format's number
    stream[0x0C] = '\x65';                                // the oldest format that can read it
    stream[0x19] = '\x03';                                // where the text begins
    stream.replace(0x1C, 2, {size, '\x03'});              // and ends
    stream[0x34] = size;
    CompoundFile file;
    file.AddStream(u"WordDocument", stream + text + std::string(4096, '\0'));
    return file.Bytes();
}

} // namespace

TEST_F(PageTextTest, FontsThatAreNotThereAreLeftForTheHost) {
    const fs::path letter = m_files.Write(
        "fonts.docx", Letter(TextIn("Calibri") + TextIn("No Such Font") + TextIn("Carlito")));
    TakeFontsLeft();
    for (int i = 0; i < 2; ++i) { // the second time it is not loaded again
        EXPECT_EQ("", Print(letter));
        EXPECT_THAT(TakeFontsLeft(),
                    testing::MatchesRegex("Calibri\tCarlito\tmetric\nNo Such Font\t[^\t]+\t\n"));
    }
}

TEST_F(PageTextTest, DocumentsOfWord95ArePrinted) {
    const fs::path letter = m_files.Write("1995.doc", LetterOfWord95("Written in 1995.\r"));
    EXPECT_EQ("", Print(letter));
    EXPECT_THAT(PostScriptText(PrintedFile(letter)), HasSubstr("Written in 1995."));
}

TEST_F(PageTextTest, PresentationsOfPowerPoint95AreImportedAsSuch) {
    const FakeEngine engine("case \"$*\" in *'--infilter=PowerPoint 3'*) ;; *) exit 0;; esac\n" +
                            FakeEngine::MakePdf());
    for (const auto& [streams, isOld] :
         {std::pair(std::vector{u"PP40"}, true), {{u"PP40", u"PowerPoint Document"}, false}}) {
        CompoundFile file;
        for (const char16_t* stream : streams)
            file.AddStream(stream, "slides");
        const fs::path presentation = m_files.Write("1995.ppt", file.Bytes());
        EXPECT_EQ(isOld, Print(presentation, PowerPointOptions()).empty());
    }
}

TEST_F(PageTextTest, DocumentsPrintTheirOwnNameAndFolder) {
    const std::string folder = m_files.Path();
    const fs::path letter =
        m_files.Write("50% #1 é.docx", Letter(Field("FILENAME") + Field("FILENAME \\p")));
    const fs::path book = m_files.Write(
        "a book.xlsx",
        WithPart("book.xlsx", "xl/worksheets/sheet1.xml",
                 "<worksheet xmlns=\"http://schemas.openxmlformats.org/spreadsheetml/2006/main\">"
                 "<cols><col min=\"1\" max=\"1\" width=\"80\" customWidth=\"1\"/></cols>"
                 "<sheetData><row r=\"1\"><c r=\"A1\" t=\"str\"><f>CELL(\"filename\")</f>"
                 "<v>stale</v></c></row></sheetData>"
                 "<headerFooter><oddHeader>&amp;C&amp;F; &amp;Z</oddHeader></headerFooter>"
                 "</worksheet>"));
    for (const auto& [document, texts] :
         {std::pair(letter, std::vector<std::string>{"50% #1 é.docx;", folder + "/50% #1 é.docx;"}),
          {book, {"a book.xlsx; ", folder + "/a book.xlsx'"}}}) {
        EXPECT_EQ("", Print(document));
        const std::string text = PostScriptText(PrintedFile(document));
        for (const std::string& expected : texts)
            EXPECT_THAT(text, HasSubstr(expected));
        EXPECT_THAT(text, Not(HasSubstr("quillon-office")));
        EXPECT_THAT(text, Not(HasSubstr("stale")));
    }
}
