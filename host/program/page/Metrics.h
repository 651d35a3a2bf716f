#pragma once

#include "host/program/page/JournalAccess.h"
#include "host/program/watch/WatchStatus.h"

#include <prometheus/counter.h>
#include <prometheus/histogram.h>
#include <prometheus/registry.h>

/// A watch in figures for Prometheus; for any thread. What happens is counted as it happens, how
/// things stand is taken from status and journal when somebody asks. No document is named.
class Metrics {
public:
    Metrics();

    void Count(const wxString& folder, const char* state, int code, const wxString& application,
               double seconds);
    void CountRetry(const wxString& folder);

    /// All of them, in Prometheus' form.
    std::string Text(const WatchStatus& status, const JournalExtract& journal,
                     JournalTime now) const;

private:
    prometheus::Registry m_registry;
    prometheus::Family<prometheus::Counter>& m_documents;
    prometheus::Family<prometheus::Counter>& m_retries;
    prometheus::Family<prometheus::Histogram>& m_seconds;
};
