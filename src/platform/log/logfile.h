#pragma once

#include <QByteArray>
#include <QDateTime>

/// The log's files: one a day in AppPaths::logFolder(), for the user alone.
namespace LogFile {

/// How long a day's file may become. Then it is kept under another name, in place of an earlier one of that
/// day, and a new one is begun.
constexpr qint64 maxBytes = 32 * 1024 * 1024;
constexpr int keptDays = 30;

/// Appends a line to the file of its day. False when it cannot be written. From one thread at a time.
bool append(const QDateTime &time, const QByteArray &line);

/// Removes the files of days that are longer ago than keptDays. Any thread.
void removeOld(const QDate &today);

} // namespace LogFile
