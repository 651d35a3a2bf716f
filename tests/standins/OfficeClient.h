#pragma once

#include "office/dispatch/WordObjects.h"

#include <functional>
#include <string>

/// Word as the driver of the filter drives it.
class WordClient {
public:
    /// Starts Word; the test fails when it does not start.
    WordClient();

    word::Documents Documents();
    word::Document AddDocument();
    word::Document Open(const std::wstring& path);
    std::wstring ActivePrinter();
    void Quit();

    word::Application application;
};

/// The arguments of Word's PrintOut, as a print of the whole document into a file has them; a test
/// changes what it is about.
struct PrintArguments {
    explicit PrintArguments(const std::wstring& outputFileName);

    COleVariant background, append, range, outputFileName, from, to, item, copies, pages, pageType,
        printToFile, collate, activePrinterMacGX, manualDuplexPrint, zoomColumn, zoomRow,
        zoomPaperWidth, zoomPaperHeight;
};

void PrintDocument(word::Document& document, PrintArguments arguments);
void CloseDocument(word::Document& document);

/// The argument marker of an optional argument that is left out.
COleVariant LeftOut();

/// What an application raises while `work` runs.
/// @return the error's description; "0x…" when the call failed without one, and empty when all
/// went well
std::wstring RaisedBy(const std::function<void()>& work);
