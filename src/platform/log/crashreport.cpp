#include "platform/log/crashreport.h"

#include "platform/files/apppaths.h"
#include "platform/files/privatefiles.h"
#include "platform/log/crashcatcher.h"

#include <QCoreApplication>
#include <QDateTime>
#include <QDir>

#include <algorithm>
#include <atomic>
#include <cstring>

namespace CrashReport {

namespace {

constexpr std::size_t roomBytes = 32 * 1024;
constexpr std::size_t maxLineLength = 1000;
constexpr int keptReports = 10;
const QString unseenEnding = QStringLiteral(".new.txt");

// A ring in static memory, which is read when nothing else can be relied on any more.
char room[roomBytes];
std::atomic<std::size_t> written = 0;

void put(std::string_view text) {
    std::size_t at = written.load(std::memory_order_relaxed);
    for (const char character : text)
        room[at++ % roomBytes] = character;
    written.store(at, std::memory_order_release);
}

/// Hands over the whole lines of the ring, oldest first.
void tell(void (*take)(std::string_view)) {
    const std::size_t end = written.load(std::memory_order_acquire);
    if (end <= roomBytes)
        return take({room, end});
    const std::size_t seam = end % roomBytes;
    const std::string_view older(room + seam, roomBytes - seam);
    const std::size_t cut = older.find('\n');
    take(cut == std::string_view::npos ? std::string_view() : older.substr(cut + 1));
    take({room, seam});
}

QDir reportFolder() {
    return QDir(AppPaths::logFolder());
}

/// Named after the start of the process: a dying one had better not ask for the time in words.
QString newReportPath() {
    const QString start = QDateTime::currentDateTime().toString(QStringLiteral("yyyy-MM-dd-hhmmss"));
    return reportFolder().filePath(
        QStringLiteral("crash-%1-%2").arg(start).arg(QCoreApplication::applicationPid()) + unseenEnding);
}

} // namespace

void install(const QString &program) {
    if (!PrivateFiles::ensureFolder(AppPaths::logFolder()))
        return;
    CrashCatcher::install({.path = newReportPath().toStdString(),
                           .heading = (program + QStringLiteral(" ended unexpectedly.")).toStdString(),
                           .tell = tell});
}

void remember(const QByteArray &line) {
    put({line.constData(), std::min(static_cast<std::size_t>(line.size()), maxLineLength)});
    put("\n");
}

QString takePending() {
    const QDir folder = reportFolder();
    QString newest;
    const QStringList unseen = folder.entryList({QStringLiteral("crash-*") + unseenEnding}, QDir::Files);
    for (const QString &name : unseen) {
        const QString seenName = name.chopped(unseenEnding.size()) + QStringLiteral(".txt");
        newest = folder.filePath(QFile::rename(folder.filePath(name), folder.filePath(seenName)) ? seenName
                                                                                                 : name);
    }
    const QStringList reports = folder.entryList({QStringLiteral("crash-*.txt")}, QDir::Files);
    for (qsizetype i = 0; i < reports.size() - keptReports; ++i)
        QFile::remove(folder.filePath(reports[i]));
    return newest;
}

} // namespace CrashReport
