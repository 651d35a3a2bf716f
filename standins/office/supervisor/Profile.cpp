#include "standins/office/supervisor/Profile.h"

#include <glib.h>

#include <filesystem>
#include <fstream>
#include <memory>
#include <string_view>

namespace fs = std::filesystem;

namespace standins {

namespace {

struct Setting {
    const char* path;
    const char* name;
    std::string value;
};

/// The value of a key in one of LibreOffice's own start-up files.
std::string StartUpValue(const fs::path& file, std::string_view key) {
    std::ifstream stream(file);
    for (std::string line; std::getline(stream, line);) {
        if (line.compare(0, key.size(), key) == 0 && line[key.size()] == '=')
            return line.substr(key.size() + 1);
    }
    return {};
}

/// The version that LibreOffice compares with the last one that used the profile: the second word
/// of "LibreOffice 7.4".
std::string ProductVersion(const fs::path& program) {
    const std::string product = StartUpValue(program / "bootstraprc", "ProductKey");
    return product.substr(product.rfind(' ') + 1);
}

std::string Escaped(const std::string& text) {
    const std::unique_ptr<char, decltype(&g_free)> escaped(
        g_markup_escape_text(text.c_str(), static_cast<gssize>(text.size())), g_free);
    return escaped.get();
}

void WriteSettings(std::ostream& file, const std::string& version, const std::string& build) {
    const Setting settings[] = {
        {"org.openoffice.Setup/Product", "ooSetupLastVersion", version},
        {"org.openoffice.Setup/Office", "LastCompatibilityCheckID", build},
        {"org.openoffice.Setup/Office", "ooSetupInstCompleted", "true"},
        {"org.openoffice.Office.Common/Misc", "FirstRun", "false"},
        {"org.openoffice.Office.Common/Misc", "UseOpenCL", "false"},
        {"org.openoffice.Office.Common/Security/Scripting", "BlockUntrustedRefererLinks", "true"},
        {"org.openoffice.Office.Common/Security/Scripting", "MacroSecurityLevel", "3"},
        {"org.openoffice.Office.Common/Security/Scripting", "DisableMacrosExecution", "true"},
        // Linked sections and tables are not updated: 2 and 1 both stand for never.
        {"org.openoffice.Office.Writer/Content/Update", "Link", "2"},
        {"org.openoffice.Office.Calc/Content/Update", "Link", "1"},
    };
    file << R"(<?xml version="1.0" encoding="UTF-8"?>)"
            "\n"
            R"(<oor:items xmlns:oor="http://openoffice.org/2001/registry">)"
            "\n";
    for (const Setting& setting : settings) {
        file << R"(<item oor:path="/)" << setting.path << R"("><prop oor:name=")" << setting.name
             << R"(" oor:op="fuse"><value>)" << Escaped(setting.value)
             << "</value></prop></item>\n";
    }
    file << "</oor:items>\n";
}

} // namespace

bool MakeProfile(const std::string& folder, const std::string& program) {
    const fs::path user = fs::path(folder) / "profile" / "user";
    std::error_code error;
    fs::create_directories(user / "extensions", error);
    const std::string build = StartUpValue(fs::path(program) / "versionrc", "buildid");
    std::ofstream settings(user / "registrymodifications.xcu");
    WriteSettings(settings, ProductVersion(program), build);
    // Without it LibreOffice looks for extensions and asks to be started again.
    std::ofstream buildId(user / "extensions" / "buildid");
    buildId << build;
    settings.close();
    buildId.close();
    return settings && buildId;
}

} // namespace standins
