#include <wx/init.h>

#include <gtest/gtest.h>

#include <locale>

int main(int argc, char** argv) {
    // Names and texts beyond ASCII are UTF-8 here, whatever the machine's language.
    std::locale::global(std::locale("C.UTF-8"));
    testing::InitGoogleTest(&argc, argv);
    const wxInitializer toolkit;
    if (!toolkit.IsOk())
        return 2;
    return RUN_ALL_TESTS();
}
