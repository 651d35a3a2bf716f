#include "tests/standins/FakeEngine.h"
#include "tests/standins/OfficeTest.h"
#include "tests/support/CompoundFile.h"

#include <gmock/gmock.h>
#include <sys/stat.h>

namespace fs = std::filesystem;
using testing::EndsWith;
using testing::HasSubstr;
using namespace std::string_literals;

namespace {

using Documents = std::vector<std::pair<std::string, std::string>>; ///< names and bytes

const std::string CannotLoad =
    "LibreOffice cannot load it; the file is damaged or not of its type.";

std::string Refusal(const std::string& name, const std::string& reason) {
    return name + " cannot be opened: " + reason;
}

class DocumentFaultsTest : public OfficeTest {
protected:
    /// Prints documents that are to be refused.
    /// @param reason ends what the application says of each
    void ExpectRefused(const Documents& documents, const std::string& reason) {
        for (const auto& [name, bytes] : documents) {
            const fs::path document = m_files.Write(name, bytes);
            EXPECT_THAT(Print(document), EndsWith(Refusal(name, reason)));
            EXPECT_FALSE(fs::exists(PrintedFile(document))) << name;
        }
    }
};

std::string WithStream(std::u16string_view name, const std::string& bytes) {
    CompoundFile file;
    file.AddStream(name, bytes);
    return file.Bytes();
}

} // namespace

TEST_F(DocumentFaultsTest, WhatCannotBeOpenedIsNotEvenTried) {
    const FakeEngine engine("exit 0");
    fs::create_directory(m_files / "folder.docx");
    ASSERT_EQ(0, mkfifo((m_files / "pipe.docx").c_str(), 0600));
    fs::create_symlink("/dev/zero", m_files / "device.docx");
    m_files.Write("empty.docx", "");
    m_files.Write("letter.rtf", "x");
    const std::pair<std::string, std::string> documents[] = {
        {"folder.docx", "it is not a regular file."},
        {"pipe.docx", "it is not a regular file."},
        {"device.docx", "it is not a regular file."},
        {"empty.docx", "it is empty."},
        {"missing.docx", "No such file or directory."},
        {"letter.rtf", "it is not a document of this application."},
    };
    for (const auto& [name, reason] : documents)
        EXPECT_EQ("Word: " + Refusal(name, reason), Open(m_files / name));
    EXPECT_EQ(0U, engine.Starts());
}

TEST_F(DocumentFaultsTest, GarbageIsNeverOpened) {
    const std::string letter = ReadBytes(Sample("letter.docx"));
    const std::string binaryLetter = ReadBytes(Sample("letter.doc"));
    const std::string compound = WithStream(u"Contents", std::string(5000, 'x'));
    const std::string text = "No document at all, whatever its name.";
    Documents documents = {
        {"page.doc", "<html><body>A page</body></html>"},
        {"empty archive.docx", "PK\5\6" + std::string(18, '\0')},
        {"truncated.docx", letter.substr(0, letter.size() / 2)},
        {"truncated.doc", binaryLetter.substr(0, 2000)},
        {"package.doc", letter},
        {"binary.docx", binaryLetter},
        {"book.ppt", ReadBytes(Sample("book.xls"))},
        {"compound.xls", compound},
        {"compound.ppt", compound},
        {"compound.pub", compound},
    };
    for (const char* extension : {"doc", "docx", "xls", "xlsx", "ppt", "pptx", "pps", "ppsx"})
        documents.emplace_back(std::string("text.") + extension, text);
    ExpectRefused(documents, CannotLoad);
    ExpectRefused({{"text.pub", text}, {"letter.pub", binaryLetter}}, "it is not a publication.");
    ExpectRefused({{"deck.xlsx", ReadBytes(Sample("deck.pptx"))}},
                  "it is a document of another application.");
}

TEST_F(DocumentFaultsTest, BrokenCompoundFilesAreRefused) {
    CompoundFile directory;
    directory.AddStream(u"WordDocument", std::string(5000, 'x'));
    CompoundFile chains = directory;
    directory.MakeDirectoryCyclic();
    chains.MakeChainsCyclic();
    EXPECT_NE("", Print(m_files.Write("directory.doc", directory.Bytes())));
    EXPECT_NE("", Print(m_files.Write("chains.doc", chains.Bytes())));
    const std::string publication = ReadBytes(Sample("publication.pub"));
    EXPECT_NE("", Print(m_files.Write("truncated.pub", publication.substr(0, 3000))));
}

TEST_F(DocumentFaultsTest, APasswordIsNamedAsTheReason) {
    const FakeEngine engine("echo 'Error: source file could not be loaded' >&2");
    const std::string word = std::string(10, '\0') + "\0\1"s + std::string(600, '\0');
    const std::string excel = "\x09\x08\4\0\0\6\5\0\x2F\0\2\0\1\0"s;
    const std::string powerPoint = std::string(12, '\0') + "\xDF\xC4\xD1\xF3";
    ExpectRefused(
        {
            {"package.docx", WithStream(u"EncryptedPackage", "x")},
            {"word.doc", WithStream(u"WordDocument", word)},
            {"excel.doc", WithStream(u"Workbook", excel)}, // told by what is in it, not by its name
            {"old excel.doc", WithStream(u"Book", excel)},
            {"powerpoint.doc", WithStream(u"Current User", powerPoint)},
        },
        "it is protected by a password.");
    ExpectRefused({{"plain.doc", WithStream(u"WordDocument", std::string(600, '\0'))}}, CannotLoad);
}

TEST_F(DocumentFaultsTest, AnyNameWillDo) {
    const FakeEngine engine(FakeEngine::MakePdf());
    const std::pair<std::string, std::string> titles[] = {
        {"plain name.DOCX", "plain name.DOCX\n"},
        {"-dash --outdir x.docx", "-dash --outdir x.docx\n"},
        {"'single' \"double\" `back` $HOME;rm -rf ~.docx",
         "'single' \"double\" `back` $HOME;rm -rf ~.docx\n"},
        {"line\nbreak.docx", "line\\012break.docx\n"},
        {"(paren) [a,b] %d.docx", "\\050paren) [a,b] %d.docx\n"},
        {"Документ 😀.docx", "\\376\\377\\004\\024"},
        {std::string(245, 'n') + ".docx", "nnnnnnnnnn"},
    };
    for (const auto& [name, title] : titles) {
        const fs::path document = NewDocument(name);
        EXPECT_EQ("", Print(document)) << name;
        EXPECT_THAT(ReadBytes(PrintedFile(document)), HasSubstr("%%Title: " + title)) << name;
    }
    EXPECT_EQ(std::size(titles), engine.Starts());
}
