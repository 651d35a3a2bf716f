#include "tests/filter/module/FilterModule.h"
#include "tests/support/CompoundFile.h"
#include "tests/support/RecordingOffice.h"
#include "tests/support/TemporaryFolder.h"
#include "tests/support/TestPrinter.h"

#include <wx/filename.h>

#include <gmock/gmock.h>

#include <optional>

namespace {

using testing::Contains;
using testing::HasSubstr;
using testing::IsSupersetOf;

class ScreeningTest : public testing::Test {
protected:
    ScreeningTest() { m_plugin->Initialize(wxString()); }
    ~ScreeningTest() override { ForgetOutcome(); }

    /// Writes a compound file with one stream.
    void WriteCompound(const char* name, const char16_t* stream) {
        CompoundFile file;
        file.AddStream(u"Another", "content");
        file.AddStream(stream, std::string(5000, 'd'));
        m_folder.Write(std::filesystem::u8path(name), file.Bytes());
    }

    /// Screens files of the folder by their names; an empty name stays an empty path.
    std::string Screen(const std::vector<wxString>& names) {
        wxArrayString files;
        for (const wxString& name : names)
            files.Add(name.empty() ? name
                                   : wxFileName(m_folder.Path().wstring(), name).GetFullPath());
        return OutcomeInWords(ScreenPaths(files));
    }

    int ScreenPaths(const wxArrayString& paths) {
        ForgetOutcome();
        wxArrayString spare;
        spare.Add("old");
        const int code = m_plugin->ScreenFiles(paths, spare, m_refused, m_items);
        EXPECT_TRUE(spare.empty());
        return code;
    }

    /// "code | names of the accepted | names of the refused"
    std::string OutcomeInWords(int code) const {
        wxString words;
        words << code << " |";
        for (const JobItem* item : m_items)
            words << ' ' << item->fileName;
        words << " |";
        for (const wxString& path : m_refused)
            words << ' ' << path.AfterLast(wxFILE_SEP_PATH);
        return words.utf8_string();
    }

    /// Deletes the items, as the host does.
    void ForgetOutcome() {
        WX_CLEAR_ARRAY(m_items);
        m_refused.Clear();
    }

