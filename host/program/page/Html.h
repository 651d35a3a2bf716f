#pragma once

#include <wx/string.h>

#include <string>

/// A page that is being written. What stands in the source is markup; what is text, from wherever,
/// is escaped, and means itself in an element as in an attribute with double quotes.
class Html {
public:
    Html& operator<<(const char* markup) {
        m_bytes += markup;
        return *this;
    }

    Html& operator<<(const wxString& text) {
        for (const char c : text.utf8_string())
            Put(c);
        return *this;
    }

    Html& operator<<(const std::string& text) {
        for (const char c : text)
            Put(c);
        return *this;
    }

    Html& operator<<(std::size_t number) {
        m_bytes += std::to_string(number);
        return *this;
    }

    const std::string& Bytes() const { return m_bytes; }

private:
    void Put(char c) {
        switch (c) {
        case '<':
            m_bytes += "&lt;";
            break;
        case '>':
            m_bytes += "&gt;";
            break;
        case '&':
            m_bytes += "&amp;";
            break;
        case '"':
            m_bytes += "&quot;";
            break;
        case '\'':
            m_bytes += "&#39;";
            break;
        default:
            m_bytes += c;
        }
    }

    std::string m_bytes;
};
