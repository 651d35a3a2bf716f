#include "tests/standins/OfficeClient.h"

#include <gtest/gtest.h>

namespace {

COleVariant Short(SHORT value) {
    return COleVariant(value);
}

} // namespace

WordClient::WordClient() {
    EXPECT_TRUE(application.CreateDispatch(L"Word.Application"));
}

word::Documents WordClient::Documents() {
    return application.GetDocuments();
}

word::Document WordClient::AddDocument() {
    COleVariant none = LeftOut();
    return Documents().Add(none, none, none, none);
}

word::Document WordClient::Open(const std::wstring& path) {
    COleVariant fileName(path.c_str());
    COleVariant readOnly = Short(1);
    COleVariant none = LeftOut();
    return Documents().OpenReadOnly(fileName, readOnly, none);
}

std::wstring WordClient::ActivePrinter() {
    COleVariant answer;
    application.InvokeHelper(66, DISPATCH_PROPERTYGET, VT_VARIANT, (LPVARIANT)answer, nullptr);
    return answer.vt == VT_BSTR ? std::wstring(answer.bstrVal) : std::wstring();
}

void WordClient::Quit() {
    COleVariant no = Short(0);
    COleVariant none = LeftOut();
    application.Quit(no, none, none);
}

PrintArguments::PrintArguments(const std::wstring& fileName)
    : background(Short(0)), append(Short(0)), range(LeftOut()), outputFileName(fileName.c_str()),
      from(LeftOut()), to(LeftOut()), item(LeftOut()), copies(Short(1)), pages(LeftOut()),
      pageType(LeftOut()), printToFile(Short(1)), collate(Short(0)), activePrinterMacGX(LeftOut()),
      manualDuplexPrint(Short(0)), zoomColumn(Short(0)), zoomRow(Short(0)),
      zoomPaperWidth(Short(0)), zoomPaperHeight(Short(0)) {}

void PrintDocument(word::Document& document, PrintArguments a) {
    document.PrintOut(a.background, a.append, a.range, a.outputFileName, a.from, a.to, a.item,
                      a.copies, a.pages, a.pageType, a.printToFile, a.collate, a.activePrinterMacGX,
                      a.manualDuplexPrint, a.zoomColumn, a.zoomRow, a.zoomPaperWidth,
                      a.zoomPaperHeight);
}

void CloseDocument(word::Document& document) {
    COleVariant no = Short(0);
    COleVariant none = LeftOut();
    document.Close(no, none, none);
}

COleVariant LeftOut() {
    return COleVariant(static_cast<LONG>(DISP_E_PARAMNOTFOUND), VT_ERROR);
}

std::wstring RaisedBy(const std::function<void()>& work) {
    std::wstring description;
    try {
        work();
    } catch (COleDispatchException* raised) { // NOLINT(misc-throw-by-value-catch-by-reference)
        description = raised->m_strDescription.GetString();
        raised->Delete();
    } catch (COleException* failed) { // NOLINT(misc-throw-by-value-catch-by-reference)
        wchar_t code[20];
        std::swprintf(code, std::size(code), L"0x%08X", static_cast<unsigned>(failed->m_sc));
        description = code;
        failed->Delete();
    }
    return description;
}
