#include "devices/operations/certificates/certificateassignments.h"

#include <nlohmann/json.hpp>

JSON CertificateAssignments::deviceIds() const {
    JSON ids = JSON::array();
    for (const Entry &entry : entries)
        ids.push_back(entry.device->id.toStdString());
    return ids;
}

JSON CertificateAssignments::files(CertificateFilePtr CertificatePair::*slot) const {
    JSON list = JSON::array();
    for (const Entry &entry : entries) {
        const CertificateFilePtr &file = entry.pair.*slot;
        list.push_back({{"fpath", file->path.toStdString()},
                        {"fname", file->name.toStdString()},
                        {"d_mac", entry.device->text(DeviceColumn::Mac).toStdString()}});
    }
    return list;
}

JSON CertificateAssignments::certificates() const {
    return files(&CertificatePair::certificate);
}

JSON CertificateAssignments::privateKeys() const {
    return files(&CertificatePair::key);
}
