#pragma once

#include "host/program/base/Fault.h"

#include <filesystem>
#include <memory>
#include <optional>

/// A hidden folder in the output folder in which one document is converted, so that an output
/// appears in the output folder whole or not at all. It goes with whatever is left in it.
class Workplace {
public:
    /// Whose it is: what a journal tells of must outlast its program.
    enum class Kind { OfRun, OfWatch };

    /// @param fault receives why there is none
    static std::optional<Workplace> Create(const std::filesystem::path& outputFolder, Fault& fault,
                                           Kind kind = Kind::OfRun);

    /// Makes one among the temporary files, which nobody else may look into.
    static std::optional<Workplace> CreateTemporary(Fault& fault);

    /// Takes over one whose program was ended, or has left it.
    /// @return nothing when it is gone, or somebody else has it
    static std::optional<Workplace> TakeOver(const std::filesystem::path& path);

    /// Removes the workplaces of programs that were ended before they could do it: those whose mark
    /// nobody has, and old ones that have none.
    static void RemoveAbandoned(const std::filesystem::path& outputFolder, Kind kind = Kind::OfRun);

    Workplace(Workplace&& other) noexcept;
    Workplace& operator=(Workplace&& other) noexcept;
    ~Workplace();

    const std::filesystem::path& Path() const { return m_path; }

    /// Leaves it with what is in it to whoever takes it over.
    void Leave();

private:
    Workplace(std::filesystem::path path, std::shared_ptr<void> mark);
    bool IsMarked() const;

    std::filesystem::path m_path; ///< empty after a move
    std::shared_ptr<void> m_mark; ///< a file that is open as long as the workplace is in use
};
