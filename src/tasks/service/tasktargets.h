#pragma once

#include "platform/json.h"

#include <QSet>
#include <QStringList>

#include <initializer_list>

/// The forms in which devices are named to the service. An element is the id of a device, or an object with
/// its "id".
namespace TaskTargets {

/// ["DV…", …]
JSON ids(const JSON &devices);
JSON ids(const QStringList &ids);
/// The ids as texts; elements without one are left out.
QStringList idTexts(const JSON &devices);
/// [{"id","tid"}, …]
JSON withTask(const JSON &devices, const std::string &tid);
/// [{"id", and the members of the record}, …]; members that the record lacks are left out.
JSON withMembers(const JSON &devices, const JSON &record, std::initializer_list<const char *> members);
/// The elements whose device is among the ids.
JSON only(const JSON &devices, const QStringList &deviceIds);
/// The files whose device has one of the addresses, and those of no certain device.
JSON onlyFilesOf(const JSON &files, const QSet<QString> &macs);
/// The twelve digits of a MAC address in upper case; empty for any other text.
QString plainMac(const QString &mac);

} // namespace TaskTargets
