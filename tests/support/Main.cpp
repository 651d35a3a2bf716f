#include <wx/init.h>

#include <gtest/gtest.h>

int main(int argc, char** argv) {
    testing::InitGoogleTest(&argc, argv);
    const wxInitializer toolkit;
    if (!toolkit.IsOk())
        return 2;
    return RUN_ALL_TESTS();
}
