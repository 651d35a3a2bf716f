#pragma once

#include "host/program/journal/SharedJournal.h"

#include <algorithm>

/// A journal in memory, as far as a page goes: its jobs stand as the test has put them.
class FakeJournal : public Journal, public SharedJournal {
public:
    /// What is in it, and outlives each object.
    struct Content {
        std::vector<Job> jobs;
        std::set<wxString> paused;
        std::string fault; ///< what each call throws; or empty
        std::vector<std::int64_t> retried;
        std::optional<std::vector<Machine>> machines; ///< that share it, if any do
    };

    explicit FakeJournal(Content& content) : m_content(content) {}

    std::size_t Insert(const std::vector<NewJob>&) override { return 0; }
    std::optional<Job> Claim(const std::vector<ClaimableFolder>&, const Claimant&) override {
        return std::nullopt;
    }
    void Heartbeat(const Claimant&, const std::vector<std::int64_t>&) override {}
    bool Commit(const Job&) override { return false; }
    std::vector<Job> TakeOver(const std::vector<wxString>&, const Claimant&) override { return {}; }
    void Remove(std::int64_t) override {}
    JournalTime Now() override { return std::chrono::system_clock::now(); }

    std::vector<Job> List(const JobQuery& query) override {
        std::vector<Job> found;
        for (const Job& job : m_content.jobs)
            if (found.size() < query.limit && (!query.folder || job.folder == *query.folder) &&
                (!query.state || job.state == *query.state) &&
                (!query.open || job.open == *query.open))
                found.push_back(job);
        return found;
    }

    std::map<wxString, FolderCounts> Counts() override {
        if (!m_content.fault.empty())
            throw JournalError(m_content.fault);
        std::map<wxString, FolderCounts> counts;
        for (const Job& job : m_content.jobs) {
            FolderCounts& folder = counts[job.folder];
            ++folder.jobs[job.state];
            if (job.state == JobState::Waiting &&
                job.inserted < folder.oldestWaiting.value_or(JournalTime::max()))
                folder.oldestWaiting = job.inserted;
        }
        return counts;
    }

    bool Retry(std::int64_t id) override {
        for (Job& job : m_content.jobs)
            if (job.id == id && job.state == JobState::Failed && !job.open) {
                job.state = JobState::Waiting;
                m_content.retried.push_back(id);
                return true;
            }
        return false;
    }

    void SetPaused(const wxString& folder, bool paused) override {
        if (paused)
            m_content.paused.insert(folder);
        else
            m_content.paused.erase(folder);
    }
    std::set<wxString> Paused() override { return m_content.paused; }

    SharedJournal* Shared() override { return m_content.machines ? this : nullptr; }
    void Announce(const std::vector<AnnouncedFolder>&, const wxString&,
                  const std::vector<wxString>&) override {}
    std::vector<AnnouncedFolder> Announced() override { return {}; }
    void Report(const Machine&, const Claimant&) override {}
    void TakeLeave(const wxString&) override {}
    std::vector<Machine> Machines() override { return *m_content.machines; }

private:
    Content& m_content;
};
