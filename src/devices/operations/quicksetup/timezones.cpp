#include "devices/operations/quicksetup/timezones.h"

#include <QCoreApplication>
#include <QRegularExpression>
#include <QTimeZone>

#include <algorithm>
#include <array>

namespace TimeZones {

namespace {

constexpr int longest = 64;

constexpr Zone zones[] = {
    {"SST11", QT_TRANSLATE_NOOP("TimeZones", "Pago Pago")},
    {"HST10", QT_TRANSLATE_NOOP("TimeZones", "Honolulu")},
    {"AKST9AKDT,M3.2.0,M11.1.0", QT_TRANSLATE_NOOP("TimeZones", "Anchorage")},
    {"PST8PDT,M3.2.0,M11.1.0", QT_TRANSLATE_NOOP("TimeZones", "Los Angeles, Vancouver")},
    {"MST7MDT,M3.2.0,M11.1.0", QT_TRANSLATE_NOOP("TimeZones", "Denver, Edmonton")},
    {"MST7", QT_TRANSLATE_NOOP("TimeZones", "Phoenix")},
    {"CST6CDT,M3.2.0,M11.1.0", QT_TRANSLATE_NOOP("TimeZones", "Chicago, Winnipeg")},
    {"CST6", QT_TRANSLATE_NOOP("TimeZones", "Mexico City, Guatemala")},
    {"EST5EDT,M3.2.0,M11.1.0", QT_TRANSLATE_NOOP("TimeZones", "New York, Toronto")},
    {"<-05>5", QT_TRANSLATE_NOOP("TimeZones", "Bogotá, Lima")},
    {"AST4ADT,M3.2.0,M11.1.0", QT_TRANSLATE_NOOP("TimeZones", "Halifax")},
    {"<-04>4", QT_TRANSLATE_NOOP("TimeZones", "Caracas, La Paz")},
    {"<-04>4<-03>,M9.1.6/24,M4.1.6/24", QT_TRANSLATE_NOOP("TimeZones", "Santiago")},
    {"NST3:30NDT,M3.2.0,M11.1.0", QT_TRANSLATE_NOOP("TimeZones", "St. John’s")},
    {"<-03>3", QT_TRANSLATE_NOOP("TimeZones", "São Paulo, Buenos Aires")},
    {"<-02>2", QT_TRANSLATE_NOOP("TimeZones", "South Georgia")},
    {"<-01>1<+00>,M3.5.0/0,M10.5.0/1", QT_TRANSLATE_NOOP("TimeZones", "Azores")},
    {"<-01>1", QT_TRANSLATE_NOOP("TimeZones", "Praia")},
    {"UTC0", QT_TRANSLATE_NOOP("TimeZones", "Coordinated Universal Time")},
    {"GMT0BST,M3.5.0/1,M10.5.0", QT_TRANSLATE_NOOP("TimeZones", "London, Dublin")},
    {"WET0WEST,M3.5.0/1,M10.5.0", QT_TRANSLATE_NOOP("TimeZones", "Lisbon")},
    {"GMT0", QT_TRANSLATE_NOOP("TimeZones", "Accra, Reykjavik")},
    {"CET-1CEST,M3.5.0,M10.5.0/3", QT_TRANSLATE_NOOP("TimeZones", "Berlin, Madrid, Paris, Rome")},
    {"CET-1", QT_TRANSLATE_NOOP("TimeZones", "Algiers, Tunis")},
    {"WAT-1", QT_TRANSLATE_NOOP("TimeZones", "Lagos")},
    {"EET-2EEST,M3.5.0/3,M10.5.0/4", QT_TRANSLATE_NOOP("TimeZones", "Athens, Helsinki, Kyiv")},
    {"EET-2EEST,M4.5.5/0,M10.5.4/24", QT_TRANSLATE_NOOP("TimeZones", "Cairo")},
    {"IST-2IDT,M3.4.4/26,M10.5.0", QT_TRANSLATE_NOOP("TimeZones", "Jerusalem")},
    {"SAST-2", QT_TRANSLATE_NOOP("TimeZones", "Johannesburg")},
    {"<+03>-3", QT_TRANSLATE_NOOP("TimeZones", "Istanbul, Riyadh")},
    {"MSK-3", QT_TRANSLATE_NOOP("TimeZones", "Moscow")},
    {"EAT-3", QT_TRANSLATE_NOOP("TimeZones", "Nairobi")},
    {"<+0330>-3:30", QT_TRANSLATE_NOOP("TimeZones", "Tehran")},
    {"<+04>-4", QT_TRANSLATE_NOOP("TimeZones", "Baku, Dubai")},
    {"<+0430>-4:30", QT_TRANSLATE_NOOP("TimeZones", "Kabul")},
    {"PKT-5", QT_TRANSLATE_NOOP("TimeZones", "Karachi")},
    {"<+05>-5", QT_TRANSLATE_NOOP("TimeZones", "Tashkent")},
    {"IST-5:30", QT_TRANSLATE_NOOP("TimeZones", "Delhi, Mumbai")},
    {"<+0545>-5:45", QT_TRANSLATE_NOOP("TimeZones", "Kathmandu")},
    {"<+06>-6", QT_TRANSLATE_NOOP("TimeZones", "Dhaka")},
    {"<+0630>-6:30", QT_TRANSLATE_NOOP("TimeZones", "Yangon")},
    {"<+07>-7", QT_TRANSLATE_NOOP("TimeZones", "Bangkok, Hanoi")},
    {"WIB-7", QT_TRANSLATE_NOOP("TimeZones", "Jakarta")},
    {"CST-8", QT_TRANSLATE_NOOP("TimeZones", "Beijing, Shanghai, Taipei")},
    {"HKT-8", QT_TRANSLATE_NOOP("TimeZones", "Hong Kong")},
    {"PST-8", QT_TRANSLATE_NOOP("TimeZones", "Manila")},
    {"<+08>-8", QT_TRANSLATE_NOOP("TimeZones", "Kuala Lumpur, Singapore")},
    {"AWST-8", QT_TRANSLATE_NOOP("TimeZones", "Perth")},
    {"JST-9", QT_TRANSLATE_NOOP("TimeZones", "Tokyo")},
    {"KST-9", QT_TRANSLATE_NOOP("TimeZones", "Seoul")},
    {"ACST-9:30", QT_TRANSLATE_NOOP("TimeZones", "Darwin")},
    {"ACST-9:30ACDT,M10.1.0,M4.1.0/3", QT_TRANSLATE_NOOP("TimeZones", "Adelaide")},
    {"AEST-10", QT_TRANSLATE_NOOP("TimeZones", "Brisbane")},
    {"AEST-10AEDT,M10.1.0,M4.1.0/3", QT_TRANSLATE_NOOP("TimeZones", "Melbourne, Sydney")},
    {"<+11>-11", QT_TRANSLATE_NOOP("TimeZones", "Nouméa")},
    {"<+12>-12", QT_TRANSLATE_NOOP("TimeZones", "Suva")},
    {"NZST-12NZDT,M9.5.0,M4.1.0/3", QT_TRANSLATE_NOOP("TimeZones", "Auckland")},
    {"<+13>-13", QT_TRANSLATE_NOOP("TimeZones", "Nukuʻalofa")},
};

/// Name and offset, then, where there is daylight saving, its name, its offset and its two rules.
QRegularExpression zoneForm() {
    const QString name = QStringLiteral(R"((?:[A-Za-z]{3,}|<[-+A-Za-z0-9]{3,}>))");
    const QString offset = QStringLiteral(R"([-+]?(?:2[0-4]|[01]?\d)(?::[0-5]\d){0,2})");
    const QString day = QStringLiteral(R"((?:M(?:1[0-2]|[1-9])\.[1-5]\.[0-6]|J?\d{1,3}))");
    const QString rule = day + QStringLiteral(R"((?:/[-+]?\d{1,3}(?::[0-5]\d){0,2})?)");
    return QRegularExpression(QStringLiteral(R"(\A%1%2(?:%1(?:%2)?(?:,%3,%3)?)?\z)").arg(name, offset, rule));
}

QTimeZone zoneOf(const QString &posix) {
    return isPosix(posix) ? QTimeZone(posix.toLatin1()) : QTimeZone();
}

/// Of the list, which needs no second look.
QTimeZone rulesOf(const Zone &zone) {
    return QTimeZone(QByteArray(zone.posix));
}

/// "UTC-05:00"
QString offsetText(int seconds) {
    const int minutes = std::abs(seconds) / 60;
    return QStringLiteral("UTC%1%2:%3")
        .arg(seconds < 0 ? QLatin1Char('-') : QLatin1Char('+'))
        .arg(minutes / 60, 2, 10, QLatin1Char('0'))
        .arg(minutes % 60, 2, 10, QLatin1Char('0'));
}

/// Middles of the seasons: what is equal then is hardly told apart by a user.
std::array<int, 4> seasons(const QTimeZone &zone) {
    const int year = QDate::currentDate().year();
    std::array<int, 4> offsets{};
    for (std::size_t i = 0; i < offsets.size(); ++i)
        offsets[i] = zone.offsetFromUtc(
            QDateTime(QDate(year, 1 + 3 * static_cast<int>(i), 15), QTime(12, 0), Qt::UTC));
    return offsets;
}

} // namespace

std::span<const Zone> all() {
    return zones;
}

QString text(const Zone &zone) {
    const QTimeZone rules = rulesOf(zone);
    return QStringLiteral("(%1) %2").arg(
        offsetText(rules.standardTimeOffset(QDateTime::currentDateTimeUtc())),
        QCoreApplication::translate("TimeZones", zone.cities));
}

int find(const QString &posix) {
    const auto found = std::find_if(std::begin(zones), std::end(zones),
                                    [&](const Zone &zone) { return posix == QLatin1String(zone.posix); });
    return found == std::end(zones) ? -1 : static_cast<int>(found - std::begin(zones));
}

int likeThisComputers() {
    const std::array<int, 4> own = seasons(QTimeZone::systemTimeZone());
    const auto found = std::find_if(std::begin(zones), std::end(zones),
                                    [&](const Zone &zone) { return seasons(rulesOf(zone)) == own; });
    return found == std::end(zones) ? -1 : static_cast<int>(found - std::begin(zones));
}

bool isPosix(const QString &text) {
    static const QRegularExpression form = zoneForm();
    return text.size() <= longest && form.match(text).hasMatch();
}

bool hasDaylight(const QString &posix) {
    const QTimeZone zone = zoneOf(posix);
    return zone.isValid() && zone.hasDaylightTime();
}

QDateTime clock(const QString &posix, const QDateTime &time, bool saving) {
    const QTimeZone zone = zoneOf(posix);
    if (!zone.isValid())
        return time.toLocalTime();
    return time.toOffsetFromUtc(saving ? zone.offsetFromUtc(time) : zone.standardTimeOffset(time));
}

} // namespace TimeZones
