#include "tests/standins/FakeEngine.h"

#include "tests/support/RegistryText.h"

#include <gtest/gtest.h>

#include <vector>

namespace fs = std::filesystem;

namespace {

constexpr const wchar_t* SettingsKey = L"SOFTWARE\\Orvanta\\Office Stand-Ins";
constexpr const wchar_t* PathValue = L"EnginePath";

constexpr const char* PdfWithOnePage =
    "%PDF-1.4\n"
    "1 0 obj<</Type/Catalog/Pages 2 0 R>>endobj\n"
    "2 0 obj<</Type/Pages/Kids[3 0 R]/Count 1>>endobj\n"
    "3 0 obj<</Type/Page/Parent 2 0 R/MediaBox[0 0 200 100]>>endobj\n"
    "trailer<</Root 1 0 R>>\n"
    "%%EOF\n";

} // namespace

FakeEngine::FakeEngine(const std::string& script) {
    const fs::path program = m_folder / "program";
    fs::create_directory(program);
    m_folder.Write("program/bootstraprc", "[Bootstrap]\nProductKey=LibreOffice 7.4\n");
    m_folder.Write("program/versionrc", "[Version]\nbuildid=1(Build:1)\n");
    const std::string head = "#!/bin/sh\n"
                             "PATH=/usr/bin:/bin\n"
                             "DOCUMENT=$(echo \"$HOME\"/document.*)\n"
                             "PDF=$HOME/out/document.pdf\n"
                             "echo started >> '" +
                             (m_folder / "starts").string() +
                             "'\n"
                             "mkdir -p \"$HOME/out\"\n";
    const fs::path engine = m_folder.Write("program/soffice.bin", head + script + "\n");
    fs::permissions(engine, fs::perms::owner_all);
    WriteRegistryText(HKEY_LOCAL_MACHINE, SettingsKey, PathValue, program.wstring());
}

FakeEngine::~FakeEngine() {
    HKEY key = nullptr;
    if (RegOpenKeyExW(HKEY_LOCAL_MACHINE, SettingsKey, 0, KEY_WRITE, &key) != ERROR_SUCCESS)
        return;
    RegDeleteValueW(key, PathValue); // the next registration enters the real one again
    RegCloseKey(key);
}

std::size_t FakeEngine::Starts() const {
    const fs::path starts = m_folder / "starts";
    return fs::exists(starts) ? ReadBytes(starts).size() / std::string("started\n").size() : 0;
}

void FakeEngine::Uninstall() const {
    fs::remove(m_folder / "program/soffice.bin");
}

std::string FakeEngine::MakePdf() {
    return std::string("cat > \"$PDF\" <<'PDF'\n") + OnePage() + "PDF\n";
}

std::string FakeEngine::OnePage() {
    return PdfWithOnePage;
}
