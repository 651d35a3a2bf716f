#pragma once

#include "host/program/base/Fault.h"

#include <filesystem>
#include <memory>
#include <optional>

/// A hidden folder in the output folder in which one document is converted, so that an output
/// appears in the output folder whole or not at all. It goes with whatever is left in it.
class Workplace {
public:
    /// @param fault receives why there is none
    static std::optional<Workplace> Create(const std::filesystem::path& outputFolder, Fault& fault);

    /// Removes the workplaces of programs that were ended before they could do it: those whose mark
    /// nobody has, and old ones that have none.
    static void RemoveAbandoned(const std::filesystem::path& outputFolder);

    Workplace(Workplace&& other) noexcept;
    Workplace& operator=(Workplace&&) = delete;
    ~Workplace();

    const std::filesystem::path& Path() const { return m_path; }

    /// Moves a file to the output folder, in place of an older one, when its bytes are on the disk.
    /// @param name of the file here
    /// @param newName of the file there
    /// @return why it is not there
    std::optional<Fault> Deliver(const wxString& name, const wxString& newName) const;

    /// Waits until all that was delivered is on the disk under its names.
    /// @return why that is not certain
    std::optional<Fault> ConfirmDelivery() const;

private:
    explicit Workplace(std::filesystem::path path);
    bool IsMarked() const;

    std::filesystem::path m_path; ///< empty after a move
    std::shared_ptr<void> m_mark; ///< a file that is open as long as the workplace is in use
};
