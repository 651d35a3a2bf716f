#include "common/WQServices.h"
#include "tests/support/TemporaryFolder.h"

#include <wx/translation.h>

#include <gtest/gtest.h>

#include <cstdint>
#include <map>

namespace fs = std::filesystem;

namespace {

void Append(std::string& bytes, std::size_t number) {
    for (unsigned shift = 0; shift < 32; shift += 8)
        bytes += static_cast<char>(number >> shift);
}

/// A gettext catalogue: a table of the keys' lengths and places, one of the texts', the strings.
std::string MoFile(std::map<std::string, std::string> texts) {
    texts[""] = "Content-Type: text/plain; charset=UTF-8\n";
    constexpr std::size_t HeaderSize = 28;
    const std::size_t tableSize = texts.size() * 8;
    std::string file;
    for (const std::size_t number :
         {std::size_t{0x950412DE}, std::size_t{0}, texts.size(), HeaderSize, HeaderSize + tableSize,
          std::size_t{0}, HeaderSize + 2 * tableSize})
        Append(file, number);
    std::string strings;
    const auto add = [&](const std::string& text) {
        Append(file, text.size());
        Append(file, HeaderSize + 2 * tableSize + strings.size());
        strings += text + '\0';
    };
    for (const auto& entry : texts)
        add(entry.first);
    for (const auto& entry : texts)
        add(entry.second);
    return file + strings;
}

class WQTranslationsTest : public testing::Test {
protected:
    void Install(const std::string& language, const std::string& bytes) const {
        const fs::path place = fs::path(language) / "LC_MESSAGES";
        fs::create_directories(m_folder / place);
        m_folder.Write(place / "quillon.mo", bytes);
    }

    std::vector<std::string> Ask(const wxString& key) const {
        WQTranslations& catalogue = WQTranslations::GetInstance();
        catalogue.ReadFolder(m_folder.Path().string());
        std::vector<std::string> texts;
        for (const wxString& text : catalogue.GetTranslations(key))
            texts.push_back(text.utf8_string());
        return texts;
    }

    TemporaryFolder m_folder;
};

using Texts = std::vector<std::string>;

TEST_F(WQTranslationsTest, AKeyHasItsTextOfEachLanguageOnce) {
    Install("de", MoFile({{"Handouts", "Handzettel"}, {"Color", "Farbe"}, {"Slides", ""}}));
    Install("fr", MoFile({{"Handouts", "Documents"}, {"Slides", "Diapositives"}}));
    Install("ja", MoFile({{"Color", "\xE3\x82\xAB\xE3\x83\xA9\xE3\x83\xBC"}}));
    Install("nb", MoFile({{"Color", "Farbe"}, {"Handouts", "Handouts"}}));
    EXPECT_EQ(Ask("Handouts"), (Texts{"Handouts", "Handzettel", "Documents"}));
    EXPECT_EQ(Ask("Color"), (Texts{"Color", "Farbe", "\xE3\x82\xAB\xE3\x83\xA9\xE3\x83\xBC"}));
    EXPECT_EQ(Ask("Slides"), (Texts{"Slides", "Diapositives"}));
    EXPECT_EQ(Ask("Outline View"), (Texts{"Outline View"}));
    EXPECT_EQ(Ask(""), (Texts{""})) << "where a catalogue keeps its header";
}

TEST_F(WQTranslationsTest, BrokenCataloguesAreLeftOutAndTheRestStays) {
    const std::string whole = MoFile({{"Handouts", "Handzettel"}});
    Install("de", whole);
    Install("a1", "");
    Install("a2", "no catalogue at all, but long enough to be taken for one");
    for (std::size_t size = 1; size < whole.size(); size += 7)
        Install("cut" + std::to_string(size), whole.substr(0, size));
    std::string wild = whole; // an offset far outside
    wild[12] = wild[13] = wild[14] = '\x7F';
    Install("wild", wild);
    fs::create_directories(m_folder / "none");
    const Texts texts = Ask("Handouts");
    EXPECT_EQ(texts.front(), "Handouts");
    EXPECT_NE(std::find(texts.begin(), texts.end(), "Handzettel"), texts.end());
}

TEST_F(WQTranslationsTest, WithoutAnyLanguageAKeyIsItsOwnText) {
    EXPECT_EQ(Ask("Color"), (Texts{"Color"}));
    WQTranslations::GetInstance().ReadFolder("/nowhere/at/all");
    EXPECT_EQ(WQTranslations::GetInstance().GetTranslations("Color").size(), 1U);
}

TEST_F(WQTranslationsTest, TheProgramsOwnLanguageIsNotTouched) {
    Install("de", MoFile({{"Handouts", "Handzettel"}}));
    const wxTranslations* const before = wxTranslations::Get();
    Ask("Handouts");
    EXPECT_EQ(wxTranslations::Get(), before);
}

} // namespace
