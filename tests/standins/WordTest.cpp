#include "tests/standins/OfficeClient.h"
#include "tests/standins/OfficeTest.h"
#include "tests/standins/PostScriptText.h"

#include <gmock/gmock.h>

namespace fs = std::filesystem;
using testing::HasSubstr;
using testing::StartsWith;

namespace {

class WordTest : public OfficeTest {};

std::wstring HexCode(HRESULT code) {
    wchar_t text[20];
    std::swprintf(text, std::size(text), L"0x%08X", static_cast<unsigned>(code));
    return text;
}

} // namespace

TEST_F(WordTest, PrintsADocumentAsTheDriverDrivesIt) {
    NEEDS_LIBREOFFICE();
    WordClient word;
    word::Document document = word.AddDocument();
    document = word.Open(SamplePath("letter.docx"));
    word::PrintSetupDialog setup = word.application.GetDialogs().GetPrintSetup();
    setup.PutDoNotSetAsSysDefault(TRUE);
    setup.PutPrinter(Printer);
    setup.Execute();
    EXPECT_EQ(Printer, word.ActivePrinter());
    word.application.PutActivePrinter(Printer);
    PrintDocument(document, PrintArguments(PathOf("letter.ps")));
    CloseDocument(document);
    word.Quit();

    const std::string postScript = ReadBytes(m_files / "letter.ps");
    EXPECT_THAT(postScript, StartsWith("%!PS-Adobe-"));
    EXPECT_THAT(postScript, HasSubstr("%%Title: letter.docx\n"));
    EXPECT_THAT(postScript, HasSubstr("%%Pages: 1\n"));
    const std::string text = PostScriptText(m_files / "letter.ps");
    for (const char* words : {"New opening hours", "Größe", "Привет из Софии", "żółć"})
        EXPECT_THAT(text, HasSubstr(words));
}

TEST_F(WordTest, PagesComeOutInTheirSizesAndOrder) {
    NEEDS_LIBREOFFICE();
    WordClient word;
    word::Document document = word.Open(SamplePath("report.docx"));
    PrintDocument(document, PrintArguments(PathOf("report.ps")));
    EXPECT_EQ((std::vector<std::string>{"595x842", "595x842", "842x595", "595x842"}),
              PostScriptPageSizes(m_files / "report.ps"));
    EXPECT_THAT(PostScriptText(m_files / "report.ps", 3), HasSubstr("Machines"));
}

TEST_F(WordTest, PrintsTheBinaryFormat) {
    NEEDS_LIBREOFFICE();
    WordClient word;
    word::Document document = word.Open(SamplePath("letter.doc"));
    PrintDocument(document, PrintArguments(PathOf("letter.ps")));
    EXPECT_THAT(PostScriptText(m_files / "letter.ps"), HasSubstr("New opening hours"));
}

TEST_F(WordTest, CopiesComeOneAfterTheOtherOrPageByPage) {
    NEEDS_LIBREOFFICE();
    WordClient word;
    word::Document document = word.Open(SamplePath("report.docx"));
    PrintArguments arguments(PathOf("copies.ps"));
    arguments.copies = COleVariant(static_cast<SHORT>(2));
    PrintDocument(document, arguments);
    EXPECT_EQ((std::vector<std::string>{"595x842", "595x842", "595x842", "595x842", "842x595",
                                        "842x595", "595x842", "595x842"}),
              PostScriptPageSizes(m_files / "copies.ps"));
    arguments.collate = COleVariant(static_cast<SHORT>(1));
    PrintDocument(document, arguments);
    EXPECT_EQ((std::vector<std::string>{"595x842", "595x842", "842x595", "595x842", "595x842",
                                        "595x842", "842x595", "595x842"}),
              PostScriptPageSizes(m_files / "copies.ps"));
}

TEST_F(WordTest, RefusesToPrintOtherwiseThanAsked) {
    NEEDS_LIBREOFFICE();
    WordClient word;
    word::Document document = word.Open(SamplePath("letter.docx"));
    const COleVariant yes(static_cast<SHORT>(1));
    const COleVariant no(static_cast<SHORT>(0));
    const std::vector<std::pair<COleVariant PrintArguments::*, COleVariant>> changes = {
        {&PrintArguments::append, yes},
        {&PrintArguments::range, yes},
        {&PrintArguments::from, yes},
        {&PrintArguments::to, yes},
        {&PrintArguments::pages, yes},
        {&PrintArguments::pageType, yes},
        {&PrintArguments::item, yes},
        {&PrintArguments::manualDuplexPrint, yes},
        {&PrintArguments::zoomRow, yes},
        {&PrintArguments::zoomPaperWidth, yes},
        {&PrintArguments::copies, no},
        {&PrintArguments::printToFile, no},
        {&PrintArguments::printToFile, LeftOut()},
        {&PrintArguments::outputFileName, LeftOut()},
    };
    for (std::size_t i = 0; i < changes.size(); ++i) {
        PrintArguments arguments(PathOf("never.ps"));
        arguments.*changes[i].first = changes[i].second;
        EXPECT_NE(L"", RaisedBy([&] { PrintDocument(document, arguments); })) << "change " << i;
    }
    EXPECT_FALSE(fs::exists(m_files / "never.ps"));
}

