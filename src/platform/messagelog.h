#pragma once

#include <QString>

#include <string>

/// The process-wide diagnostic log: standard output and one file a day in AppPaths::logFolder().
namespace MessageLog {

/// Routes every toolkit message through the log. To be called before the application object exists.
void install();

/// The text itself, or a mask when NVLDM_LOG_REDACT=1 asks for it: for passwords, tokens and keys in log
/// lines.
QByteArray secret(const QByteArray &text);
QByteArray secret(const QString &text);
QByteArray secret(const std::string &text);

} // namespace MessageLog
