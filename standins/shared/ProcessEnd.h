#pragma once

#include "standins/shared/Failure.h"

#include <cstdint>
#include <string>

namespace standins {

/// Notices when the system ends processes because it has run out of memory.
class MemoryShortage {
public:
    MemoryShortage();
    /// Whether it has done so since this object was made, be it to another process.
    bool HasStruck() const;

private:
    std::uint64_t m_before;
};

/// Of a program that had to be ended.
/// @param most bytes that it may take
Failure MemoryFailure(const std::string& program, std::uint64_t most);

/// Why a program came to its end.
/// @param program its name, for people
/// @param status as waitpid gives it, of a program that this process has not ended itself
/// @return no failure when it ended well, as far as its status tells
Failure DescribeEnd(const std::string& program, int status, const MemoryShortage& shortage);

} // namespace standins
