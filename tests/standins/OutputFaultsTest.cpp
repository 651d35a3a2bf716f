#include "tests/standins/FakeEngine.h"
#include "tests/standins/OfficeTest.h"
#include "tests/standins/SmallFileSystem.h"

#include <gmock/gmock.h>
#include <sys/stat.h>

#include <cstdlib>

namespace fs = std::filesystem;
using testing::EndsWith;
using testing::HasSubstr;
using testing::StartsWith;

namespace {

class OutputFaultsTest : public OfficeTest {
protected:
    /// Prints a document of one page into a folder, where it becomes "printed.ps".
    std::string PrintInto(const fs::path& folder) {
        const FakeEngine engine(FakeEngine::MakePdf());
        m_outputFolder = folder;
        return Print(m_files.Write("printed.docx", "A document to print"));
    }
};

/// A page that takes for ever to draw: each form draws the next one four times.
std::string EndlessPage() {
    std::string objects;
    for (int form = 4; form < 40; ++form)
        objects += std::to_string(form) +
                   " 0 obj<</Type/XObject/Subtype/Form/BBox[0 0 200 100]/Resources<</XObject<</X " +
                   std::to_string(form + 1) +
                   " 0 R>>>>/Length 24>>stream\n/X Do /X Do /X Do /X Do \nendstream endobj\n";
    return objects;
}

} // namespace

TEST_F(OutputFaultsTest, AnEarlierFileIsReplacedWhenTheNewOneIsWhole) {
    const fs::path output = m_files.Write("printed.ps", "An earlier file");
    EXPECT_EQ("", PrintInto(m_files.Path()));
    EXPECT_THAT(ReadBytes(output), StartsWith("%!PS-Adobe-"));
    const mode_t mask = umask(0);
    umask(mask);
    EXPECT_EQ(0666 & ~mask, static_cast<mode_t>(fs::status(output).permissions()));
}

TEST_F(OutputFaultsTest, WhatCannotBeWrittenIsTold) {
    for (const char* folder : {"folder", "pipe"})
        fs::create_directory(m_files / folder);
    fs::create_directory(m_files / "folder/printed.ps");
    ASSERT_EQ(0, mkfifo((m_files / "pipe/printed.ps").c_str(), 0600));
    const std::pair<const char*, const char*> folders[] = {
        {"folder", "Is a directory"},
        {"pipe", "File exists"},
        {"missing", "No such file or directory"},
        {"printed.docx", "Not a directory"},
    };
    for (const auto& [folder, reason] : folders) {
        EXPECT_EQ("Word: printed.docx cannot be printed to " +
                      (m_files / folder / "printed.ps").string() + ": " + reason + ".",
                  PrintInto(m_files / folder));
        EXPECT_EQ(std::string("machine: ") + reason, FailureLeft());
    }
    EXPECT_TRUE(fs::is_fifo(m_files / "pipe/printed.ps"));
}

TEST_F(OutputFaultsTest, AFullOrReadOnlyFolderKeepsWhatItHas) {
    const SmallFileSystem fileSystem(m_files / "small", std::size_t{16} << 10);
    NEEDS_MOUNT(fileSystem);
    const fs::path output = m_files.Write("small/printed.ps", "An earlier file");
    m_files.Write("small/other", std::string(std::size_t{12} << 10, 'x')); // all but a page
    EXPECT_NE("", PrintInto(m_files / "small"));
    EXPECT_EQ("machine: there is no room left in the folder of the output", FailureLeft());
    fileSystem.MakeReadOnly();
    EXPECT_THAT(PrintInto(m_files / "small"), EndsWith("Read-only file system."));
    EXPECT_EQ("An earlier file", ReadBytes(output));
    EXPECT_EQ((std::set<std::string>{"printed.docx", "small", "small/other", "small/printed.ps"}),
              Names());
}

TEST_F(OutputFaultsTest, NoRoomForTheEngineIsTold) {
    const SmallFileSystem fileSystem(m_files / "small", std::size_t{256} << 10);
    NEEDS_MOUNT(fileSystem);
    setenv("TMPDIR", (m_files / "small").c_str(), 1);
    const std::string letter = ReadBytes(Sample("letter.docx"));
    for (const std::size_t size : {0, 1 << 20}) { // the engine's own files, or the document's copy
        const fs::path document = m_files.Write("letter.docx", letter + std::string(size, '\0'));
        EXPECT_NE("", Open(document));
        EXPECT_THAT(FailureLeft(), StartsWith("machine: "));
        EXPECT_THAT(FailureLeft(), testing::AnyOf(HasSubstr("there is no room left in "),
                                                  EndsWith("No space left on device")));
        EXPECT_TRUE(fs::is_empty(m_files / "small"));
    }
    setenv("TMPDIR", m_temporary.Path().c_str(), 1);
}

TEST_F(OutputFaultsTest, PagesThatCannotBePrintedInTimeOrAtAllLeaveNoFile) {
    SetLimit("TotalSeconds", 2);
    const std::pair<std::string, std::string> engines[] = {
        {FakeEngine::MakePdf(EndlessPage()), "the PostScript writer took too long."},
        {"echo '%PDF-1.4 and then nothing' > \"$PDF\"", ""},
    };
    for (const auto& [script, reason] : engines) {
        const FakeEngine engine(script);
        const fs::path document = NewDocument();
        const std::string output = PrintedFile(document);
        const std::string failure = Print(document);
        EXPECT_THAT(failure, StartsWith("Word: new.docx cannot be printed to " + output));
        EXPECT_THAT(failure, EndsWith(reason));
        EXPECT_FALSE(fs::exists(output));
    }
}
