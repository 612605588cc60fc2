#include "platform/files/privatefiles.h"

#include <QDir>
#include <QFile>
#include <QFileInfo>

#ifdef Q_OS_WIN
#include "platform/windows/windowsacl.h"
#else
#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>
#endif

namespace PrivateFiles {

namespace {

#ifdef Q_OS_WIN

// Qt's permissions leave in force what the folder above grants to everybody.
bool makeFolder(const QString &folder) {
    return WindowsAcl::makeFolder(QDir::toNativeSeparators(folder).toStdWString());
}

bool makeFile(const QString &path) {
    return WindowsAcl::makeFile(QDir::toNativeSeparators(path).toStdWString());
}

bool openOwn(QFile &file, const QString &path) {
    file.setFileName(path);
    return QFileInfo(path).isFile() && file.open(QIODevice::ReadOnly);
}

#else

constexpr QFileDevice::Permissions ownerFile = QFileDevice::ReadOwner | QFileDevice::WriteOwner;

bool makeFolder(const QString &folder) {
    return QDir().mkdir(folder, ownerFile | QFileDevice::ExeOwner);
}

bool makeFile(const QString &path) {
    return QFile(path).open(QIODevice::NewOnly | QIODevice::WriteOnly, ownerFile);
}

/// What was opened is what is looked at: the name may mean something else a moment later.
bool openOwn(QFile &file, const QString &path) {
    const int descriptor =
        ::open(QFile::encodeName(path).constData(), O_RDONLY | O_NONBLOCK | O_NOCTTY | O_CLOEXEC);
    if (descriptor < 0)
        return false;
    struct stat status {};
    if (::fstat(descriptor, &status) == 0 && S_ISREG(status.st_mode) && status.st_uid == ::geteuid() &&
        file.open(descriptor, QIODevice::ReadOnly, QFileDevice::AutoCloseHandle))
        return true;
    ::close(descriptor);
    return false;
}

#endif

} // namespace

bool ensureFolder(const QString &folder) {
    if (QFileInfo(folder).isDir())
        return true;
    const QString parent = QFileInfo(folder).absolutePath();
    if (!QFileInfo(parent).isDir() && !ensureFolder(parent))
        return false;
    // A second process may have made it in between; what counts is that it is there.
    return makeFolder(folder) || QFileInfo(folder).isDir();
}

bool ensureFile(const QString &path) {
    if (QFileInfo::exists(path))
        return true;
    if (!ensureFolder(QFileInfo(path).absolutePath()))
        return false;
    return makeFile(path) || QFileInfo::exists(path);
}

std::optional<QByteArray> readOwn(const QString &path, qint64 limit) {
    QFile file;
    if (!openOwn(file, path) || file.size() > limit)
        return std::nullopt;
    QByteArray content = file.read(limit + 1);
    if (file.error() != QFileDevice::NoError || content.size() > limit)
        return std::nullopt;
    return content;
}

} // namespace PrivateFiles
