#include "api/transport/downloadtarget.h"

#include "platform/files/durablefiles.h"

#include <QDateTime>
#include <QDir>
#include <QFileInfo>

namespace {

/// A fetch that gets nothing for a minute is given up, so nobody writes to an older one any more.
constexpr std::chrono::minutes deadAge{5};

} // namespace

DownloadTarget::DownloadTarget(const char *path)
    : m_path(QString::fromUtf8(path)),
      m_file(QFileInfo(m_path).absolutePath() + QStringLiteral("/.download-XXXXXX")) {}

void DownloadTarget::removeLeftovers(const QString &folder, std::chrono::milliseconds age) {
    const QDateTime limit = QDateTime::currentDateTime().addMSecs(-age.count());
    const auto found = QDir(folder).entryInfoList({QStringLiteral(".download-??????")},
                                                  QDir::Files | QDir::Hidden | QDir::NoSymLinks);
    for (const QFileInfo &each : found) {
        if (each.lastModified() <= limit)
            QFile::remove(each.filePath());
    }
}

bool DownloadTarget::open() {
    removeLeftovers(QFileInfo(m_path).absolutePath(), deadAge);
    return check(!QFileInfo::exists(m_path) && m_file.open());
}

bool DownloadTarget::write(const char *bytes, std::size_t length) {
    return check(m_file.write(bytes, static_cast<qint64>(length)) == static_cast<qint64>(length));
}

bool DownloadTarget::finish() {
    // Refuses a name that is taken, unlike the plain file's renaming, which may fall back to copying.
    // Written out before: after a power cut a file of that name is whole, or not there.
    if (!check(DurableFiles::sync(m_file) && m_file.rename(m_path)))
        return false;
    m_file.setAutoRemove(false);
    if (!DurableFiles::syncFolder(QFileInfo(m_path).absolutePath()))
        qWarning("The folder of a fetched file could not be written out");
    return true;
}

std::string DownloadTarget::name() const {
    return QFileInfo(m_path).fileName().toStdString();
}

bool DownloadTarget::check(bool succeeded) {
    m_failed |= !succeeded;
    return succeeded;
}
