#pragma once

#include "platform/json.h"

/// What a device's record says of the certificates that the device works with.
struct DeviceCertificates {
    QString httpsSubject;    ///< empty where the record names none
    qint64 httpsExpires = 0; ///< Unix ms, 0 where it is not known; so the one below
    qint64 ieeeExpires = 0;
    bool hasHttps = false;
    bool hasIeee = false;
    /// The device has a private key, or a request for a certificate, that a certificate can be installed for.
    bool awaitsCertificate = false;

    static DeviceCertificates of(const JSON &record);
};
