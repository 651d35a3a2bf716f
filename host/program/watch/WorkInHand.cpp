#include "host/program/watch/WorkInHand.h"

#include <algorithm>

DocumentInHand* WorkInHand::Find(const Job& job) {
    for (Documents* const documents : {&converting, &atPrinter, &ending})
        for (auto& [ticket, document] : *documents)
            if (document.job.id == job.id && document.job.identity == job.identity)
                return &document;
    return nullptr;
}

bool WorkInHand::HasEndings() const {
    return std::any_of(ending.begin(), ending.end(), [](const auto& entry) {
        return entry.second.next == DocumentInHand::Clock::time_point();
    });
}

std::vector<Input> WorkInHand::InputsOfWorkers() const {
    std::vector<Input> inputs;
    for (const auto& [ticket, document] : converting)
        inputs.push_back(InputOf(document.job));
    return inputs;
}

std::vector<RunningDocument> WorkInHand::Running() const {
    std::vector<RunningDocument> running;
    for (const auto& [ticket, document] : converting)
        running.push_back(document.shown);
    return running;
}

std::vector<std::int64_t> WorkInHand::Claimed() const {
    std::vector<std::int64_t> jobs;
    for (const Documents* const documents : {&converting, &atPrinter, &ending})
        for (const auto& [ticket, document] : *documents)
            if (document.next == DocumentInHand::Clock::time_point()) // another may do better
                jobs.push_back(document.job.id);
    return jobs;
}

void WorkInHand::LeaveProducts() {
    for (Documents* const documents : {&atPrinter, &ending})
        for (auto& [ticket, document] : *documents)
            if (HasProduct(document.job.state) && document.workplace)
                document.workplace->Leave();
}
