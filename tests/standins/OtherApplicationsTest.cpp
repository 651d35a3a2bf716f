#include "tests/standins/BareLibreOffice.h"
#include "tests/standins/Documents.h"
#include "tests/standins/OfficeClient.h"
#include "tests/standins/OfficeTest.h"

#include <gmock/gmock.h>

#include <map>

namespace {

using testing::HasSubstr;

/// A collection of documents, as a trial open uses it.
struct Collection {
    const wchar_t* progId;
    DISPID collection, open, close, quit;
};

constexpr Collection Excel{L"Excel.Application", 572, 682, 277, 302};
constexpr Collection PowerPoint{L"PowerPoint.Application", 2001, 2004, 2039, 2021};

void Call(COleDispatchDriver& object, DISPID member) {
    object.InvokeHelper(member, DISPATCH_METHOD, VT_EMPTY, nullptr, nullptr);
}

/// Opens the document and closes it again, and quits.
/// @return what was raised
std::wstring TryOpen(const Collection& application, const std::wstring& path) {
    return RaisedBy([&] {
        COleDispatchDriver office;
        ASSERT_TRUE(office.CreateDispatch(application.progId));
        LPDISPATCH found = nullptr;
        office.InvokeHelper(application.collection, DISPATCH_PROPERTYGET, VT_DISPATCH, &found,
                            nullptr);
        COleDispatchDriver collection(found);
        LPDISPATCH opened = nullptr;
        collection.InvokeHelper(application.open, DISPATCH_METHOD, VT_DISPATCH, &opened,
                                reinterpret_cast<const BYTE*>(VTS_BSTR), path.c_str());
        COleDispatchDriver document(opened);
        Call(document, application.close);
        Call(office, application.quit);
        EXPECT_THAT(RaisedBy([&] { Call(office, application.quit); }), HasSubstr(L"has quit"));
    });
}

class OtherApplicationsTest : public OfficeTest {};

} // namespace

TEST_F(OtherApplicationsTest, OpenEveryFormatOfTheirs) {
    NEEDS_LIBREOFFICE();
    const auto book = m_files.Write("book.xlsx", WorkbookPackage("Sum"));
    const auto deck = m_files.Write("deck.pptx", PresentationPackage("Slide", "presentation"));
    const auto show = m_files.Write("show.ppsx", PresentationPackage("Slide", "slideshow"));
    ConvertBare(book, "xls:MS Excel 97");
    const auto binaryDeck = ConvertBare(deck, "ppt:MS PowerPoint 97");
    std::filesystem::copy_file(binaryDeck, m_files / "show.pps");
    for (const char* name : {"book.xlsx", "book.xls"})
        EXPECT_EQ(L"", TryOpen(Excel, PathOf(name))) << name;
    for (const char* name : {"deck.pptx", "deck.ppt", "show.ppsx", "show.pps"})
        EXPECT_EQ(L"", TryOpen(PowerPoint, PathOf(name))) << name;

    // To each its own: the name alone opens nothing.
    EXPECT_THAT(TryOpen(Excel, WidePath(deck)), HasSubstr(L"not a document of this application"));
    m_files.Write("really-a-deck.xlsx", ReadBytes(deck));
    EXPECT_THAT(TryOpen(Excel, PathOf("really-a-deck.xlsx")), HasSubstr(L"another application"));
    m_files.Write("really-a-book.ppt", ReadBytes(m_files / "book.xls"));
    EXPECT_THAT(TryOpen(PowerPoint, PathOf("really-a-book.ppt")), HasSubstr(L"cannot load it"));
}

TEST_F(OtherApplicationsTest, RefuseWhatIsNoDocument) {
    NEEDS_LIBREOFFICE();
    const std::string garbage = "No document at all, whatever its name says.";
    for (const char* extension : {"xls", "xlsx", "ppt", "pptx", "pps", "ppsx"}) {
        const auto file = m_files.Write(std::string("garbage.") + extension, garbage);
        const Collection& application = extension[0] == 'x' ? Excel : PowerPoint;
        EXPECT_THAT(TryOpen(application, WidePath(file)), HasSubstr(L"cannot load it"))
            << extension;
    }
}
