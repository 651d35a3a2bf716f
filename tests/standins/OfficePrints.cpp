#include "tests/standins/OfficePrints.h"

#include "office/StandardArguments.h"
#include "office/dispatch/ExcelObjects.h"
#include "office/dispatch/PublisherObjects.h"
#include "tests/standins/OfficeClient.h"

#include <gtest/gtest.h>

std::wstring PrintWorkbook(const std::wstring& path, const std::wstring& output,
                           const std::wstring& printer) {
    return RaisedBy([&] {
        excel::Application application;
        ASSERT_TRUE(application.CreateDispatch(L"Excel.Application"));
        StandardArguments arg;
        COleVariant copies(static_cast<SHORT>(1));
        COleVariant activePrinter(printer.c_str());
        COleVariant fileName(output.c_str());
        excel::Workbook workbook =
            application.GetWorkbooks().OpenReadOnly(path.c_str(), arg.ArgTrue, arg.ArgOmitted);
        workbook.PrintOut(arg.ArgOmitted, arg.ArgOmitted, copies, arg.ArgFalse, activePrinter,
                          arg.ArgTrue, arg.ArgFalse, fileName);
        workbook.Close(arg.ArgFalse, arg.ArgOmitted, arg.ArgOmitted);
        application.Quit();
        EXPECT_EQ(L"Excel has quit.", RaisedBy([&] { application.GetWorkbooks(); }));
    });
}

std::wstring PrintPresentation(const std::wstring& path, const std::wstring& output,
                               const std::wstring& printer,
                               const std::function<void(powerpoint::PrintOptions&)>& change) {
    return RaisedBy([&] {
        powerpoint::Application application;
        ASSERT_TRUE(application.CreateDispatch(L"PowerPoint.Application"));
        powerpoint::Presentation presentation =
            application.GetPresentations().Open(path.c_str(), 1, 1, 0);
        powerpoint::PrintOptions options = presentation.GetPrintOptions();
        options.PutActivePrinter(printer.c_str());
        options.PutPrintInBackground(0);
        options.PutFitToPage(0);
        options.PutPrintHiddenSlides(0);
        options.PutFrameSlides(0);
        options.PutPrintComments(0);
        if (change)
            change(options);
        presentation.PrintOut(-1, -1, output.c_str(), 1, 1);
        presentation.Close();
        EXPECT_NE(L"", RaisedBy([&] { presentation.Close(); }));
    });
}

std::wstring PrintPublication(const std::wstring& path, const std::wstring& output,
                              const std::wstring& printer) {
    return RaisedBy([&] {
        publisher::Application application;
        ASSERT_TRUE(application.CreateDispatch(L"Publisher.Application"));
        publisher::Document publication = application.Open(path.c_str(), TRUE, FALSE, 3);
        publication.PutActivePrinter(printer.c_str());
        publication.PrintOut(-1, -1, output.c_str(), 1, FALSE);
        publication.Close();
        application.Quit();
        EXPECT_EQ(L"Publisher has quit.", RaisedBy([&] { application.Quit(); }));
    });
}
