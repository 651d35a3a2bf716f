#pragma once

#include <string>

namespace win32 {

/// While one is alive, what libgsf says on its thread about a file goes to the layer's log, as one
/// record: a file made to be broken has it say a lot. Elsewhere its messages go their usual way.
class GsfMessages {
public:
    explicit GsfMessages(const std::string& fileName);
    ~GsfMessages();
    GsfMessages(const GsfMessages&) = delete;
    GsfMessages& operator=(const GsfMessages&) = delete;

    void Add(const char* message);

private:
    const std::string& m_fileName;
    GsfMessages* m_outer;
    std::string m_first;
    unsigned m_count = 0;
};

} // namespace win32
