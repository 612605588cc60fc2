#pragma once

#include "platform/json.h"

#include <vector>

/// A customer's organization of the remote-access service, with the places that devices can be synced to.
struct OrbOrganization {
    struct Site {
        QString id;
        QString name;
    };

    QString id;
    QString name;
    bool remoteAccess = true; ///< support may be let in
    std::vector<Site> sites;
};

/// Reads the service's list, sorted by name as its sites are. Records without an id are left out; one
/// without a name shows its id.
std::vector<OrbOrganization> readOrganizations(const JSON &list);
