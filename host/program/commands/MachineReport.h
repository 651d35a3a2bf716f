#pragma once

#include "host/program/journal/SharedJournal.h"
#include "host/program/report/Reporter.h"

/// Says how the machines are that share a journal, in a line and a record of type "machine" for
/// each, and which documents wait in vain for one that can convert them.
void TellMachines(SharedJournal& journal, Reporter& reporter);
