#pragma once

#include "devices/inventory/devicerecord.h"
#include "devices/operations/certificates/certificatefile.h"

#include <QFlags>

#include <functional>
#include <vector>

/// Which files of its own an upload sends to each device.
enum class CertificateNeeds : quint8 {
    Nothing,           ///< none
    Certificate,       ///< a certificate for a key that the device has
    Pair,              ///< a certificate and its private key
    PairWithPassphrase ///< the same, and the key may be under a pass phrase
};

/// The files for a device.
struct CertificatePair {
    CertificateFilePtr certificate;
    CertificateFilePtr key;
    CertificateFilePtr refused; ///< bears the device's address, but is of no use
};

/// What is found in the files for a device.
enum class CertificateFinding : quint16 {
    NoAddress = 1 << 0, ///< from here on: the device cannot be served
    Unusable = 1 << 1,  ///< the only file for it is of no use
    NoCertificate = 1 << 2,
    NoKey = 1 << 3,
    Encrypted = 1 << 4, ///< the key is under a pass phrase that devices are not told
    Closed = 1 << 5,    ///< the given pass phrase does not open the key
    Mismatch = 1 << 6,  ///< the key is another certificate's
    Expired = 1 << 7,   ///< from here on: it can be served, but should not without a thought
    NotYetValid = 1 << 8,
    KeyInside = 1 << 9,     ///< a private key would travel with the certificate unasked
    NoPendingKey = 1 << 10, ///< the device has no key for a certificate
    ExpiresSoon = 1 << 11
};
Q_DECLARE_FLAGS(CertificateFindings, CertificateFinding)
Q_DECLARE_OPERATORS_FOR_FLAGS(CertificateFindings)

namespace CertificateCheck {

/// now: Unix ms.
CertificateFindings judge(const CertificatePair &pair, const DeviceRecord &device, CertificateNeeds needs,
                          qint64 now);

/// True where the files cannot do what they are meant for.
bool blocks(CertificateFindings findings);

/// The finding that weighs most, as its number.
int first(CertificateFindings findings);

/// Whether the name of a file can tell that it is for the device.
bool hasAddress(const DeviceRecord &device);
bool needsKey(CertificateNeeds needs);

/// All findings there are, those that block first.
const std::vector<CertificateFinding> &all();
/// Beside a device that has the finding.
QString note(CertificateFinding finding);
/// For so many devices, as a sentence; empty for what blocks, and for what need not be said of all.
std::function<QString(int)> summary(CertificateFinding finding);

} // namespace CertificateCheck
