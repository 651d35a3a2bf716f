#include "tests/standins/OfficeClient.h"

#include <gtest/gtest.h>

namespace {

COleVariant Short(SHORT value) {
    return COleVariant(value);
}

COleDispatchDriver Get(COleDispatchDriver& object, DISPID member) {
    LPDISPATCH result = nullptr;
    object.InvokeHelper(member, DISPATCH_PROPERTYGET, VT_DISPATCH, &result, nullptr);
    return COleDispatchDriver(result);
}

const BYTE* Types(const char* types) {
    return reinterpret_cast<const BYTE*>(types);
}

} // namespace

WordClient::WordClient() {
    EXPECT_TRUE(application.CreateDispatch(L"Word.Application"));
}

COleDispatchDriver WordClient::Documents() {
    return Get(application, 6);
}

COleDispatchDriver WordClient::AddDocument() {
    COleVariant none = LeftOut();
    COleDispatchDriver documents = Documents();
    LPDISPATCH document = nullptr;
    documents.InvokeHelper(14, DISPATCH_METHOD, VT_DISPATCH, &document,
                           Types(VTS_PVARIANT VTS_PVARIANT VTS_PVARIANT VTS_PVARIANT),
                           (LPVARIANT)none, (LPVARIANT)none, (LPVARIANT)none, (LPVARIANT)none);
    return COleDispatchDriver(document);
}

COleDispatchDriver WordClient::Open(const std::wstring& path) {
    COleVariant fileName(path.c_str());
    COleVariant readOnly = Short(1);
    COleVariant none = LeftOut();
    COleDispatchDriver documents = Documents();
    LPDISPATCH document = nullptr;
    documents.InvokeHelper(
        15, DISPATCH_METHOD, VT_DISPATCH, &document,
        Types(VTS_PVARIANT VTS_PVARIANT VTS_PVARIANT VTS_PVARIANT VTS_PVARIANT VTS_PVARIANT
                  VTS_PVARIANT VTS_PVARIANT VTS_PVARIANT VTS_PVARIANT VTS_PVARIANT VTS_PVARIANT),
        (LPVARIANT)fileName, (LPVARIANT)none, (LPVARIANT)readOnly, (LPVARIANT)none, (LPVARIANT)none,
        (LPVARIANT)none, (LPVARIANT)none, (LPVARIANT)none, (LPVARIANT)none, (LPVARIANT)none,
        (LPVARIANT)none, (LPVARIANT)none);
    return COleDispatchDriver(document);
}

COleDispatchDriver WordClient::Dialog(LONG index) {
    COleDispatchDriver dialogs = Get(application, 19);
    LPDISPATCH dialog = nullptr;
    dialogs.InvokeHelper(0, DISPATCH_METHOD, VT_DISPATCH, &dialog, Types(VTS_I4), index);
    return COleDispatchDriver(dialog);
}

void WordClient::PutActivePrinter(const std::wstring& printer) {
    application.InvokeHelper(66, DISPATCH_PROPERTYPUT, VT_EMPTY, nullptr, Types(VTS_BSTR),
                             printer.c_str());
}

std::wstring WordClient::ActivePrinter() {
    COleVariant answer;
    application.InvokeHelper(66, DISPATCH_PROPERTYGET, VT_VARIANT, (LPVARIANT)answer, nullptr);
    return answer.vt == VT_BSTR ? std::wstring(answer.bstrVal) : std::wstring();
}

void WordClient::Quit() {
    COleVariant no = Short(0);
    COleVariant none = LeftOut();
    application.InvokeHelper(1105, DISPATCH_METHOD, VT_EMPTY, nullptr,
                             Types(VTS_PVARIANT VTS_PVARIANT VTS_PVARIANT), (LPVARIANT)no,
                             (LPVARIANT)none, (LPVARIANT)none);
}

PrintArguments::PrintArguments(const std::wstring& fileName)
    : background(Short(0)), append(Short(0)), range(LeftOut()), outputFileName(fileName.c_str()),
      from(LeftOut()), to(LeftOut()), item(LeftOut()), copies(Short(1)), pages(LeftOut()),
      pageType(LeftOut()), printToFile(Short(1)), collate(Short(0)), activePrinterMacGX(LeftOut()),
      manualDuplexPrint(Short(0)), zoomColumn(Short(0)), zoomRow(Short(0)),
      zoomPaperWidth(Short(0)), zoomPaperHeight(Short(0)) {}

void PrintDocument(COleDispatchDriver& document, PrintArguments a) {
    document.InvokeHelper(
        444, DISPATCH_METHOD, VT_EMPTY, nullptr,
        Types(
            VTS_PVARIANT VTS_PVARIANT VTS_PVARIANT VTS_PVARIANT VTS_PVARIANT VTS_PVARIANT
                VTS_PVARIANT VTS_PVARIANT VTS_PVARIANT VTS_PVARIANT VTS_PVARIANT VTS_PVARIANT
                    VTS_PVARIANT VTS_PVARIANT VTS_PVARIANT VTS_PVARIANT VTS_PVARIANT VTS_PVARIANT),
        (LPVARIANT)a.background, (LPVARIANT)a.append, (LPVARIANT)a.range,
        (LPVARIANT)a.outputFileName, (LPVARIANT)a.from, (LPVARIANT)a.to, (LPVARIANT)a.item,
        (LPVARIANT)a.copies, (LPVARIANT)a.pages, (LPVARIANT)a.pageType, (LPVARIANT)a.printToFile,
        (LPVARIANT)a.collate, (LPVARIANT)a.activePrinterMacGX, (LPVARIANT)a.manualDuplexPrint,
        (LPVARIANT)a.zoomColumn, (LPVARIANT)a.zoomRow, (LPVARIANT)a.zoomPaperWidth,
        (LPVARIANT)a.zoomPaperHeight);
}

void CloseDocument(COleDispatchDriver& document) {
    COleVariant no = Short(0);
    COleVariant none = LeftOut();
    document.InvokeHelper(1105, DISPATCH_METHOD, VT_EMPTY, nullptr,
                          Types(VTS_PVARIANT VTS_PVARIANT VTS_PVARIANT), (LPVARIANT)no,
                          (LPVARIANT)none, (LPVARIANT)none);
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
