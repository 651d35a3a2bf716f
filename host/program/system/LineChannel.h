#pragma once

#include <cstdio>
#include <memory>
#include <optional>
#include <string>

/// Lines to another process and lines from it. One thread may read while another writes.
class LineChannel {
public:
    /// @param from opened for reading; the channel's from here on
    /// @param to opened for writing; the channel's from here on
    LineChannel(std::FILE* from, std::FILE* to) : m_from(from), m_to(to) {}

    /// Waits for a line.
    /// @return without its line feed; nothing when the other side has closed, or is gone
    std::optional<std::string> Read() const;

    /// @return whether it is on its way
    bool Write(const std::string& line) const;

    /// Lets the other side read to the end.
    void CloseOutput() { m_to.reset(); }

private:
    struct Close {
        void operator()(std::FILE* file) const { std::fclose(file); }
    };

    std::unique_ptr<std::FILE, Close> m_from;
    std::unique_ptr<std::FILE, Close> m_to;
};
