#pragma once

#include <QString>

/// How a certificate stands to the clock.
enum class CertificateValidity : quint8 { Unknown, NotYetValid, Valid, ExpiresSoon, Expired };

namespace CertificateValidities {

inline constexpr int soonDays = 30;

/// from, until, now: Unix ms; an until of 0 is not known, a from of 0 lies in the past.
CertificateValidity of(qint64 from, qint64 until, qint64 now);

/// A word or two for it.
QString text(CertificateValidity validity);

/// A time as the tables show it, without the time of day; "--" for 0.
QString dateText(qint64 time);

} // namespace CertificateValidities
