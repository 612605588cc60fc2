#pragma once

#include <QIcon>
#include <QString>

/// What the state codes of tasks and of their devices mean.
namespace TaskState {

inline const QString init = QStringLiteral("pTaskInitState");
inline const QString queued = QStringLiteral("pTaskQueueState");
inline const QString scheduled = QStringLiteral("pTaskScheduled");
inline const QString processing = QStringLiteral("pTaskProcessing");
inline const QString done = QStringLiteral("pTaskDone");
inline const QString failed = QStringLiteral("pTaskFailed");
inline const QString aborted = QStringLiteral("pTaskAborted");
inline const QString uploadDone = QStringLiteral("pTaskUploadDone");

/// How a code looks; each kind has one icon.
enum class Kind { Notice, Time, Running, Success, Calendar, Warning };

/// The text shown for a code, the code itself where there is none.
QString text(const QString &code);

/// A failure's reason in a few words: its text without the step that failed and without the advice.
QString cause(const QString &code);

Kind kind(const QString &code);
/// The icon of a kind, 9 by 9. User-interface thread.
const QIcon &icon(Kind kind);
/// Adds the icon of a code, 9 by 9, to an icon.
void addIcon(const QString &code, QIcon &icon);

/// True for a code that tells of a failure.
bool isFailure(const QString &code);
/// True for a code after which nothing more happens.
bool isFinal(const QString &code);

} // namespace TaskState
