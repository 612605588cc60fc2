#include "certificatevalidity.h"

#include <QCoreApplication>
#include <QDateTime>

namespace CertificateValidities {

namespace {
constexpr const char *context = "CertificateValidities";
constexpr qint64 dayMs = 86400000;
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
        return QCoreApplication::translate(context, "Unknown");
    case CertificateValidity::NotYetValid:
        return QCoreApplication::translate(context, "Not yet valid");
    case CertificateValidity::ExpiresSoon:
        return QCoreApplication::translate(context, "Expires soon");
    case CertificateValidity::Expired:
        return QCoreApplication::translate(context, "Expired");
    case CertificateValidity::Valid:
        break;
    }
    return QCoreApplication::translate(context, "Valid");
}

QString dateText(qint64 time) {
    return time == 0 ? QStringLiteral("--")
                     : QDateTime::fromMSecsSinceEpoch(time).toString(QStringLiteral("yyyy/MM/dd"));
}

} // namespace CertificateValidities
