#include "platform/log/logfile.h"

#include "platform/files/apppaths.h"
#include "platform/files/privatefiles.h"

#include <QDir>
#include <QFile>

namespace LogFile {

namespace {

constexpr QFileDevice::Permissions ownerOnly = QFileDevice::ReadOwner | QFileDevice::WriteOwner;
const QString dayFormat = QStringLiteral("yyyy-MM-dd");
const QString ending = QStringLiteral(".log");
const QString earlierEnding = QStringLiteral(".earlier.log");

bool open(QFile &file) {
    return file.open(QIODevice::WriteOnly | QIODevice::Append | QIODevice::Text, ownerOnly);
}

// One write a line keeps lines whole, also beside another process; without the buffer the end of a line
// would be a write of its own where text files have a longer one.
bool write(QFile &file, const QByteArray &line) {
    return file.write(line) == line.size() && file.flush();
}

/// The newest lines tell most of what went wrong, so the oldest ones go.
bool beginAnew(QFile &file, const QString &earlier, const QByteArray &stamp) {
    file.close();
    QFile::remove(earlier);
    if (!QFile::rename(file.fileName(), earlier) || !open(file))
        return false;
    return write(file, stamp + "INFO: WARNING: The log of this day was cut: its last " +
                           QByteArray::number(maxBytes / 1024 / 1024) + " MiB up to here are in " +
                           QFileInfo(earlier).fileName().toUtf8() + ", and what was before them is gone\n");
}

} // namespace

bool append(const QDateTime &time, const QByteArray &line) {
    const QString folder = AppPaths::logFolder();
    if (!PrivateFiles::ensureFolder(folder))
        return false;
    const QString day = folder + QLatin1Char('/') + time.toString(dayFormat);
    QFile file(day + ending);
    if (!open(file))
        return false;
    if (file.size() > 0 && file.size() + line.size() > maxBytes &&
        !beginAnew(file, day + earlierEnding,
                   time.toString(QStringLiteral("yyyy-MM-dd hh:mm:ss.zzz ")).toUtf8()))
        return false;
    return write(file, line);
}

void removeOld(const QDate &today) {
    const QDir folder(AppPaths::logFolder());
    for (const QString &name : folder.entryList({QLatin1Char('*') + ending}, QDir::Files)) {
        const QString begin =
            name.chopped(name.endsWith(earlierEnding) ? earlierEnding.size() : ending.size());
        const QDate day = QDate::fromString(begin, dayFormat);
        if (day.isValid() && day.daysTo(today) > keptDays)
            QFile::remove(folder.filePath(name));
    }
}

} // namespace LogFile
