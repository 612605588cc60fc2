#include "devices/operations/certificates/certificatevalidity.h"

#include <QCoreApplication>
#include <QDateTime>

namespace CertificateValidities {

namespace {
constexpr qint64 dayMs = 86400000;

struct Texts {
    Q_DECLARE_TR_FUNCTIONS(CertificateValidities)
};
} // namespace

CertificateValidity of(qint64 from, qint64 until, qint64 now) {
    if (until == 0)
        return CertificateValidity::Unknown;
    if (now >= until)
        return CertificateValidity::Expired;
    if (now < from)
        return CertificateValidity::NotYetValid;
    return until - now <= soonDays * dayMs ? CertificateValidity::ExpiresSoon : CertificateValidity::Valid;
}

QString text(CertificateValidity validity) {
    switch (validity) {
    case CertificateValidity::Unknown:
        return Texts::tr("Unknown");
    case CertificateValidity::NotYetValid:
        return Texts::tr("Not yet valid");
    case CertificateValidity::ExpiresSoon:
        return Texts::tr("Expires soon");
    case CertificateValidity::Expired:
        return Texts::tr("Expired");
    case CertificateValidity::Valid:
        break;
    }
    return Texts::tr("Valid");
}

QString dateText(qint64 time) {
    return time == 0 ? QStringLiteral("--")
                     : QDateTime::fromMSecsSinceEpoch(time).toString(QStringLiteral("yyyy/MM/dd"));
}

} // namespace CertificateValidities
