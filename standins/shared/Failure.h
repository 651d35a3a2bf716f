#pragma once

#include <string>

namespace standins {

/// What is to blame when the work on a document fails.
enum class Fault : char {
    Document = 'd', ///< itself: it is damaged, or wants more than a document may take
    Machine = 'm',  ///< something that the work needs is not there: room, processes, an engine
    Outside = 'o',  ///< whoever ended an engine at work; another try may go well
};

/// Why the work on a document failed; without a reason it has not.
struct Failure {
    std::string reason; ///< UTF-8, as the end of a sentence
    Fault fault = Fault::Document;

    explicit operator bool() const { return !reason.empty(); }
};

/// Whether it is one, and nothing but the document seems to be to blame.
inline bool IsDocumentsFault(const Failure& failure) {
    return failure && failure.fault == Fault::Document;
}

/// @param error errno
/// @return the system's words for it, or plainer ones
std::string ErrorWords(int error);

/// A fault of the machine.
/// @param what could not be done
/// @param error errno
Failure MachineFailure(const std::string& what, int error);

/// Whether there is hardly any room left on the file system of an open file or folder.
bool IsFull(int file);
bool IsFull(const std::string& path);
/// @param where there is no room
Failure NoRoomFailure(const std::string& where);

} // namespace standins
