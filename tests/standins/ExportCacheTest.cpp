#include "tests/standins/FakeEngine.h"
#include "tests/standins/OfficeTest.h"

namespace fs = std::filesystem;

namespace {

class ExportCacheTest : public OfficeTest {};

} // namespace

TEST_F(ExportCacheTest, ADocumentIsLoadedOnceAsLongAsItsBytesStay) {
    const FakeEngine engine(FakeEngine::MakePdf());
    const fs::path document = m_files.Write("cached.docx", "The first bytes");
    EXPECT_EQ("", Open(document)); // COM keeps the module that keeps the pages
    EXPECT_EQ("", Print(document));
    EXPECT_EQ(1U, engine.Starts());

    const fs::file_time_type time = fs::last_write_time(document);
    m_files.Write("cached.docx", "The other bytes"); // as many of them, of the same time
    fs::last_write_time(document, time);
    EXPECT_EQ("", Print(document));
    EXPECT_EQ(2U, engine.Starts());

    fs::copy_file(document, m_files / "copy.docx");
    EXPECT_EQ("", Print(m_files / "copy.docx")); // which may print its name
    EXPECT_EQ(3U, engine.Starts());
    fs::copy_file(document, m_files / "copy.doc"); // of another kind
    EXPECT_EQ("", Print(m_files / "copy.doc"));
    EXPECT_EQ(4U, engine.Starts());
}

TEST_F(ExportCacheTest, OnlyOptionsThatChangeTheExportLoadAPresentationAgain) {
    const FakeEngine engine(FakeEngine::MakePdf());
    const fs::path presentation = NewDocument("cached.pptx");
    PowerPointOptions comments{"Handouts", "Grayscale", "6", "2"};
    comments.printCommentsAndInkMarkup = true;
    PowerPointOptions hidden;
    hidden.printHiddenSlides = true;
    PowerPointOptions notes;
    notes.outputType = "Notes Pages";
    const std::pair<PowerPointOptions, std::size_t> prints[] = {
        {PowerPointOptions(), 1}, {comments, 1}, {hidden, 2}, {hidden, 2}, {notes, 3}};
    for (const auto& [options, starts] : prints) {
        EXPECT_EQ("", Print(presentation, options));
        EXPECT_EQ(starts, engine.Starts());
    }
}

TEST_F(ExportCacheTest, WhatCouldNotBeLoadedIsTriedAgain) {
    const fs::path document = NewDocument();
    {
        const FakeEngine engine("exit 1");
        EXPECT_NE("", Open(document));
    }
    const FakeEngine engine(FakeEngine::MakePdf());
    EXPECT_EQ("", Open(document));
}

TEST_F(ExportCacheTest, ManyDocumentsDoNotFillTheMachine) {
    // Each leaves 3 MB; a hundred of them would stay if only their number counted.
    const FakeEngine engine(FakeEngine::MakePdf() + "exec truncate -s 3M \"$PDF\"");
    for (int i = 0; i < 100; ++i)
        EXPECT_EQ("", Open(NewDocument()));
    std::uintmax_t held = 0;
    for (const fs::directory_entry& entry : fs::directory_iterator("/proc/self/fd")) {
        std::error_code gone;
        const fs::path target = fs::read_symlink(entry.path(), gone);
        if (target.string().find(m_temporary.Path().string()) == 0)
            held += fs::file_size(entry.path(), gone);
    }
    EXPECT_GT(held, std::uintmax_t{100} << 20);
    EXPECT_LE(held, std::uintmax_t{256} << 20);
}
