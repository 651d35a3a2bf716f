#pragma once

#include "host/program/base/Fault.h"

#include <optional>

// Why the engine failed that does Office's or Distiller's work in their place. A filter answers
// with a code alone; the stand-ins leave the reason where the host finds it.

/// Forgets the last failure. To be called before a filter is asked for anything that may fail.
void ForgetEngineFailure();

/// @return nothing when there was no failure since then, and where Office itself is at work
std::optional<Fault> LastEngineFailure();
