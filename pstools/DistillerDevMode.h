#pragma once

#include <windows.h>

#include <array>

constexpr std::size_t DistillerDevModeSize = 1480;

/// The printing preferences of the Distiller printer under which documents are printed: a DEVMODEW
/// of 220 bytes and 1260 bytes of the driver's own. Letter, 1200 dpi, colour, and fonts sent as
/// outlines. Bytes and not a struct: they go into the registry as Windows has them on every system.
extern const std::array<BYTE, DistillerDevModeSize> DistillerDevMode;
