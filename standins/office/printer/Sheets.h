#pragma once

#include "standins/office/printer/PostScriptOutput.h"

namespace standins {

/// Some sheets of a print, in order. They can be printed in any order, and more than once.
class Sheets {
public:
    virtual ~Sheets() = default;

    virtual int Count() const = 0;

    /// @param number counted from 0
    /// @throws std::runtime_error when it cannot be printed
    virtual void Print(int number, PostScriptOutput& output) const = 0;
};

} // namespace standins
