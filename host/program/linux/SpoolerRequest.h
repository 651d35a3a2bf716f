#pragma once

#include "host/program/base/Fault.h"

#include <cups/cups.h>

#include <memory>
#include <optional>
#include <string>

// Requests to a print server, and what comes back.

/// A message of the protocol.
using IppMessage = std::unique_ptr<ipp_t, decltype(&ippDelete)>;

/// A request of this user's about a queue, with all attributes that each one has.
IppMessage RequestAbout(const wxString& queue, ipp_op_t operation);
/// The same about a job.
IppMessage RequestAbout(int job, ipp_op_t operation);

/// Says which attributes are to be in the answer.
template <std::size_t Count>
void AskFor(ipp_t* request, const char* const (&names)[Count]) {
    ippAddStrings(request, IPP_TAG_OPERATION, IPP_TAG_KEYWORD, "requested-attributes", Count,
                  nullptr, names);
}

/// Sends a request.
/// @param file that goes with it; null for none
/// @param fault receives why the answer is none that was hoped for
/// @return null then
IppMessage Ask(http_t* server, IppMessage request, Fault& fault, const char* file = nullptr);

/// Whether the last answer in this thread said that there is no such thing.
bool WasNotFound();