    TemporaryFolder m_folder;
    std::optional<RecordingOffice> m_office{
        std::in_place,
        std::vector<std::wstring>{L"Word.Application", L"Excel.Application",
                                  L"PowerPoint.Application", L"Publisher.Application"}};
    std::optional<TestPrinter> m_printer{std::in_place, L"Printer", L"Test driver",
                                         m_folder.Write("a.ppd", "x").wstring()};
    PluginUnderTest m_plugin;
    wxArrayString m_refused;
    JobItemArray m_items;
};

TEST_F(ScreeningTest, KnowsALegacyDocumentByItsStream) {
    const std::pair<const char16_t*, const char*> cases[] = {
        {u"WordDocument", "-1005 | a.doc |"},
        {u"Workbook", "-1005 | a.xls |"},
        {u"Book", "-1005 | a.xls |"},
        {u"PowerPoint Document", "-1005 | a.ppt a.pps |"},
        {u"PP40", "-1005 | a.ppt a.pps |"},
        {u"Contents", "0 | a.PUB |"},
        {u"Other", "-1005 | |"},
    };
    for (const auto& [stream, outcome] : cases) {
        for (const char* name : {"a.doc", "a.xls", "a.ppt", "a.pps", "a.PUB"})
            WriteCompound(name, stream);
        EXPECT_EQ(outcome, Screen({"a.doc", "a.xls", "a.ppt", "a.pps", "a.PUB"}));
    }
}

TEST_F(ScreeningTest, HasAnOpenXmlDocumentOpenedByItsApplication) {
    EXPECT_EQ("0 | a.docx a.XLSX a.pptx a.ppsx |",
              Screen({"a.docx", "a.XLSX", "a.pptx", "a.ppsx"}));
    EXPECT_THAT(m_office->JournalInShort(),
                IsSupersetOf({"Documents.15", "Workbooks.682", "Presentations.2004"}));

    const wxString roundabout = "/in//a.xlsx";
    ScreenPaths(wxArrayString(1, &roundabout)); // the check is given what the conversion will be
    EXPECT_THAT(m_office->Journal(),
                Contains(HasSubstr('"' + m_items[0]->paths[0].utf8_string() + '"')));
}

TEST_F(ScreeningTest, RefusesGoesOnAndStopsByTheKindOfFault) {
    WriteCompound("good.doc", u"WordDocument");
    WriteCompound("good.xls", u"Workbook");
    WriteCompound("bad.doc", u"Contents");
    m_folder.Write("package.doc", "PK\x03\x04");
    m_folder.Write("note.txt", "text");
    m_office->On("Documents", 15, [](const auto&) { throw RecordingOffice::Raise{L"broken"}; });

    const struct {
        std::vector<wxString> files;
        const char* outcome;
    } runs[] = {
        {{"good.doc", "note.txt"}, "-1005 | good.doc | note.txt"},
        {{"note.txt", "good.doc"}, "0 | good.doc | note.txt"},
        {{"bad.doc", "good.xls"}, "0 | good.xls |"},
        {{"good.xls", "bad.doc"}, "-1005 | good.xls |"},
        {{"package.doc"}, "-1005 | |"},
        {{"broken.docx"}, "-1005 | |"},
        {{"good.doc.bak", "good", ".doc", "rtf.rtf"}, "-1005 | | good.doc.bak good .doc rtf.rtf"},
        {{"good.doc", "", "good.xls"}, "-1002 | good.doc |"},
        {{}, "-1002 | |"}, // an empty list leaves the result of the run before
    };
    for (const auto& run : runs)
        EXPECT_EQ(run.outcome, Screen(run.files));
}

TEST_F(ScreeningTest, StopsAtANameThatUtf8CannotHold) {
    WriteCompound("good.doc", u"WordDocument");
    const wxString good((m_folder / "good.doc").wstring());
    constexpr wchar_t LoneSurrogates[] = {0xD800, 0xDBFF, 0xDC00, 0xDFFF};
    for (const wchar_t lone : LoneSurrogates) {
        const wxString odd = wxFileName(L"/in", std::wstring(L"a") + lone + L"b.doc").GetFullPath();
        const wxString paths[] = {good, odd, good};
        EXPECT_EQ(-1005, ScreenPaths(wxArrayString(3, paths)));
        EXPECT_EQ(1U, m_items.size());
        EXPECT_EQ(wxArrayString(1, &odd), m_refused);
    }
    for (const char* whole : {"\xf0\x9f\x98\x80.doc", "\xd0\x9f\xd1\x80\xd0\xb8.doc"}) {
        WriteCompound(whole, u"WordDocument");
        EXPECT_EQ(std::string("0 | ") + whole + " |", Screen({wxString::FromUTF8(whole)}));
    }
}

TEST_F(ScreeningTest, StopsWhereThereIsNoPrinter) {
    WriteCompound("a.doc", u"WordDocument");
    EXPECT_TRUE(m_plugin->IsReady());
    m_printer.reset();
    EXPECT_EQ(0, m_plugin->Initialize("no XML"));
    EXPECT_FALSE(m_plugin->IsReady());
    EXPECT_EQ("-1006 | | a.doc", Screen({"a.doc", "a.doc"}));
    EXPECT_EQ("-1006 | | note.txt a.docx", Screen({"note.txt", "a.docx", "a.doc"}));

    const TestPrinter distiller(L"Distiller", L"AdobePS Acrobat Distiller",
                                m_folder.Write("a.bin", "x").wstring()); // whatever its data file
    EXPECT_FALSE(m_plugin->IsReady()); // printers are looked for by Initialize
    m_plugin->Initialize(wxString());
    EXPECT_TRUE(m_plugin->IsReady());
    EXPECT_EQ("0 | a.doc |", Screen({"a.doc"}));
}

TEST_F(ScreeningTest, StopsWhereTheApplicationIsTooOldForTheFormat) {
    WriteCompound("a.doc", u"WordDocument");
    WriteCompound("a.xls", u"Workbook");
    m_office.reset();
    m_office.emplace(std::vector<std::wstring>{L"Word.Application"}, 11);
    EXPECT_EQ("-1006 | a.doc | a.docx", Screen({"a.doc", "a.docx", "a.doc"}));
    EXPECT_EQ("0 | a.xls |", Screen({"a.xls"})); // a legacy document needs any application
    EXPECT_EQ("-1006 | | a.xlsx", Screen({"a.xlsx"}));
    m_office.reset();
    EXPECT_FALSE(m_plugin->IsReady()); // Office is looked for at each call
    EXPECT_EQ("-1006 | | a.doc", Screen({"a.doc"}));
}

TEST_F(ScreeningTest, OfAFolderTakesItsOwnFilesOnly) {
    const std::filesystem::path jobs = m_folder / "jobs";
    std::filesystem::create_directories(jobs / "below");
    WriteCompound("jobs/report.final.DOC", u"WordDocument");
    WriteCompound("jobs/.hidden.doc", u"WordDocument");
    WriteCompound("jobs/below/b.doc", u"WordDocument");
    EXPECT_EQ("0 | report.final.DOC |",
              OutcomeInWords(m_plugin->ScreenFolder(jobs.wstring(), m_refused, m_items)));
    const JobItem& item = *m_items.at(0);
    EXPECT_EQ("ORV.MSOffice.1", item.pluginIdentifier);
    ASSERT_EQ(1U, item.paths.size());
    EXPECT_EQ(wxString((jobs / "report.final.DOC").wstring()), item.paths[0]);
    EXPECT_TRUE(item.spareText.empty());
    EXPECT_EQ(0, item.spareValue);

    ForgetOutcome();
    const std::wstring nowhere = (jobs / "nowhere").wstring();
    EXPECT_EQ("0 | |", OutcomeInWords(m_plugin->ScreenFolder(nowhere, m_refused, m_items)));
}

TEST_F(ScreeningTest, OfAListTakesACopy) {
    WriteCompound("a.doc", u"WordDocument");
    wxArrayString files;
    files.Add((m_folder / "a.doc").wstring());
    files.Add((m_folder / "b.txt").wstring());
    const wxArrayString before = files;
    wxArrayString* list = &files;
    EXPECT_EQ("-1005 | a.doc | b.txt",
              OutcomeInWords(m_plugin->ScreenFileList("not looked at", m_refused, m_items, &list)));
    EXPECT_EQ(before, files);
}

} // namespace
