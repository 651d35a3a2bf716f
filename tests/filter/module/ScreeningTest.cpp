#include "tests/filter/module/FilterModule.h"
#include "tests/support/CompoundFile.h"
#include "tests/support/RecordingOffice.h"
#include "tests/support/TemporaryFolder.h"
#include "tests/support/TestPrinter.h"

#include <wx/filename.h>

#include <gtest/gtest.h>

#include <optional>

namespace {

/// The outcome of a run in words: "code | names of the accepted | names of the refused".
struct Outcome {
    int code = 0;
    wxArrayString refused;
    wxArrayString spare;
    OwnedItems items;

    std::string InWords() const {
        wxString words;
        words << code << " |";
        for (const JobItem* item : items)
            words << ' ' << item->fileName;
        words << " |";
        for (const wxString& path : refused)
            words << ' ' << path.AfterLast(wxFILE_SEP_PATH);
        return words.utf8_string();
    }
};

class ScreeningTest : public testing::Test {
protected:
    ScreeningTest() { m_plugin->Initialize(wxString()); }

    /// Writes a compound file with one stream.
    void WriteCompound(const char* name, const char16_t* stream) {
        CompoundFile file;
        file.AddStream(stream, "content");
        m_folder.Write(name, file.Bytes());
    }

    /// Screens files of the folder by their names; an empty name stays an empty path.
    std::string Screen(const std::vector<std::string>& names) {
        wxArrayString files;
        for (const std::string& name : names)
            files.Add(name.empty() ? wxString() : wxString((m_folder / name).wstring()));
        Outcome outcome;
        outcome.spare.Add("old");
        outcome.code = m_plugin->ScreenFiles(files, outcome.spare, outcome.refused, outcome.items);
        EXPECT_TRUE(outcome.spare.empty());
        return outcome.InWords();
    }

