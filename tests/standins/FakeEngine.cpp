#include "tests/standins/FakeEngine.h"

#include "tests/standins/ScriptedProgram.h"
#include "tests/support/RegistryText.h"

#include <gtest/gtest.h>
#include <sys/inotify.h>
#include <unistd.h>

namespace fs = std::filesystem;

FakeEngine::FakeEngine(const std::string& script)
    : m_opened(inotify_init1(IN_NONBLOCK | IN_CLOEXEC)) {
    const fs::path program = m_folder / "program";
    fs::create_directory(program);
    m_folder.Write("program/bootstraprc", "[Bootstrap]\nProductKey=LibreOffice 7.4\n");
    m_folder.Write("program/versionrc", "[Version]\nbuildid=1(Build:1)\n");
    WriteScriptedProgram(program / "soffice.bin", program,
                         "for DOCUMENT in \"$HOME\"/document.*; do :; done\n"
                         "PDF=$HOME/document.pdf\n" +
                             script);
    // The next test's registration enters the real one again.
    WriteRegistryText(HKEY_LOCAL_MACHINE, L"SOFTWARE\\Orvanta\\Office Stand-Ins", L"EnginePath",
                      program.wstring());
    // Two of the same kind, one after the other, would be told as one.
    constexpr std::uint32_t Events = IN_OPEN | IN_CLOSE_NOWRITE;
    EXPECT_GE(inotify_add_watch(m_opened.Get(), (program / "sh").c_str(), Events), 0);
}

std::size_t FakeEngine::Starts() const {
    inotify_event event{}; // of a file, so without a name
    while (read(m_opened.Get(), &event, sizeof event) == sizeof event) {
        if ((event.mask & IN_OPEN) != 0)
            ++m_starts;
    }
    return m_starts;
}

std::string FakeEngine::MakePdf(const std::string& contents) {
    return "printf '%s\\n' '%PDF-1.4\n"
           "1 0 obj<</Type/Catalog/Pages 2 0 R>>endobj\n"
           "2 0 obj<</Type/Pages/Kids[3 0 R]/Count 1>>endobj\n"
           "3 0 obj<</Type/Page/Parent 2 0 R/MediaBox[0 0 200 100]/Contents 4 0 R"
           "/Resources<</XObject<</X 5 0 R>>>>>>endobj\n" +
           contents +
           "trailer<</Root 1 0 R>>\n"
           "%%EOF' > \"$PDF\"\n";
}
