#pragma once

#include <QByteArray>
#include <QString>

/// What a crash leaves behind: a text in AppPaths::logFolder(), readable by its user alone, with version,
/// time, place and the last log lines.
namespace CrashReport {

/// From here on whatever ends the process by accident leaves its text. The log folder is made for that.
void install(const QString &program);

/// Takes a line into what a crash would tell; the oldest ones give way. The caller keeps secrets out of it
/// and calls from one thread at a time.
void remember(const QByteArray &line);

/// Path of the newest text that was not asked for yet, or an empty text. Older ones count as asked for too,
/// and only a few of them are kept.
QString takePending();

} // namespace CrashReport
