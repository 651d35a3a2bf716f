#include "tests/support/Utf8Locale.h"

#include <wx/app.h>
#include <wx/init.h>
#include <wx/log.h>

#include <gtest/gtest.h>

#include <iostream>

int main(int argc, char** argv) {
    UseUtf8Locale();
    testing::InitGoogleTest(&argc, argv);
    wxApp::SetInstance(new wxApp); // belongs to wxWidgets
    if (!wxEntryStart(argc, argv) || !wxTheApp->CallOnInit()) {
        std::cerr << "These tests need a display: run them by ctest, or under xvfb-run.\n";
        return 2;
    }
    wxLog::SetActiveTarget(new wxLogStderr);
    const int result = RUN_ALL_TESTS();
    wxTheApp->OnExit();
    wxEntryCleanup();
    return result;
}
