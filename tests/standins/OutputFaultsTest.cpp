#include "tests/standins/FakeEngine.h"
#include "tests/standins/OfficeClient.h"
#include "tests/standins/OfficeTest.h"
#include "tests/standins/SmallFileSystem.h"

#include <gmock/gmock.h>
#include <sys/stat.h>
#include <unistd.h>

#include <cstdlib>

namespace fs = std::filesystem;
using testing::HasSubstr;
using testing::StartsWith;

namespace {

class OutputFaultsTest : public OfficeTest {
protected:
    /// Prints a document of one page.
    /// @return what was raised
    std::wstring Print(const fs::path& output) {
        const FakeEngine engine(FakeEngine::MakePdf());
        WordClient word;
        word::Document document =
            word.Open(WidePath(m_files.Write("printed.docx", "A document to print")));
        return RaisedBy([&] { PrintDocument(document, PrintArguments(WidePath(output))); });
    }
};

std::vector<std::string> NamesIn(const fs::path& folder) {
    std::vector<std::string> names;
    for (const fs::directory_entry& entry : fs::directory_iterator(folder))
        names.push_back(entry.path().filename());
    return names;
}

#define NEEDS_MOUNT(fileSystem)                                                                    \
    if (!(fileSystem).IsMounted())                                                                 \
    GTEST_SKIP() << "file systems cannot be mounted here"

} // namespace

TEST_F(OutputFaultsTest, AnEarlierFileIsReplacedWhenTheNewOneIsWhole) {
    const fs::path output = m_files.Write("out.ps", "An earlier file");
    EXPECT_EQ(L"", Print(output));
    EXPECT_THAT(ReadBytes(output), StartsWith("%!PS-Adobe-"));
    const mode_t mask = umask(0);
    umask(mask);
    EXPECT_EQ(0666 & ~mask, static_cast<mode_t>(fs::status(output).permissions()));
}

TEST_F(OutputFaultsTest, WhatIsNoFileIsNotReplaced) {
    fs::create_directory(m_files / "folder.ps");
    ASSERT_EQ(0, mkfifo((m_files / "pipe.ps").c_str(), 0600));
    EXPECT_EQ(L"printed.docx cannot be printed to " + PathOf("folder.ps") + L": Is a directory.",
              Print(m_files / "folder.ps"));
    EXPECT_THAT(Print(m_files / "pipe.ps"), HasSubstr(L"cannot be printed to"));
    EXPECT_TRUE(fs::is_fifo(m_files / "pipe.ps"));
    EXPECT_THAT(Print(m_files / "missing/out.ps"), HasSubstr(L"No such file or directory"));
    EXPECT_THAT(Print(m_files / "printed.docx/out.ps"), HasSubstr(L"Not a directory"));
    EXPECT_THAT(Print(m_files / std::string(300, 'n')), HasSubstr(L"File name too long"));
}

TEST_F(OutputFaultsTest, AFullFolderKeepsWhatItHas) {
    const SmallFileSystem fileSystem(m_files / "small", std::size_t{16} << 10);
    NEEDS_MOUNT(fileSystem);
    const fs::path output = m_files.Write("small/out.ps", "An earlier file");
    m_files.Write("small/other",
                  std::string(std::size_t{12} << 10, 'x')); // room for one page of memory less
    EXPECT_THAT(Print(output), HasSubstr(L"No space left on device"));
    EXPECT_EQ("An earlier file", ReadBytes(output));
    EXPECT_THAT(NamesIn(m_files / "small"), testing::UnorderedElementsAre("out.ps", "other"));
}

TEST_F(OutputFaultsTest, AReadOnlyFolderIsTold) {
    const SmallFileSystem fileSystem(m_files / "small", 1 << 20);
    NEEDS_MOUNT(fileSystem);
    m_files.Write("small/out.ps", "An earlier file");
    fileSystem.MakeReadOnly();
    EXPECT_THAT(Print(m_files / "small/out.ps"), HasSubstr(L"Read-only file system"));
    EXPECT_EQ("An earlier file", ReadBytes(m_files / "small/out.ps"));
}

TEST_F(OutputFaultsTest, NoRoomForTheEngineIsTold) {
    NEEDS_LIBREOFFICE();
    const SmallFileSystem fileSystem(m_files / "small", std::size_t{256} << 10);
    NEEDS_MOUNT(fileSystem);
    setenv("TMPDIR", (m_files / "small").c_str(), 1);
    const std::string letter = ReadBytes(SamplePath("letter.docx"));
    const std::pair<const char*, std::string> documents[] = {
        {"letter.docx", letter},                             // the engine's own files do not fit
        {"large.docx", letter + std::string(1 << 20, '\0')}, // the document does not fit
    };
    WordClient word;
    for (const auto& [name, bytes] : documents) {
        const fs::path document = m_files.Write(name, bytes + "new");
        const std::wstring raised = RaisedBy([&] { word.Open(WidePath(document)); });
        EXPECT_THAT(raised, testing::AnyOf(HasSubstr(L"there is no room left in "),
                                           HasSubstr(L"No space left on device")));
        EXPECT_TRUE(fs::is_empty(m_files / "small"));
    }
    setenv("TMPDIR", m_temporary.Path().c_str(), 1);
}

TEST_F(OutputFaultsTest, APrintThatTakesTooLongIsEnded) {
    NEEDS_LIBREOFFICE();
    WordClient word;
    word::Document document = word.Open(SamplePath("report.docx"));
    SetLimit(L"TotalSeconds", 1);
    PrintArguments arguments(PathOf("endless.ps"));
    arguments.copies = COleVariant(static_cast<SHORT>(32767));
    EXPECT_THAT(RaisedBy([&] { PrintDocument(document, arguments); }),
                HasSubstr(L"the PostScript writer took too long"));
    EXPECT_FALSE(fs::exists(m_files / "endless.ps"));
}

TEST_F(OutputFaultsTest, PagesThatAreNoPdfCannotBePrinted) {
    const FakeEngine engine("echo '%PDF-1.4 and then nothing' > \"$PDF\"");
    WordClient word;
    word::Document document = word.Open(WidePath(m_files.Write("broken.docx", "Broken")));
    EXPECT_THAT(RaisedBy([&] { PrintDocument(document, PrintArguments(PathOf("broken.ps"))); }),
                StartsWith(L"broken.docx cannot be printed to"));
    EXPECT_FALSE(fs::exists(m_files / "broken.ps"));
}
