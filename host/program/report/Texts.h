#pragma once

#include "host/services/CatalogueLoader.h"

#include <wx/string.h>

#include <map>
#include <memory>
#include <string>

/// The program's texts in one language, whatever language the program speaks itself. They are read
/// once, and may be asked for in any thread.
class Texts {
public:
    /// @param language as a catalogue is called; without a catalogue the texts are English
    explicit Texts(const wxString& language,
                   const wxString& folder = CatalogueLoader::ProgramFolder());

    const wxString& Language() const { return m_language; }

    /// @param english a text that is marked for translation
    wxString operator()(const char* english) const;
    wxString Plural(const char* one, const char* many, unsigned number) const;

private:
    wxString m_language;
    std::unique_ptr<wxTranslations> m_translations; ///< null for English
};

/// The texts in all languages that are installed, English among them.
class TextsOfLanguages {
public:
    /// Reads them. Like all that has to do with the program's own language, not beside threads
    /// that ask for texts.
    explicit TextsOfLanguages(const wxString& folder = CatalogueLoader::ProgramFolder());

    /// Those in a language ("de", "de-AT").
    /// @return null when there are none
    const Texts* Find(const wxString& language) const;

    /// Those that a browser would like best.
    /// @param acceptLanguage the header that says so; the program's language if none fits
    const Texts& Choose(const std::string& acceptLanguage) const;

    const std::map<wxString, Texts>& All() const { return m_texts; }

private:
    std::map<wxString, Texts> m_texts; ///< by language
    const Texts* m_ofProgram;
};
