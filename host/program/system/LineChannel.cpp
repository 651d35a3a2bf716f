#include "host/program/system/LineChannel.h"

std::optional<std::string> LineChannel::Read() const {
    std::string line;
    char piece[1024];
    while (m_from && std::fgets(piece, sizeof piece, m_from.get())) {
        line += piece;
        if (line.back() == '\n') {
            line.pop_back();
            return line;
        }
    }
    return std::nullopt; // half a line is the last of a process that was ended
}

bool LineChannel::Write(const std::string& line) const {
    return m_to && std::fwrite(line.data(), 1, line.size(), m_to.get()) == line.size() &&
           std::fputc('\n', m_to.get()) != EOF && std::fflush(m_to.get()) == 0;
}
