#include "tests/standins/BareLibreOffice.h"

#include "tests/support/TemporaryFolder.h"

#include <gtest/gtest.h>

#include <cstdlib>

namespace fs = std::filesystem;

fs::path ConvertBare(const fs::path& document, const std::string& format) {
    const TemporaryFolder profile;
    const std::string command = "soffice --headless '-env:UserInstallation=file://" +
                                profile.Path().string() + "' --convert-to '" + format +
                                "' --outdir '" + document.parent_path().string() + "' '" +
                                document.string() + "' >/dev/null 2>&1";
    EXPECT_EQ(0, std::system(command.c_str())); // NOLINT(concurrency-mt-unsafe,cert-env33-c)
    fs::path result = document;
    return result.replace_extension(format.substr(0, format.find(':')));
}
