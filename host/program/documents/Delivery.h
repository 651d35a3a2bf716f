#pragma once

#include "host/program/documents/Outcome.h"
#include "host/program/documents/Workplace.h"
#include "host/program/filters/FilterSet.h"

/// An output in its workplace, with what else its filter has made beside it: files of the same name
/// with other endings.
class Product {
public:
    /// @param output the file; it may be gone
    explicit Product(std::filesystem::path output) : m_output(std::move(output)) {}

    /// Whether it is still to be moved: a move is its only way out.
    bool IsThere() const;

    /// Waits until all of it is on the disk.
    std::error_code Sync() const;

    /// Where the output comes to.
    /// @param baseName its name there, without ending
    std::filesystem::path PlaceIn(const std::filesystem::path& folder,
                                  const wxString& baseName) const;

    /// Whether a file in the folder has a name that one of these would get there.
    bool IsTaken(const std::filesystem::path& folder, const wxString& baseName) const;

    /// Moves all of it to a folder of the same file system, the output last, and waits until it is
    /// there for certain.
    /// @param replace files that have the names; otherwise the output is left where it is when it
    ///     meets one
    /// @return why it is not there, or not for certain
    std::optional<Fault> MoveTo(const std::filesystem::path& folder, const wxString& baseName,
                                bool replace) const;

private:
    wxString OwnBaseName() const;
    std::vector<std::filesystem::path> Files() const;
    std::filesystem::path PlaceOf(const std::filesystem::path& file,
                                  const std::filesystem::path& folder,
                                  const wxString& baseName) const;

    std::filesystem::path m_output;
};

/// Moves what a conversion has made to the folder above its workplace, in place of older files.
/// @param outcome of the conversion; says afterwards where the output is, or why it is not
void Deliver(const Workplace& workplace, const wxString& baseName, const FilterSet& filters,
             Outcome& outcome);
