#include "messagelog.h"

#include "apppaths.h"
#include "privatefiles.h"

#include <QDateTime>
#include <QFile>

#include <cstdio>
#include <mutex>

namespace MessageLog {

namespace {

constexpr QFileDevice::Permissions ownerOnly = QFileDevice::ReadOwner | QFileDevice::WriteOwner;

std::mutex logMutex;

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
    // One unbuffered write a line keeps lines whole, also beside another process.
    return file.open(QIODevice::WriteOnly | QIODevice::Append | QIODevice::Unbuffered, ownerOnly) &&
           file.write(line) == line.size();
}

void handle(QtMsgType type, const QMessageLogContext &context, const QString &message) {
    const QByteArray text = message.toUtf8();
    const std::lock_guard lock(logMutex);
    print(text);
    const QDateTime time = localNow();
    QByteArray line = time.toString(QStringLiteral("yyyy-MM-dd hh:mm:ss.zzz ")).toUtf8();
    line += severityLabel(type) + text + ", file: " + context.file +
            ", line: " + QByteArray::number(context.line) + ", function: " + context.function + '\n';
    // A message from inside a handler would bypass it, so this one is printed directly.
    if (!append(time, line))
        print("Failed to open log file");
}

} // namespace

void install() {
    qInstallMessageHandler(handle);
}

QByteArray secret(const QByteArray &text) {
    static const bool redact = qEnvironmentVariableIntValue("NVLDM_LOG_REDACT") == 1;
    return redact && !text.isEmpty() ? QByteArray("***") : text;
}

QByteArray secret(const QString &text) {
    return secret(text.toUtf8());
}

QByteArray secret(const std::string &text) {
    return secret(QByteArray::fromStdString(text));
}

} // namespace MessageLog
