#pragma once

#include <QString>

#include <string>

/// The process-wide diagnostic log: standard output and one file a day in AppPaths::logFolder(). Every
/// message is one line; what would end it, or steer a terminal, is written in letters ("\n", "\u001b").
namespace MessageLog {

/// Routes every Qt message through the log. To be called before the application object exists.
/// Files of days long ago are removed.
void install();

/// Writes what is being counted. To be called before the process ends.
void finish();

/// While it lives, lines of this thread that repeat within a minute are written once, and their count at the
/// minute's end: for polls, which would fill the log.
class PollScope {
public:
    PollScope();
    ~PollScope();
    PollScope(const PollScope &) = delete;
    PollScope &operator=(const PollScope &) = delete;
};

/// The text itself, or a mask when NVLDM_LOG_REDACT=1 asks for it: for passwords, tokens and keys in log
/// lines. What a crash tells of the log is masked always, and what goes to standard output as well unless
/// that is a terminal or a file of the user: once the log is installed the text comes marked for that, which
/// is seen nowhere in the log and makes the result unfit for anything else.
QByteArray secret(const QByteArray &text);
QByteArray secret(const QString &text);
QByteArray secret(const std::string &text);

} // namespace MessageLog
