#include "devices/inventory/devicecertificates.h"

#include <nlohmann/json.hpp>

namespace {

constexpr qint64 year10000 = 253402300800000;

/// A time that can be shown; 0 for anything else.
qint64 timeOf(const JSON &record, const char *name) {
    const auto found = record.find(name);
    if (found == record.end() || !found->is_number_integer())
        return 0;
    const auto time = found->get<qint64>();
    return time > 0 && time < year10000 ? time : 0;
}

bool isTrue(const JSON &record, const char *name) {
    const auto found = record.find(name);
    return found != record.end() && found->is_boolean() && found->get<bool>();
}

} // namespace

DeviceCertificates DeviceCertificates::of(const JSON &record) {
    DeviceCertificates known;
    known.httpsSubject = stringMember(record, "d_cert_subject");
    known.httpsExpires = timeOf(record, "d_cert_expires");
    known.ieeeExpires = timeOf(record, "d_8021x_expires");
    known.hasHttps =
        isTrue(record, "d_has_matching_cert") || known.httpsExpires != 0 || !known.httpsSubject.isEmpty();
    known.hasIeee = known.ieeeExpires != 0;
    known.awaitsCertificate =
        isTrue(record, "d_has_matching_private_key") || isTrue(record, "d_has_matching_cert_request");
    return known;
}
