#pragma once

#include "host/program/journal/SharedJournal.h"

#include <functional>

/// Whether a machine takes part in converting documents now.
bool Converts(const Machine& machine);

/// What most of those that convert print with.
PageMakers CommonMakers(const std::vector<Machine>& machines);

/// Gives a text in the reader's language.
using Translation = std::function<wxString(const char* text)>;

/// What a machine is there for.
std::vector<wxString> WorkOf(const Machine& machine, const Translation& text);

/// What one that converts prints with that most do not.
std::vector<wxString> DifferencesOf(const Machine& machine, const PageMakers& common,
                                    const Translation& text);

/// Those in whose place another one has come: they are not alive, and after they were last heard of
/// one has started on the same host.
/// @return the others
std::vector<Machine> WithoutReplaced(const std::vector<Machine>& machines);
