#pragma once

#include "host/program/journal/Journal.h"
#include "host/program/journal/PostgresConnection.h"

/// The part of the schema that claims; see Journal::Claim. It is one call, so that a claim costs
/// one round trip. Whoever claims waits for nobody: what others have at hand is passed over.
extern const char* const ClaimFunction;

/// What is asked for by a claim, as ClaimJob takes it.
struct ClaimRequest {
    ClaimRequest(const std::vector<ClaimableFolder>& asked, const Claimant& claimant);

    std::string folders; ///< JSON
    std::string cannot;  ///< likewise
};

/// @return the row, as PostgresJobColumns; none when there is nothing to claim
pqxx::result ClaimJob(PostgresConnection& connection, const ClaimRequest& request,
                      const Claimant& claimant);
