#include "devices/operations/certificates/certificatecheck.h"

#include "devices/operations/certificates/certificatevalidity.h"

#include <QCoreApplication>

#include <algorithm>
#include <iterator>

namespace CertificateCheck {

namespace {

using Finding = CertificateFinding;
using Findings = CertificateFindings;

constexpr const char *context = "CertificateCheck";

struct Text {
    Finding finding;
    const char *note;
    const char *summary; ///< null where none is needed
};

constexpr Text texts[] = {
    {Finding::NoAddress, QT_TRANSLATE_NOOP("CertificateCheck", "No MAC address of its own"), nullptr},
    {Finding::Unusable, QT_TRANSLATE_NOOP("CertificateCheck", "File of no use"), nullptr},
    {Finding::NoCertificate, QT_TRANSLATE_NOOP("CertificateCheck", "No certificate"), nullptr},
    {Finding::NoKey, QT_TRANSLATE_NOOP("CertificateCheck", "No private key"), nullptr},
    {Finding::Encrypted, QT_TRANSLATE_NOOP("CertificateCheck", "Encrypted key not supported"), nullptr},
    {Finding::Closed, QT_TRANSLATE_NOOP("CertificateCheck", "Key not opened by the password"), nullptr},
    {Finding::Mismatch, QT_TRANSLATE_NOOP("CertificateCheck", "Key of another certificate"), nullptr},
    {Finding::Expired, QT_TRANSLATE_NOOP("CertificateCheck", "Expired"),
     QT_TRANSLATE_N_NOOP("CertificateCheck", "%n device(s) would get an expired certificate.")},
    {Finding::NotYetValid, QT_TRANSLATE_NOOP("CertificateCheck", "Not yet valid"),
     QT_TRANSLATE_N_NOOP("CertificateCheck", "%n device(s) would get a certificate that is not yet valid.")},
    {Finding::KeyInside, QT_TRANSLATE_NOOP("CertificateCheck", "File with a private key"),
     QT_TRANSLATE_N_NOOP("CertificateCheck", "%n device(s) would get a file that holds a private key too.")},
    {Finding::NoPendingKey, QT_TRANSLATE_NOOP("CertificateCheck", "No key or request on the device"),
     QT_TRANSLATE_N_NOOP("CertificateCheck", "%n device(s) will fail: no private key or certificate request "
                                             "there to install a certificate for.")},
    {Finding::ExpiresSoon, QT_TRANSLATE_NOOP("CertificateCheck", "Expires soon"), nullptr},
};

const Text &textOf(Finding finding) {
    return *std::find_if(std::begin(texts), std::end(texts),
                         [finding](const Text &text) { return text.finding == finding; });
}

Findings judgeValidity(const CertificateFile &file, qint64 now) {
    switch (CertificateValidities::of(file.validFrom, file.validUntil, now)) {
    case CertificateValidity::Expired:
        return Finding::Expired;
    case CertificateValidity::NotYetValid:
        return Finding::NotYetValid;
    case CertificateValidity::ExpiresSoon:
        return Finding::ExpiresSoon;
    default:
        return {};
    }
}

Findings judgeKey(const CertificatePair &pair, CertificateNeeds needs) {
    if (!pair.key)
        return Finding::NoKey;
    if (pair.key->isEncrypted && needs != CertificateNeeds::PairWithPassphrase)
        return Finding::Encrypted;
    if (pair.key->isEncrypted && pair.key->keyMark.isEmpty())
        return Finding::Closed;
    return CertificateFiles::belongTogether(*pair.certificate, *pair.key) ? Findings() : Finding::Mismatch;
}

Findings judgeFiles(const CertificatePair &pair, CertificateNeeds needs) {
    const bool complete = pair.certificate && (pair.key || !needsKey(needs));
    if (pair.refused && !complete)
        return Finding::Unusable;
    if (!pair.certificate)
        return Finding::NoCertificate;
    return needsKey(needs) ? judgeKey(pair, needs) : Findings();
}

} // namespace

bool hasAddress(const DeviceRecord &device) {
    const quint64 mac = device.sortKey(DeviceColumn::Mac);
    return mac != 0 && mac != DeviceRecord::unknownKey;
}

bool needsKey(CertificateNeeds needs) {
    return needs == CertificateNeeds::Pair || needs == CertificateNeeds::PairWithPassphrase;
}

bool blocks(CertificateFindings findings) {
    return (findings.toInt() & (static_cast<int>(Finding::Expired) - 1)) != 0;
}

int first(CertificateFindings findings) {
    const int bits = findings.toInt();
    return bits & -bits;
}

Findings judge(const CertificatePair &pair, const DeviceRecord &device, CertificateNeeds needs, qint64 now) {
    if (needs == CertificateNeeds::Nothing)
        return {};
    Findings found = judgeFiles(pair, needs);
    if (!hasAddress(device))
        found |= Finding::NoAddress;
    if (pair.certificate)
        found |= judgeValidity(*pair.certificate, now);
    if (needs == CertificateNeeds::Certificate) {
        if (pair.certificate && pair.certificate->hasKey)
            found |= Finding::KeyInside;
        if (!device.certificates.awaitsCertificate)
            found |= Finding::NoPendingKey;
    }
    return found;
}

const std::vector<Finding> &all() {
    static const std::vector<Finding> findings = [] {
        std::vector<Finding> every;
        for (const Text &text : texts)
            every.push_back(text.finding);
        return every;
    }();
    return findings;
}

QString note(Finding finding) {
    return QCoreApplication::translate(context, textOf(finding).note);
}

std::function<QString(int)> summary(Finding finding) {
    const char *text = textOf(finding).summary;
    if (!text)
        return {};
    return [text](int count) { return QCoreApplication::translate(context, text, nullptr, count); };
}

} // namespace CertificateCheck
