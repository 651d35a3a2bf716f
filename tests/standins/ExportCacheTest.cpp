#include "tests/standins/FakeEngine.h"
#include "tests/standins/OfficeClient.h"
#include "tests/standins/OfficePrints.h"
#include "tests/standins/OfficeTest.h"
#include "tests/standins/StandInModule.h"

namespace fs = std::filesystem;

namespace {

class ExportCacheTest : public OfficeTest {
protected:
    void Open(const fs::path& path) {
        WordClient word; // each its own, as a trial open and a print have it
        EXPECT_EQ(L"", RaisedBy([&] {
                      word::Document document = word.Open(WidePath(path));
                      PrintDocument(document, PrintArguments(PathOf("out.ps")));
                      CloseDocument(document);
                      word.Quit();
                  }));
    }
};

} // namespace

TEST_F(ExportCacheTest, ADocumentIsLoadedOnceAsLongAsItsBytesStay) {
    const FakeEngine engine(FakeEngine::MakePdf());
    const fs::path path = m_files.Write("cached.docx", "The first bytes");
    Open(path);
    Open(path);
    EXPECT_EQ(1U, engine.Starts());
    EXPECT_EQ(S_FALSE, StandInModule::Instance().CanUnloadNow()); // what is kept would be lost

    const fs::file_time_type time = fs::last_write_time(path);
    m_files.Write("cached.docx", "The other bytes"); // as many of them, of the same time
    fs::last_write_time(path, time);
    Open(path);
    EXPECT_EQ(2U, engine.Starts());

    fs::copy_file(path, m_files / "copy.docx");
    Open(m_files / "copy.docx");
    EXPECT_EQ(2U, engine.Starts());
    Open(m_files.Write("copy.doc", "The other bytes")); // of another kind
    EXPECT_EQ(3U, engine.Starts());
}

TEST_F(ExportCacheTest, OnlyOptionsThatChangeTheExportLoadAPresentationAgain) {
    const FakeEngine engine(FakeEngine::MakePdf());
    const fs::path path = m_files.Write("cached.pptx", "A presentation for the cache");
    const auto print = [&](const std::function<void(powerpoint::PrintOptions&)>& change) {
        EXPECT_EQ(L"", PrintPresentation(WidePath(path), PathOf("out.ps"), Printer, change));
        return engine.Starts();
    };
    EXPECT_EQ(1U, print({}));
    EXPECT_EQ(1U, print([](powerpoint::PrintOptions& options) {
                  options.PutOutputType(4);
                  options.PutPrintColorType(2);
                  options.PutPrintComments(1);
              }));
    const auto withHidden = [](powerpoint::PrintOptions& options) {
        options.PutPrintHiddenSlides(1);
    };
    EXPECT_EQ(2U, print(withHidden));
    EXPECT_EQ(2U, print(withHidden));
    EXPECT_EQ(3U, print([](powerpoint::PrintOptions& options) { options.PutOutputType(5); }));
}

TEST_F(ExportCacheTest, WhatCouldNotBeLoadedIsTriedAgain) {
    const fs::path path = m_files.Write("again.docx", "A document that is loaded the second time");
    {
        const FakeEngine engine("exit 1");
        WordClient word;
        EXPECT_NE(L"", RaisedBy([&] { word.Open(WidePath(path)); }));
    }
    const FakeEngine engine(FakeEngine::MakePdf());
    Open(path);
    EXPECT_EQ(1U, engine.Starts());
}

TEST_F(ExportCacheTest, ManyDocumentsDoNotFillTheMachine) {
    // Each leaves 3 MB; a hundred of them would stay if only their number counted.
    const FakeEngine engine(FakeEngine::MakePdf() + "truncate -s 3M \"$PDF\"");
    WordClient word;
    std::uintmax_t held = 0;
    for (int i = 0; i < 100; ++i) {
        const fs::path path = m_files.Write("one of many.docx", "Number " + std::to_string(i));
        word.Open(WidePath(path));
    }
    for (const fs::directory_entry& entry : fs::directory_iterator("/proc/self/fd")) {
        std::error_code gone;
        const fs::path target = fs::read_symlink(entry.path(), gone);
        if (target.string().find(m_temporary.Path().string()) == 0)
            held += fs::file_size(entry.path(), gone);
    }
    EXPECT_GT(held, std::uintmax_t{100} << 20);
    EXPECT_LE(held, std::uintmax_t{256} << 20);
}
