#include "tests/standins/OfficeTest.h"

#include "common/CatchAll.h"
#include "machine/OfficeApplication.h"
#include "office/AutomationScope.h"
#include "office/ExcelDriver.h"
#include "office/InstalledApplications.h"
#include "office/OpenXmlCheck.h"
#include "office/PowerPointDriver.h"
#include "office/PowerPointPrintOptions.h"
#include "office/PublisherDriver.h"
#include "office/WordDriver.h"
#include "tests/standins/Processes.h"

#include <gmock/gmock.h>

#include <algorithm>

namespace fs = std::filesystem;

namespace {

ResultCode PrintByDriver(const wxString& document, const wxString& folder,
                         const wxString& printer) {
    const PowerPointOptions options;
    wxString output;
    switch (ApplicationForExtension(document.AfterLast('.')).value()) {
    case OfficeApplication::Word:
        return PrintWordDocument(document, folder, output, nullptr, &printer);
    case OfficeApplication::Excel:
        return PrintExcelWorkbook(document, folder, output, nullptr, &printer);
    case OfficeApplication::PowerPoint:
        return PrintPowerPointPresentation(document, folder, output, nullptr, &printer, &options);
    case OfficeApplication::Publisher:
        return PrintPublisherDocument(document, folder, output, nullptr, &printer);
    }
    return Result::Failure;
}

bool PrintPresentation(const wxString& document, const wxString& output,
                       const PowerPointOptions& options) {
    const AutomationScope scope;
    return CatchAll(false, [&] {
        powerpoint::Application application;
        application.CreateDispatch(ProgIdOf(OfficeApplication::PowerPoint));
        powerpoint::Presentation presentation =
            application.GetPresentations().Open(document.wc_str(), 1, 1, 0);
        powerpoint::PrintOptions printOptions = presentation.GetPrintOptions();
        PutColour(printOptions, options);
        PutContents(printOptions, options);
        PutSwitches(printOptions, options);
        presentation.PrintOut(-1, -1, output.wc_str(), 1, 1);
        return true;
    });
}

} // namespace

OfficeTest::OfficeTest()
    : StandInTest(STANDINS_FOLDER "/office.so", "SOFTWARE\\Orvanta\\Office Stand-Ins"),
      m_installedPrinter(
          m_printer, L"Test driver",
          m_temporary.Write("quillon-test-printer.ppd", "*PPD-Adobe: \"4.3\"\n").wstring()) {}

void OfficeTest::SetUp() {
    m_socketsBefore = AbandonedSockets();
    StandInTest::SetUp();
    if (!IsWordInstalled())
        GTEST_SKIP() << "LibreOffice is not installed";
}

void OfficeTest::TearDown() {
    Call("DllUnregisterServer"); // ends what is kept started
    StandInTest::TearDown();
    // Nothing tells whose a socket is: one that goes soon is that of a test at the same time.
    std::set<std::string> left;
    Await([&] {
        left = AbandonedSockets();
        for (const std::string& socket : m_socketsBefore)
            left.erase(socket);
        return left.empty();
    });
    EXPECT_THAT(left, testing::IsEmpty());
}

std::string OfficeTest::Open(const fs::path& document) {
    return ReasonUnless(TryOpenInWord(FilterPath(document)));
}

std::string OfficeTest::Print(const fs::path& document) {
    return ReasonUnless(PrintByDriver(FilterPath(document), FilterPath(m_outputFolder),
                                      m_printer) == Result::Success);
}

std::string OfficeTest::Print(const fs::path& document, const PowerPointOptions& options) {
    return ReasonUnless(
        PrintPresentation(FilterPath(document), FilterPath(PrintedFile(document)), options));
}

fs::path OfficeTest::PrintedFile(const fs::path& document) const {
    return m_outputFolder / document.filename().replace_extension(".ps");
}

fs::path OfficeTest::NewDocument(const std::string& name) const {
    static int number = 0;
    return m_files.Write(name, "Document " + std::to_string(++number));
}

void OfficeTest::AwaitInWorkFolder(const std::string& file) const {
    Await([&] {
        const fs::directory_iterator folders(m_temporary.Path());
        return std::any_of(begin(folders), end(folders), [&](const fs::directory_entry& folder) {
            return fs::exists(folder.path() / file);
        });
    });
}

pid_t OfficeTest::AwaitLibreOffice() const {
    AwaitInWorkFolder("profile/.lock");
    return AwaitEngine();
}

fs::path Sample(const std::string& name) {
    return fs::path(SAMPLES_FOLDER) / name;
}

wxString FilterPath(const fs::path& path) {
    return wxString::FromUTF8(path.string()); // whatever the locale
}