    TemporaryFolder m_folder;
    std::optional<RecordingOffice> m_office{
        std::in_place,
        std::vector<std::wstring>{L"Word.Application", L"Excel.Application",
                                  L"PowerPoint.Application", L"Publisher.Application"}};
    std::optional<TestPrinter> m_printer{std::in_place, L"Printer", L"Test driver",
                                         m_folder.Write("a.ppd", "x").wstring()};
    PluginUnderTest m_plugin;
};

TEST_F(ScreeningTest, TakesEachKindOfDocument) {
    WriteCompound("a.doc", u"WordDocument");
    WriteCompound("a.xls", u"Book");
    WriteCompound("a.ppt", u"PowerPoint Document");
    WriteCompound("a.pps", u"PP40");
    WriteCompound("a.PUB", u"Contents");
    for (const char* name :
         {"a.doc", "a.docx", "a.xls", "a.XLSX", "a.ppt", "a.pps", "a.pptx", "a.ppsx", "a.PUB"})
        EXPECT_EQ(std::string("0 | ") + name + " |", Screen({name}));
}

TEST_F(ScreeningTest, FillsTheItem) {
    WriteCompound("report.final.DOC", u"WordDocument");
    wxArrayString files;
    files.Add((m_folder / "report.final.DOC").wstring());
    Outcome outcome;
    ASSERT_EQ(0, m_plugin->ScreenFiles(files, outcome.spare, outcome.refused, outcome.items));
    ASSERT_EQ(1U, outcome.items.size());
    const JobItem& item = *outcome.items[0];
    EXPECT_EQ("ORV.MSOffice.1", item.pluginIdentifier);
    EXPECT_EQ("report.final.DOC", item.fileName);
    ASSERT_EQ(1U, item.paths.size());
    EXPECT_EQ(files[0], item.paths[0]);
    EXPECT_TRUE(item.spareText.empty());
    EXPECT_EQ(0, item.spareValue);
}

TEST_F(ScreeningTest, RefusesGoesOnAndStopsByTheKindOfFault) {
    WriteCompound("good.doc", u"WordDocument");
    WriteCompound("good.xls", u"Workbook");
    WriteCompound("bad.doc", u"Contents");
    m_folder.Write("package.doc", "PK\x03\x04");
    m_folder.Write("note.txt", "text");
    m_office->On("Documents", 15, [](const auto&) { throw RecordingOffice::Raise{L"broken"}; });

    const struct {
        std::vector<std::string> files;
        const char* outcome;
    } runs[] = {
        {{"good.doc", "note.txt"}, "-1005 | good.doc | note.txt"},
        {{"note.txt", "good.doc"}, "0 | good.doc | note.txt"},
        {{"bad.doc", "good.xls"}, "0 | good.xls |"},
        {{"good.xls", "bad.doc"}, "-1005 | good.xls |"},
        {{"package.doc"}, "-1005 | |"},
        {{"missing.doc"}, "-1005 | |"},
        {{"broken.docx"}, "-1005 | |"},
        {{"good.doc.bak", "good", ".doc", "rtf.rtf"}, "-1005 | | good.doc.bak good .doc rtf.rtf"},
        {{"good.doc", "", "good.xls"}, "-1002 | good.doc |"},
        {{}, "-1002 | |"}, // an empty list leaves the result of the run before
    };
    for (const auto& run : runs)
        EXPECT_EQ(run.outcome, Screen(run.files)) << testing::PrintToString(run.files);
}

TEST_F(ScreeningTest, RefusesAPathThatUtf8CannotHold) {
    WriteCompound("good.doc", u"WordDocument");
    const wxString good((m_folder / "good.doc").wstring());
    for (const wchar_t lone :
         {wchar_t(0xD800), wchar_t(0xDBFF), wchar_t(0xDC00), wchar_t(0xDFFF)}) {
        wxArrayString files;
        files.Add(good);
        files.Add(wxFileName(L"/in", std::wstring(L"a") + lone + L"b.doc").GetFullPath());
        files.Add(good);
        Outcome outcome;
        EXPECT_EQ(-1005,
                  m_plugin->ScreenFiles(files, outcome.spare, outcome.refused, outcome.items));
        EXPECT_EQ(1U, outcome.items.size());
        ASSERT_EQ(1U, outcome.refused.size());
        EXPECT_EQ(files[1], outcome.refused[0]);
    }
    const char* whole[] = {"\xf0\x9f\x98\x80.doc", "\xd0\x9f\xd1\x80\xd0\xb8.doc"};
    for (const char* name : whole) {
        WriteCompound(name, u"WordDocument");
        wxArrayString files;
        files.Add(wxString::FromUTF8((m_folder / name).string()));
        Outcome outcome;
        EXPECT_EQ(0, m_plugin->ScreenFiles(files, outcome.spare, outcome.refused, outcome.items));
        EXPECT_EQ(1U, outcome.items.size());
    }
}

TEST_F(ScreeningTest, StopsWhereTheMachineCannotPrint) {
    WriteCompound("a.doc", u"WordDocument");
    m_printer.reset();
    m_plugin->Initialize(wxString());
    EXPECT_EQ("-1006 | | a.doc", Screen({"a.doc", "a.doc"}));
    EXPECT_EQ("-1006 | | note.txt a.docx", Screen({"note.txt", "a.docx", "a.doc"}));
}

TEST_F(ScreeningTest, StopsWhereTheApplicationIsTooOldForTheFormat) {
    WriteCompound("a.doc", u"WordDocument");
    m_office.reset();
    m_office.emplace(std::vector<std::wstring>{L"Word.Application"}, 11);
    EXPECT_EQ("-1006 | a.doc | a.docx", Screen({"a.doc", "a.docx", "a.doc"}));
    // A legacy document needs some Office application only, whichever it is.
    WriteCompound("a.xls", u"Workbook");
    EXPECT_EQ("0 | a.xls |", Screen({"a.xls"}));
    EXPECT_EQ("-1006 | | a.xlsx", Screen({"a.xlsx"}));
    m_office.reset();
    EXPECT_EQ("-1006 | | a.doc", Screen({"a.doc"}));
}

TEST_F(ScreeningTest, OfAFolderTakesItsOwnFilesOnly) {
    const std::filesystem::path jobs = m_folder / "jobs";
    std::filesystem::create_directories(jobs / "below");
    WriteCompound("jobs/a.doc", u"WordDocument");
    WriteCompound("jobs/.hidden.doc", u"WordDocument");
    WriteCompound("jobs/below/b.doc", u"WordDocument");

    Outcome outcome;
    outcome.code = m_plugin->ScreenFolder(jobs.wstring(), outcome.refused, outcome.items);
    EXPECT_EQ("0 | a.doc |", outcome.InWords());
    ASSERT_EQ(1U, outcome.items.size());
    EXPECT_EQ(wxString((jobs / "a.doc").wstring()), outcome.items[0]->paths[0]);

    Outcome missing;
    missing.code =
        m_plugin->ScreenFolder((m_folder / "nowhere").wstring(), missing.refused, missing.items);
    EXPECT_EQ("0 | |", missing.InWords());
}

TEST_F(ScreeningTest, OfAListTakesACopy) {
    WriteCompound("a.doc", u"WordDocument");
    wxArrayString files;
    files.Add((m_folder / "a.doc").wstring());
    files.Add((m_folder / "b.txt").wstring());
    const wxArrayString before = files;
    wxArrayString* list = &files;
    Outcome outcome;
    outcome.code = m_plugin->ScreenFileList("not looked at", outcome.refused, outcome.items, &list);
    EXPECT_EQ("-1005 | a.doc | b.txt", outcome.InWords());
    EXPECT_EQ(before, files);
}

} // namespace
