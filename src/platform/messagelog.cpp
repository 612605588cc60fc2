#include "messagelog.h"

#include "apppaths.h"
#include "crashreport.h"
#include "privatefiles.h"

#include <QDateTime>
#include <QFile>

#include <atomic>
#include <cstdio>
#include <cstdlib>
#include <mutex>

namespace MessageLog {

namespace {

constexpr QFileDevice::Permissions ownerOnly = QFileDevice::ReadOwner | QFileDevice::WriteOwner;

// Noncharacters around a secret on its way into a line; whoever writes the line takes them out.
constexpr QByteArrayView secretBegin("\xEF\xB7\x90");
constexpr QByteArrayView secretEnd("\xEF\xB7\x91");
constexpr QByteArrayView mask("***");

std::mutex logMutex;
std::atomic<bool> installed = false;

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

bool append(const QDateTime &time, const QByteArray &line) {
    const QString folder = AppPaths::logFolder();
    if (!PrivateFiles::ensureFolder(folder))
        return false;
    QFile file(folder + QLatin1Char('/') + time.toString(QStringLiteral("yyyy-MM-dd")) +
               QStringLiteral(".log"));
    // One write a line keeps lines whole, also beside another process; without the buffer the end of a line
    // would be a write of its own where text files have a longer one.
    return file.open(QIODevice::WriteOnly | QIODevice::Append | QIODevice::Text, ownerOnly) &&
           file.write(line) == line.size() && file.flush();
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

void write(QtMsgType type, const QMessageLogContext &context, const QString &message) {
    const QByteArray marked = message.toUtf8();
    const QByteArray text = withoutMarks(marked);
    const std::lock_guard lock(logMutex);
    print(text);
    const QDateTime time = localNow();
    const QByteArray begin =
        time.toString(QStringLiteral("yyyy-MM-dd hh:mm:ss.zzz ")).toUtf8() + severityLabel(type);
    const QByteArray line = begin + text + ", file: " + context.file +
                            ", line: " + QByteArray::number(context.line) +
                            ", function: " + context.function + '\n';
    // A message from inside a handler would bypass it, so this one is printed directly.
    if (!append(time, line))
        print("Failed to open log file");
    CrashReport::remember(begin + masked(marked));
}

void handle(QtMsgType type, const QMessageLogContext &context, const QString &message) {
    write(type, context, message);
    // The toolkit would end the process here too, on some systems without a word to who catches crashes.
    if (type == QtFatalMsg)
        std::abort();
}

} // namespace

void install() {
    installed = true;
    qInstallMessageHandler(handle);
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
