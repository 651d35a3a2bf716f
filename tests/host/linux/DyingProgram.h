#pragma once

#include <cstdlib>
#include <string>

/// As long as it lives, each service that is started ends before one of its steps (DieAtStep).
class DyingProgram {
public:
    explicit DyingProgram(int step) {
        const char* const given = std::getenv("ASAN_OPTIONS");
        m_sanitizer = given ? given : "";
        setenv("TEST_DIE_AT_STEP", std::to_string(step).c_str(), 1);
        setenv("LD_PRELOAD", DIE_AT_STEP, 1);
        setenv("ASAN_OPTIONS", (m_sanitizer + ":verify_asan_link_order=0").c_str(),
               1); // it is second
    }
    ~DyingProgram() {
        setenv("ASAN_OPTIONS", m_sanitizer.c_str(), 1);
        unsetenv("LD_PRELOAD");
        unsetenv("TEST_DIE_AT_STEP");
    }
    DyingProgram(const DyingProgram&) = delete;
    DyingProgram& operator=(const DyingProgram&) = delete;

private:
    std::string m_sanitizer;
};
