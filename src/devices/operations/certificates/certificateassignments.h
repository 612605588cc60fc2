#pragma once

#include "devices/inventory/devicerecord.h"
#include "devices/operations/certificates/certificatecheck.h"
#include "platform/json.h"

#include <vector>

/// Which devices get which files, in the forms that the queue of uploads takes. Any thread.
struct CertificateAssignments {
    struct Entry {
        DeviceRecordPtr device;
        CertificatePair pair;
    };
    std::vector<Entry> entries;

    JSON deviceIds() const;
    JSON certificates() const;
    JSON privateKeys() const;

private:
    JSON files(CertificateFilePtr CertificatePair::*slot) const;
};
