#pragma once

#include <QString>

/// What devices generate a certificate of their own from.
struct SelfSignedCert {
    QString mode;
    int httpsPort = 443;
    QString country;
    QString province;
    QString locality;
    QString org;
    QString orgUnit;
    QString validity; ///< days
};
