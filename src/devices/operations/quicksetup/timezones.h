#pragma once

#include <QDateTime>
#include <QString>

#include <span>

/// The time zones that devices are set to, as POSIX writes them.
namespace TimeZones {

struct Zone {
    const char *posix;
    const char *cities;
};

/// From west to east.
std::span<const Zone> all();

/// "(UTC+01:00) Berlin, …"
QString text(const Zone &zone);

/// The place of a zone in the list, or -1.
int find(const QString &posix);

/// The place of a zone whose clock goes like this computer's, or -1.
int likeThisComputers();

/// True for a text that devices take as a time zone.
bool isPosix(const QString &text);

/// True when the zone knows daylight saving.
bool hasDaylight(const QString &posix);

/// What clocks of the zone show at a time, with daylight saving or without. Local time for a zone that this
/// system cannot read.
QDateTime clock(const QString &posix, const QDateTime &time, bool saving);

} // namespace TimeZones
