#include "host/program/page/Metrics.h"

#include "host/program/page/Health.h"

#include <prometheus/text_serializer.h>

#include <algorithm>
#include <sstream>

using prometheus::MetricFamily;

namespace {

const prometheus::Histogram::BucketBoundaries SecondsOfDocuments = {0.25, 0.5, 1,  2,   5,   10,
                                                                    20,   30,  60, 120, 300, 600};

/// A figure of which each folder, or whatever the label says, has its own.
class Gauge {
public:
    Gauge(const char* name, const char* help, const char* label = "folder") : m_label(label) {
        m_family.name = name;
        m_family.help = help;
        m_family.type = prometheus::MetricType::Gauge;
    }

    void Set(const wxString& whose, double value) {
        prometheus::ClientMetric metric;
        metric.label = {{m_label, whose.utf8_string()}};
        metric.gauge.value = value;
        m_family.metric.push_back(metric);
    }

    MetricFamily& Family() { return m_family; }

private:
    const char* const m_label;
    MetricFamily m_family;
};

double SecondsWaited(const FolderCounts& counts, JournalTime now) {
    if (!counts.oldestWaiting)
        return 0;
    return std::max(0.0, std::chrono::duration<double>(now - *counts.oldestWaiting).count());
}

void AddStatus(std::vector<MetricFamily>& families, const WatchStatus& status,
               const JournalExtract& journal) {
    Gauge running("quillon_running", "Documents under way");
    Gauge free("quillon_free_bytes", "Room where the output goes");
    Gauge reachable("quillon_folder_reachable", "Whether the folder can be seen");
    Gauge paused("quillon_paused", "Whether a person has paused the folder, or all");
    const bool allPaused = IsPaused("", status, journal);
    for (const FolderStatus& folder : status.folders) {
        const wxString& name = folder.configuration.name;
        const auto count = std::count_if(
            status.running.begin(), status.running.end(),
            [&name](const RunningDocument& document) { return document.folder == name; });
        running.Set(name, static_cast<double>(count));
        free.Set(name, static_cast<double>(folder.freeBytes));
        reachable.Set(name, folder.reachable ? 1 : 0);
        paused.Set(name, allPaused || IsPaused(name, status, journal) ? 1 : 0);
    }
    for (Gauge* gauge : {&running, &free, &reachable, &paused})
        families.push_back(std::move(gauge->Family()));
}

/// Nothing while the journal cannot be read: no figure is better than a wrong one.
void AddJournal(std::vector<MetricFamily>& families, const WatchStatus& status,
                const JournalExtract& journal, JournalTime now) {
    if (!journal.fault.empty())
        return;
    Gauge waiting("quillon_waiting", "Documents that wait for their turn");
    Gauge oldest("quillon_oldest_waiting_seconds", "How long the first of them has waited");
    for (const FolderStatus& folder : status.folders) {
        const wxString& name = folder.configuration.name;
        const auto found = journal.counts.find(name);
        const FolderCounts counts = found == journal.counts.end() ? FolderCounts() : found->second;
        const auto number = counts.jobs.find(JobState::Waiting);
        waiting.Set(name, number == counts.jobs.end() ? 0 : static_cast<double>(number->second));
        oldest.Set(name, SecondsWaited(counts, now));
    }
    families.push_back(std::move(waiting.Family()));
    families.push_back(std::move(oldest.Family()));
}

void AddMachines(std::vector<MetricFamily>& families, const std::vector<Machine>& machines) {
    Gauge up("quillon_machine_up", "Whether the machine has reported within its lease", "machine");
    Gauge running("quillon_machine_running", "Documents that it has under way", "machine");
    Gauge jobs("quillon_machine_jobs", "How many it may have; 0 for as many as pay, or none",
               "machine");
    for (const Machine& machine : machines) {
        up.Set(machine.name, machine.isAlive ? 1 : 0);
        running.Set(machine.name, machine.isAlive ? static_cast<double>(machine.running) : 0);
        jobs.Set(machine.name, machine.jobs);
    }
    for (Gauge* gauge : {&up, &running, &jobs})
        families.push_back(std::move(gauge->Family()));
}

} // namespace

Metrics::Metrics()
    : m_documents(prometheus::BuildCounter()
                      .Name("quillon_documents_total")
                      .Help("Documents that have come to a state, by result code")
                      .Register(m_registry)),
      m_retries(prometheus::BuildCounter()
                    .Name("quillon_retries_total")
                    .Help("Further attempts at documents")
                    .Register(m_registry)),
      m_seconds(prometheus::BuildHistogram()
                    .Name("quillon_document_seconds")
                    .Help("How long an attempt at a document took")
                    .Register(m_registry)) {}

void Metrics::Count(const wxString& folder, const char* state, int code,
                    const wxString& application, double seconds) {
    const std::string name = folder.utf8_string();
    m_documents.Add({{"folder", name}, {"state", state}, {"code", std::to_string(code)}})
        .Increment();
    if (!application.empty())
        m_seconds
            .Add({{"folder", name}, {"application", application.utf8_string()}}, SecondsOfDocuments)
            .Observe(seconds);
}

void Metrics::CountRetry(const wxString& folder) {
    m_retries.Add({{"folder", folder.utf8_string()}}).Increment();
}

std::string Metrics::Text(const WatchStatus& status, const JournalExtract& journal,
                          JournalTime now) const {
    std::vector<MetricFamily> families = m_registry.Collect();
    AddStatus(families, status, journal);
    AddJournal(families, status, journal, now);
    if (journal.machines)
        AddMachines(families, *journal.machines);
    std::ostringstream text;
    prometheus::TextSerializer().Serialize(text, families);
    return text.str();
}
