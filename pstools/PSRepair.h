#pragma once

#include <windows.h>

#include <wx/string.h>

#include <cstdint>

namespace PSRepair {

constexpr std::int32_t Done = 0;
constexpr std::int32_t CannotOpen = 2;
constexpr std::int32_t NoHeader = 13;

/// What the repair asks of an open file. Positions and sizes are in bytes; what is not transferred
/// whole counts as failed.
class File {
public:
    virtual ~File() = default;

    /// @param read receives the count of bytes read, which is smaller at the file's end
    virtual bool Read(void* buffer, DWORD size, DWORD& read) = 0;
    virtual bool Write(const void* buffer, DWORD size) = 0;
    virtual bool Seek(DWORD position) = 0;
    virtual bool SetEnd() = 0;
    virtual bool GetSize(std::uint64_t& size) = 0;
};

/// Cuts off what stands in front of the PostScript header.
/// @param file open for reading and writing, at its beginning
/// @return Done, the file begins with the header; or NoHeader, the file is as it was: it has no
/// header in its first 512 bytes, or the cut failed and was taken back
std::int32_t CutToHeader(File& file);

} // namespace PSRepair

/// Makes a printed file begin with its PostScript header: printer drivers put printer-language
/// bytes in front of it. The file is held without sharing meanwhile.
/// @param path the file
/// @return PSRepair::Done; PSRepair::CannotOpen, also when another program holds the file; or
/// PSRepair::NoHeader, the file is as it was
std::int32_t RepairPSHeader(wxString path);
