#include "downloadtarget.h"

#include <QFileInfo>

DownloadTarget::DownloadTarget(const char *path)
    : m_path(QString::fromUtf8(path)),
      m_file(QFileInfo(m_path).absolutePath() + QStringLiteral("/.download-XXXXXX")) {}

bool DownloadTarget::open() {
    return check(!QFileInfo::exists(m_path) && m_file.open());
}

bool DownloadTarget::write(const char *bytes, std::size_t length) {
    return check(m_file.write(bytes, static_cast<qint64>(length)) == static_cast<qint64>(length));
}

bool DownloadTarget::finish() {
    // Refuses a name that is taken, unlike the plain file's renaming, which may fall back to copying.
    if (!check(m_file.flush() && m_file.rename(m_path)))
        return false;
    m_file.setAutoRemove(false);
    return true;
}

std::string DownloadTarget::name() const {
    return QFileInfo(m_path).fileName().toStdString();
}

bool DownloadTarget::check(bool succeeded) {
    m_failed |= !succeeded;
    return succeeded;
}
