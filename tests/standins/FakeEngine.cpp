#include "tests/standins/FakeEngine.h"

#include "tests/support/RegistryText.h"

namespace fs = std::filesystem;

FakeEngine::FakeEngine(const std::string& script) {
    const fs::path program = m_folder / "program";
    fs::create_directory(program);
    m_folder.Write("program/bootstraprc", "[Bootstrap]\nProductKey=LibreOffice 7.4\n");
    m_folder.Write("program/versionrc", "[Version]\nbuildid=1(Build:1)\n");
    const std::string head = "#!/bin/sh\n"
                             "PATH=/usr/bin:/bin\n"
                             "DOCUMENT=$(echo \"$HOME\"/document.*)\n"
                             "PDF=$HOME/out/document.pdf\n"
                             "echo >> '" +
                             (m_folder / "starts").string() +
                             "'\n"
                             "mkdir -p \"$HOME/out\"\n";
    const fs::path engine = m_folder.Write("program/soffice.bin", head + script + "\n");
    fs::permissions(engine, fs::perms::owner_all);
    // The next test's registration enters the real one again.
    WriteRegistryText(HKEY_LOCAL_MACHINE, L"SOFTWARE\\Orvanta\\Office Stand-Ins", L"EnginePath",
                      program.wstring());
}

std::size_t FakeEngine::Starts() const {
    const fs::path starts = m_folder / "starts";
    return fs::exists(starts) ? fs::file_size(starts) : 0; // one byte each
}

std::string FakeEngine::MakePdf(const std::string& contents) {
    return "cat > \"$PDF\" <<'PDF'\n"
           "%PDF-1.4\n"
           "1 0 obj<</Type/Catalog/Pages 2 0 R>>endobj\n"
           "2 0 obj<</Type/Pages/Kids[3 0 R]/Count 1>>endobj\n"
           "3 0 obj<</Type/Page/Parent 2 0 R/MediaBox[0 0 200 100]/Contents 4 0 R"
           "/Resources<</XObject<</X 5 0 R>>>>>>endobj\n" +
           contents +
           "trailer<</Root 1 0 R>>\n"
           "%%EOF\n"
           "PDF\n";
}
