#pragma once

#include <QSet>
#include <QString>

#include <vector>

/// IPv4 addresses as an administrator writes them: "192.168.1.10", or patterns with "*" and ranges in their
/// parts, "192.168.*.10-19".
namespace AddressPattern {

/// Four numbers from 0 to 255 without leading zeros.
bool isAddress(const QString &text);
/// The number of an address, with or without leading zeros; 0 for any other text.
quint32 numberOf(const QString &text);
QString textOf(quint32 address);
/// Whether a text is a subnet mask.
bool isMask(const QString &text);
/// Four parts, each "*", a number or a range.
bool isPattern(const QString &text);

/// The patterns of a list with commas, semicolons or blanks between them.
QStringList split(const QString &list);

/// How many addresses a pattern offers: the product of its parts' counts. "*" counts 256, a range as many as
/// it spans in either direction, a number 1, and what is no range with two ends 0.
qint64 count(const QString &pattern);

/// What addresses may not be handed out.
struct Limits {
    quint32 mask = 0; ///< its network and broadcast addresses
    quint32 gateway = 0;
    QSet<quint32> taken;
};

/// Whether an address is one that a device can have at all, within the limits.
bool isUsable(quint32 address, const Limits &limits);

/// The lowest addresses that the patterns offer within the limits, in ascending order, as many as wanted or
/// as there are.
std::vector<quint32> lowest(const QStringList &patterns, std::size_t wanted, const Limits &limits);

} // namespace AddressPattern
