#pragma once

#include "host/program/journal/Job.h"
#include "host/program/report/Texts.h"
#include "host/services/OneLine.h"

#include <cstdint>

/// How long something takes, for people: "3 min 12 s".
wxString DurationText(double seconds, const Texts& texts);

/// How long ago something was.
wxString AgeText(JournalTime since, JournalTime now, const Texts& texts);

/// The day and time, as the machine's clock has them.
wxString TimeText(JournalTime time);

/// How much room there is: "12.5 GB".
wxString BytesText(std::uintmax_t bytes);
