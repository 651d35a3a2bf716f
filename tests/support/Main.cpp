#include "tests/support/Utf8Locale.h"

#include <wx/init.h>

#include <gtest/gtest.h>

int main(int argc, char** argv) {
    UseUtf8Locale();
    testing::InitGoogleTest(&argc, argv);
    const wxInitializer toolkit;
    if (!toolkit.IsOk())
        return 2;
    return RUN_ALL_TESTS();
}
