#include "platform/log/messagelog.h"

#include "platform/log/crashreport.h"
#include "platform/log/logfile.h"
#include "platform/log/repeatedlines.h"

#include <QDateTime>
#include <QThreadPool>

#include <algorithm>
#include <atomic>
#include <cstdio>
#include <cstdlib>
#include <mutex>

#ifdef Q_OS_WIN
#include <windows.h>
#else
#include <sys/stat.h>
#include <unistd.h>
#endif

namespace MessageLog {

namespace {

// Noncharacters around a secret on its way into a line; whoever writes the line takes them out.
constexpr QByteArrayView secretBegin("\xEF\xB7\x90");
constexpr QByteArrayView secretEnd("\xEF\xB7\x91");
constexpr QByteArrayView mask("***");

std::mutex logMutex;
QDate day; ///< of the last line
std::atomic<bool> installed = false;
thread_local int pollScopes = 0;

/// Local time, with the zone's offset asked for once a minute: asking costs more than the whole line.
QDateTime localNow() {
    static qint64 minuteOfOffset = -1;
    static qint64 offsetSeconds = 0;
    const qint64 now = QDateTime::currentMSecsSinceEpoch();
    if (const qint64 minute = now / 60000; minute != minuteOfOffset) {
        minuteOfOffset = minute;
        offsetSeconds = QDateTime::fromMSecsSinceEpoch(now).offsetFromUtc();
    }
    return QDateTime::fromMSecsSinceEpoch(now + offsetSeconds * 1000, Qt::UTC);
}

/// Fatal and info carry two labels: log readers have been built on that.
const char *severityLabel(QtMsgType type) {
    switch (type) {
    case QtDebugMsg:
        return "DEBUG: ";
    case QtWarningMsg:
        return "WARNING: ";
    case QtCriticalMsg:
        return "CRITICAL: ";
    case QtFatalMsg:
        return "FATAL: DEFAULT: ";
    case QtInfoMsg:
        return "INFO: WARNING: ";
    }
    return "DEFAULT: ";
}

void print(const QByteArray &text) {
    std::fwrite(text.constData(), 1, static_cast<std::size_t>(text.size()), stdout);
    std::fputc('\n', stdout);
    std::fflush(stdout);
}

QByteArray withoutMarks(QByteArray text) {
    return text.replace(secretBegin, {}).replace(secretEnd, {});
}

QByteArray masked(QByteArray text) {
    for (qsizetype begin = 0; (begin = text.indexOf(secretBegin, begin)) >= 0;) {
        const qsizetype end = text.indexOf(secretEnd, begin);
        text.replace(begin, (end < 0 ? text.size() : end + secretEnd.size()) - begin, mask);
    }
    return text;
}

/// The text with everything in letters that would end the line or steer a terminal: part of it may come from
/// a service.
QByteArray asOneLine(const QString &message) {
    const auto isControl = [](QChar character) {
        const char16_t code = character.unicode();
        return (code < 0x20 && code != '\t') || (code >= 0x7f && code < 0xa0) || code == 0x2028 ||
               code == 0x2029;
    };
    if (std::none_of(message.begin(), message.end(), isControl))
        return message.toUtf8();
    QString text;
    for (const QChar character : message) {
        if (character == QLatin1Char('\n'))
            text += QLatin1String("\\n");
        else if (character == QLatin1Char('\r'))
            text += QLatin1String("\\r");
        else if (isControl(character))
            text += QStringLiteral("\\u%1").arg(character.unicode(), 4, 16, QLatin1Char('0'));
        else
            text += character;
    }
    return text.toUtf8();
}

/// Whether standard output is the user's alone; what a desktop starts writes to a journal that others read.
bool isOutputPrivate() {
#ifdef Q_OS_WIN
    const auto kind = ::GetFileType(::GetStdHandle(STD_OUTPUT_HANDLE));
    return kind == FILE_TYPE_CHAR || kind == FILE_TYPE_DISK;
#else
    struct stat file = {};
    if (::isatty(STDOUT_FILENO) != 0)
        return true;
    return ::fstat(STDOUT_FILENO, &file) == 0 && S_ISREG(file.st_mode) && file.st_uid == ::geteuid();
#endif
}

void removeOldFiles(const QDate &today) {
    QThreadPool::globalInstance()->start([today] { LogFile::removeOld(today); });
}

void writeLine(const RepeatedLines::Line &message) {
    static const bool privateOutput = isOutputPrivate();
    const QByteArray maskedText = masked(message.text);
    const QByteArray text = withoutMarks(message.text);
    print(privateOutput ? text : maskedText);
    const QDateTime time = localNow();
    day = time.date();
    const QByteArray begin =
        time.toString(QStringLiteral("yyyy-MM-dd hh:mm:ss.zzz ")).toUtf8() + severityLabel(message.type);
    const QByteArray line = begin + text + ", file: " + message.file +
                            ", line: " + QByteArray::number(message.line) +
                            ", function: " + message.function + '\n';
    // A message from inside a handler would bypass it, so this one is printed directly.
    if (!LogFile::append(time, line))
        print("Failed to open log file");
    CrashReport::remember(begin + maskedText);
}

/// Never destroyed: there are threads that log at the very end.
RepeatedLines &repeatedLines() {
    static auto *const lines = new RepeatedLines(writeLine);
    return *lines;
}

void write(QtMsgType type, const QMessageLogContext &context, const QString &message) {
    const RepeatedLines::Line line{type, context.file, context.line, context.function, asOneLine(message)};
    QDate newDay;
    {
        const std::lock_guard lock(logMutex);
        const qint64 now = QDateTime::currentMSecsSinceEpoch();
        if (pollScopes > 0 && repeatedLines().count(line, now))
            return;
        repeatedLines().writeEnded(now);
        const QDate before = day;
        writeLine(line);
        newDay = day == before ? QDate() : day;
    }
    if (newDay.isValid())
        removeOldFiles(newDay);
}

void handle(QtMsgType type, const QMessageLogContext &context, const QString &message) {
    write(type, context, message);
    // Qt would end the process here too, on some systems without a word to who catches crashes.
    if (type == QtFatalMsg)
        std::abort();
}

} // namespace

void install() {
    installed = true;
    qInstallMessageHandler(handle);
}

void finish() {
    const std::lock_guard lock(logMutex);
    repeatedLines().writeAll();
}

PollScope::PollScope() {
    ++pollScopes;
}

PollScope::~PollScope() {
    --pollScopes;
}

QByteArray secret(const QByteArray &text) {
    static const bool redact = qEnvironmentVariableIntValue("NVLDM_LOG_REDACT") == 1;
    if (text.isEmpty())
        return text;
    if (redact)
        return mask.toByteArray();
    // Other handlers than this one's know nothing of marks.
    return installed ? secretBegin.toByteArray() + withoutMarks(text) + secretEnd.toByteArray() : text;
}

QByteArray secret(const QString &text) {
    return secret(text.toUtf8());
}

QByteArray secret(const std::string &text) {
    return secret(QByteArray::fromStdString(text));
}

} // namespace MessageLog
