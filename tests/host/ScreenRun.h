#pragma once

#include "tests/host/Program.h"
#include "tests/support/TemporaryFolder.h"

#include <gmock/gmock.h>

/// Screens files with the scripted filter.
class ScreenTest : public testing::Test {
protected:
    static nlohmann::json Screen(const std::filesystem::path& path, int exitCode) {
        const RunResult run = RunQuillon({"screen", "--json", path.u8string()});
        EXPECT_EQ(run.exitCode, exitCode) << run.out << run.err;
        const std::vector<nlohmann::json> documents = run.Records("document");
        EXPECT_EQ(documents.size(), 1U) << path;
        return documents.empty() ? nlohmann::json{{"code", 0}, {"reason", ""}} : documents[0];
    }

    void ExpectRefused(const std::filesystem::path& path, int code,
                       const std::string& reason) const {
        const nlohmann::json document = Screen(path, 1);
        EXPECT_EQ(document["state"], "refused") << path;
        EXPECT_EQ(document["code"], code) << path;
        EXPECT_EQ(document["text"], "text of " + std::to_string(code)) << path;
        EXPECT_THAT(document["reason"].get<std::string>(), HasSubstr(reason)) << path << document;
    }

    /// @param name of a file, UTF-8
    /// @param shown the name as people see it
    void ExpectShown(const std::string& name, const std::string& shown) const {
        const std::filesystem::path path = m_folder.Write(std::filesystem::u8path(name), "script");
        const RunResult run = RunQuillon({"screen", "--json", path.u8string()});
        ASSERT_EQ(run.Records("document").size(), 1U) << run.err;
        EXPECT_EQ(run.Records("document")[0]["input"], path.u8string());
        const auto separator = static_cast<char>(std::filesystem::path::preferred_separator);
        EXPECT_THAT(run.err, HasSubstr(separator + shown + ": accepted"));
    }

    TemporaryFolder m_folder;
};
