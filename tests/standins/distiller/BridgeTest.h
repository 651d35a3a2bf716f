#pragma once

#include "tests/standins/StandInTest.h"

/// A machine with the Distiller stand-in. Tests are skipped where Ghostscript is not installed.
class BridgeTest : public StandInTest {
protected:
    BridgeTest();
    void SetUp() override;

    /// Loads the bridge, has it convert a file, and unloads it.
    /// @param profile a file name, or empty
    /// @return the bridge's result
    static int Convert(const std::filesystem::path& postScript, const std::filesystem::path& pdf,
                       const std::string& profile = {});
    /// Calls the bridge's export with the address of a record, or of none.
    static int CallBridge(const void* record);

    /// Converts a program that is to fail, to "failed.pdf" in the test's folder, and expects that
    /// no file comes of it.
    /// @return what the log says of it
    std::string Failure(const std::string& program, const std::string& profile = {});
};

/// A program that draws one page with words in Helvetica.
std::string WordsProgram(const std::string& words);
/// A program that draws one page with a picture of one inch and 600 pixels, and words in Helvetica.
extern const std::string PictureProgram;
/// A program that never ends.
constexpr const char* EndlessProgram = "%!PS\n{ } loop\n";
