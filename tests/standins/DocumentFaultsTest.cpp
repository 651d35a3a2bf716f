#include "tests/standins/Documents.h"
#include "tests/standins/FakeEngine.h"
#include "tests/standins/OfficeClient.h"
#include "tests/standins/OfficeTest.h"
#include "tests/support/CompoundFile.h"

#include <gmock/gmock.h>
#include <sys/stat.h>

#include <random>

namespace fs = std::filesystem;
using testing::HasSubstr;

namespace {

class DocumentFaultsTest : public OfficeTest {
protected:
    /// Opens a document in Word.
    /// @return what was raised
    static std::wstring Open(const std::wstring& path) {
        WordClient word;
        return RaisedBy([&] { word.Open(path); });
    }
    std::wstring OpenBytes(const fs::path& name, const std::string& bytes) {
        return Open(WidePath(m_files.Write(name, bytes)));
    }
};

std::string RandomBytes(std::size_t size) {
    std::mt19937 random(4711); // NOLINT(cert-msc32-c,cert-msc51-cpp): the same ones each time
    std::string bytes(size, '\0');
    for (char& byte : bytes)
        byte = static_cast<char>(random());
    return bytes;
}

std::string WithStream(std::u16string_view name, const std::string& bytes) {
    CompoundFile file;
    file.AddStream(name, bytes);
    return file.Bytes();
}

std::string Bytes(std::initializer_list<unsigned char> bytes) {
    return {bytes.begin(), bytes.end()};
}

} // namespace

TEST_F(DocumentFaultsTest, WhatCannotBeOpenedIsNotEvenTried) {
    FakeEngine engine("exit 0");
    m_files.Write("empty.docx", "");
    fs::create_directory(m_files / "folder.docx");
    ASSERT_EQ(0, mkfifo((m_files / "pipe.docx").c_str(), 0600));
    fs::create_symlink("/dev/zero", m_files / "device.docx");
    EXPECT_EQ(L"empty.docx cannot be opened: it is empty.", Open(PathOf("empty.docx")));
    EXPECT_EQ(L"missing.docx cannot be opened: No such file or directory.",
              Open(PathOf("missing.docx")));
    for (const std::string name : {"folder.docx", "pipe.docx", "device.docx"})
        EXPECT_EQ(WidePath(name) + L" cannot be opened: it is not a regular file.",
                  Open(PathOf(name)));
    EXPECT_THAT(Open(WidePath(m_files.Write("letter.rtf", "x"))), HasSubstr(L"not a document"));
    EXPECT_THAT(Open(L"/tmp/\xD800.docx"), HasSubstr(L"no file can have this name"));
    EXPECT_EQ(0U, engine.Starts());
}

TEST_F(DocumentFaultsTest, GarbageIsNeverOpened) {
    NEEDS_LIBREOFFICE();
    const std::string letter = ReadBytes(SamplePath("letter.docx"));
    const std::string binaryLetter = ReadBytes(SamplePath("letter.doc"));
    const std::string zip = ZipArchive({{"readme.txt", "Nothing to see here."}});
    const std::vector<std::pair<const char*, std::string>> documents = {
        {"random.doc", RandomBytes(20000)},
        {"random.docx", RandomBytes(20000)},
        {"zip.doc", zip},
        {"zip.docx", zip},
        {"page.docx", "<html><body>A page</body></html>"},
        {"page.doc", "<html><body>A page</body></html>"},
        {"text.doc", "Dear reader"},
        {"truncated.docx", letter.substr(0, letter.size() / 2)},
        {"truncated.doc", binaryLetter.substr(0, 2000)},
        {"package.doc", letter},
        {"binary.docx", binaryLetter},
    };
    for (const auto& [name, bytes] : documents)
        EXPECT_THAT(OpenBytes(name, bytes), HasSubstr(L"LibreOffice cannot load it")) << name;
}

TEST_F(DocumentFaultsTest, CompoundFilesThatLeadInCirclesAreRefused) {
    NEEDS_LIBREOFFICE();
    CompoundFile directory;
    directory.AddStream(u"WordDocument", std::string(5000, 'x'));
    directory.MakeDirectoryCyclic();
    EXPECT_NE(L"", OpenBytes("directory.doc", directory.Bytes()));
    CompoundFile chains;
    chains.AddStream(u"WordDocument", std::string(5000, 'x'));
    chains.MakeChainsCyclic();
    EXPECT_NE(L"", OpenBytes("chains.doc", chains.Bytes()));
}

TEST_F(DocumentFaultsTest, APasswordIsNamedAsTheReason) {
    const FakeEngine engine("echo 'Error: source file could not be loaded' >&2");
    const std::string word = std::string(10, '\0') + Bytes({0x00, 0x01}) + std::string(600, '\0');
    const std::string excel = Bytes({0x09, 0x08, 4, 0, 0, 6, 5, 0, 0x2F, 0, 2, 0, 1, 0});
    const std::string powerPoint = std::string(12, '\0') + Bytes({0xDF, 0xC4, 0xD1, 0xF3});
    const std::vector<std::pair<const char*, std::string>> documents = {
        {"package.docx", WithStream(u"EncryptedPackage", "x")},
        {"word.doc", WithStream(u"WordDocument", word)},
        {"excel.doc", WithStream(u"Workbook", excel)}, // told by what is in it, not by its name
        {"old excel.doc", WithStream(u"Book", excel)},
        {"powerpoint.doc", WithStream(u"Current User", powerPoint)},
    };
    for (const auto& [name, bytes] : documents)
        EXPECT_EQ(WidePath(name) + L" cannot be opened: it is protected by a password.",
                  OpenBytes(name, bytes));
    EXPECT_THAT(OpenBytes("plain.doc", WithStream(u"WordDocument", std::string(600, '\0'))),
                HasSubstr(L"damaged"));
}

TEST_F(DocumentFaultsTest, AnyNameWillDo) {
    FakeEngine engine("cat \"$DOCUMENT\" > \"$PDF\"");
    // The document is the PDF itself here, so that its title can be seen afterwards.
    const std::string pdf = FakeEngine::OnePage();
    const std::vector<std::pair<std::string, std::string>> titles = {
        {"plain name.DOCX", "%%Title: plain name.DOCX\n"},
        {"-dash --outdir x.docx", "%%Title: -dash --outdir x.docx\n"},
        {"'single' \"double\" `back` $HOME;rm -rf ~.docx",
         "%%Title: 'single' \"double\" `back` $HOME;rm -rf ~.docx\n"},
        {"line\nbreak.docx", "%%Title: line\\012break.docx\n"},
        {"(paren) [a,b] %d.docx", "%%Title: \\050paren) [a,b] %d.docx\n"},
        {"Документ 😀.docx", "%%Title: \\376\\377\\004\\024"},
        {std::string(245, 'n') + ".docx", "%%Title: nnnnnnnnnn"},
    };
    WordClient word;
    for (const auto& [name, title] : titles) {
        const fs::path path = m_files.Write(name, pdf + name); // bytes of its own
        EXPECT_EQ(L"", RaisedBy([&] {
                      word::Document document = word.Open(WidePath(path));
                      PrintDocument(document, PrintArguments(WidePath(path) + L".ps"));
                  }))
            << name;
        if (name.size() < 200) {
            EXPECT_THAT(ReadBytes(path.string() + ".ps"), HasSubstr(title));
        }
    }
    EXPECT_EQ(titles.size(), engine.Starts());
}