TEST_F(WordTest, RefusesAPrinterThatIsNotThere) {
    NEEDS_LIBREOFFICE();
    WordClient word;
    const std::wstring before = word.ActivePrinter();
    EXPECT_EQ(L"There is no printer named Nowhere.",
              RaisedBy([&] { word.application.PutActivePrinter(L"Nowhere"); }));
    word::PrintSetupDialog setup = word.application.GetDialogs().GetPrintSetup();
    setup.PutPrinter(Printer);
    const auto execute = [&] { setup.Execute(); };
    EXPECT_THAT(RaisedBy(execute), HasSubstr(L"default printer")); // which would be changed
    setup.PutDoNotSetAsSysDefault(TRUE);
    setup.PutPrinter(L"Nowhere");
    EXPECT_THAT(RaisedBy(execute), HasSubstr(L"Nowhere"));
    EXPECT_EQ(before, word.ActivePrinter());
    try {
        word.application.GetDialogs().InvokeHelper(0, DISPATCH_METHOD, VT_EMPTY, nullptr,
                                                   reinterpret_cast<const BYTE*>(VTS_I4), 96);
        ADD_FAILURE() << "there is such a dialog";
    } catch (COleDispatchException* raised) { // NOLINT(misc-throw-by-value-catch-by-reference)
        EXPECT_STREQ(L"Word", raised->m_strSource.GetString());
        EXPECT_STREQ(L"There is no dialog number 96.", raised->m_strDescription.GetString());
        raised->Delete();
    }
}

TEST_F(WordTest, ADocumentIsOpenUntilItIsClosed) {
    NEEDS_LIBREOFFICE();
    WordClient word;
    word::Document blank = word.AddDocument();
    EXPECT_THAT(RaisedBy([&] { PrintDocument(blank, PrintArguments(PathOf("blank.ps"))); }),
                HasSubstr(L"no pages"));
    word::Document document = word.Open(SamplePath("letter.docx"));
    CloseDocument(document);
    EXPECT_EQ(L"letter.docx is closed.", RaisedBy([&] { CloseDocument(document); }));
    EXPECT_EQ(L"letter.docx is closed.",
              RaisedBy([&] { PrintDocument(document, PrintArguments(PathOf("closed.ps"))); }));
}

TEST_F(WordTest, AfterQuitNothingIsAnswered) {
    NEEDS_LIBREOFFICE();
    WordClient word;
    WordClient other;
    word::Document document = word.Open(SamplePath("letter.docx"));
    word::Documents documents = word.Documents();
    word.Quit();
    EXPECT_EQ(L"Word has quit.", RaisedBy([&] { word.Documents(); }));
    EXPECT_EQ(L"Word has quit.", RaisedBy([&] { word.Quit(); }));
    EXPECT_EQ(L"Word has quit.",
              RaisedBy([&] { PrintDocument(document, PrintArguments(PathOf("late.ps"))); }));
    EXPECT_EQ(L"", RaisedBy([&] { other.AddDocument(); })); // another Word goes on
}

TEST_F(WordTest, CallsThatDoNotSuitTheMemberFail) {
    NEEDS_LIBREOFFICE();
    WordClient word;
    word::Documents documents = word.Documents();
    const auto call = [](COleDispatchDriver& object, DISPID member, WORD kind) {
        return RaisedBy([&] { object.InvokeHelper(member, kind, VT_EMPTY, nullptr, nullptr); });
    };
    EXPECT_EQ(HexCode(DISP_E_MEMBERNOTFOUND), call(word.application, 4711, DISPATCH_METHOD));
    EXPECT_EQ(HexCode(DISP_E_MEMBERNOTFOUND), call(word.application, 6, DISPATCH_METHOD));
    EXPECT_EQ(HexCode(DISP_E_BADPARAMCOUNT), call(documents, 15, DISPATCH_METHOD));
    const auto open = [&](COleVariant fileName) {
        return RaisedBy([&] {
            documents.InvokeHelper(15, DISPATCH_METHOD, VT_EMPTY, nullptr,
                                   reinterpret_cast<const BYTE*>(VTS_PVARIANT),
                                   (LPVARIANT)fileName);
        });
    };
    EXPECT_EQ(HexCode(DISP_E_PARAMNOTFOUND), open(LeftOut()));
    COleVariant object;
    object.vt = VT_DISPATCH;
    object.pdispVal = word.application.m_lpDispatch;
    object.pdispVal->AddRef();
    EXPECT_EQ(HexCode(DISP_E_TYPEMISMATCH), open(object));
}

TEST_F(WordTest, MembersHaveNames) {
    NEEDS_LIBREOFFICE();
    WordClient word;
    const auto idOf = [&](const wchar_t* name) {
        std::wstring text = name;
        LPOLESTR names = text.data();
        DISPID id = 0;
        word.application.m_lpDispatch->GetIDsOfNames(IID_NULL, &names, 1, LOCALE_USER_DEFAULT, &id);
        return id;
    };
    EXPECT_EQ(6, idOf(L"documents"));
    EXPECT_EQ(66, idOf(L"ActivePrinter"));
    EXPECT_EQ(DISPID_UNKNOWN, idOf(L"Visible"));
}
