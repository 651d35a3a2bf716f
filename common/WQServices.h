#pragma once

// The host's services library, as its filters see it: log records and the translation catalogue.

#include <wx/arrstr.h>
#include <wx/string.h>

#include <memory>

/// How much a log record matters.
enum SeverityLevel : int {
    LevelInformation = 0,
    LevelWarning = 1,
    LevelError = 2,
};

/// A record under way. Pieces are appended with <<; the record goes to the host's log, as one line
/// and whole, when the object is destroyed.
class LogRecord {
public:
    LogRecord(SeverityLevel level, const char* file, const char* function, long line);
    LogRecord(LogRecord&&) noexcept;
    LogRecord& operator=(LogRecord&&) = delete;
    ~LogRecord();

    /// @param text UTF-8, zero-terminated
    LogRecord& operator<<(const char* text);
    LogRecord& operator<<(const wxString& text);

private:
    struct Content;
    std::unique_ptr<Content> m_content;
};

/// Opens a log record for one statement.
/// @param file the calling source file
/// @param function the calling function's name
/// @param line the statement's line
LogRecord SetLevelAndGetLogger(SeverityLevel level, const char* file, const char* function,
                               long line);

/// The host's texts in all languages that it has installed.
class WQTranslations {
public:
    /// The process's catalogue; its languages are read when it is first asked for.
    static WQTranslations& GetInstance();

    /// @param key the English text
    /// @return that text and its translations, each once, one per installed language that has one
    wxArrayString GetTranslations(const wxString& key) const;

    /// For the host, before it has threads: reads the languages of another folder in place of the
    /// one beside the program.
    /// @param folder holds <language>/LC_MESSAGES/quillon.mo; one that is missing has no languages
    void ReadFolder(const wxString& folder);

    WQTranslations(const WQTranslations&) = delete;
    WQTranslations& operator=(const WQTranslations&) = delete;

private:
    WQTranslations();
    ~WQTranslations();

    struct Catalogues;
    std::unique_ptr<Catalogues> m_catalogues;
};
