#pragma once

#include "tests/support/TemporaryFolder.h"

#include <gtest/gtest.h>

#include <set>
#include <string>
#include <vector>

/// A machine with the Distiller stand-in registered; temporary files go to a folder of the test's
/// own. After the test no process and no file of the stand-in may be left.
class BridgeTest : public testing::Test {
protected:
    void SetUp() override;
    void TearDown() override;

    /// Loads the bridge, has it convert a file of the test's folder, and unloads it.
    /// @param profile a file name, or empty
    /// @return the bridge's result
    static int Convert(const std::filesystem::path& postScript, const std::filesystem::path& pdf,
                       const std::string& profile = {});
    /// Calls the bridge's export with the address of a record, or of none.
    static int Call(const void* record);

    /// Converts a program that is to fail, to "failed.pdf" in the test's folder, and expects that
    /// no file comes of it.
    /// @return what the log says of it
    std::string Failure(const std::string& program, const std::string& profile = {});

    static void SetLimit(const wchar_t* name, unsigned seconds);
    /// What the stand-in has left behind so far: processes, files; empty when all is clean.
    std::string Leftovers() const;
    /// The names in the test's folder.
    std::set<std::string> Names() const;

    TemporaryFolder m_files; ///< documents and output
    TemporaryFolder m_temporary;
    std::vector<std::string> m_log;

private:
    std::string m_path; ///< as it was
};

/// Calls an export without arguments of the module that registers the stand-in.
long CallRegistration(const char* name);

/// A program that draws one page with a picture of one inch and 600 pixels, and words in Helvetica.
extern const char* const PictureProgram;
/// A program that never ends.
constexpr const char* EndlessProgram = "%!PS\n{ } loop\n";
