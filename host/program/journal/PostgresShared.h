#pragma once

#include "host/program/journal/PostgresConnection.h"
#include "host/program/journal/SharedJournal.h"

/// What programs say to each other by a queue.
class PostgresShared : public SharedJournal {
public:
    /// @param connection outlives it
    explicit PostgresShared(PostgresConnection& connection) : m_connection(connection) {}

    void Announce(const std::vector<AnnouncedFolder>& folders, const wxString& finder,
                  const std::vector<wxString>& all) override;
    std::vector<AnnouncedFolder> Announced() override;
    void Report(const Machine& machine, const Claimant& claimant) override;
    void TakeLeave(const wxString& machine) override;
    std::vector<Machine> Machines() override;

private:
    PostgresConnection& m_connection;
};
