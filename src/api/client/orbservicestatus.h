#pragma once

#include <string>

/// How the service stands with the remote-access service, as it remembers from their last contact.
struct OrbServiceStatus {
    std::string machineUuid; ///< the service's machine there
    std::string deviceId;    ///< the service itself there
    bool connected = false;
    bool remoteAccess = false; ///< technical support may come in
};
