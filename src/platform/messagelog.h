#pragma once

#include <QString>

#include <string>

/// The process-wide diagnostic log: standard output and one file a day in AppPaths::logFolder().
namespace MessageLog {

/// Routes every toolkit message through the log. To be called before the application object exists.
void install();

/// The text itself, or a mask when NVLDM_LOG_REDACT=1 asks for it: for passwords, tokens and keys in log
/// lines. What a crash tells of the log is masked always: once the log is installed the text comes marked for
/// that, which is seen nowhere in the log and makes the result unfit for anything else.
QByteArray secret(const QByteArray &text);
QByteArray secret(const QString &text);
QByteArray secret(const std::string &text);

} // namespace MessageLog
