#include "privatefiles.h"

#include <QDir>
#include <QFile>
#include <QFileInfo>

namespace PrivateFiles {

namespace {
constexpr QFileDevice::Permissions ownerFile = QFileDevice::ReadOwner | QFileDevice::WriteOwner;
constexpr QFileDevice::Permissions ownerFolder = ownerFile | QFileDevice::ExeOwner;
} // namespace

bool ensureFolder(const QString &folder) {
    if (QFileInfo(folder).isDir())
        return true;
    const QString parent = QFileInfo(folder).absolutePath();
    if (!QFileInfo(parent).isDir() && !ensureFolder(parent))
        return false;
    // A second process may have made it in between; what counts is that it is there.
    return QDir().mkdir(folder, ownerFolder) || QFileInfo(folder).isDir();
}

bool ensureFile(const QString &path) {
    if (QFileInfo::exists(path))
        return true;
    if (!ensureFolder(QFileInfo(path).absolutePath()))
        return false;
    QFile file(path);
    return file.open(QIODevice::NewOnly | QIODevice::WriteOnly, ownerFile) || QFileInfo::exists(path);
}

} // namespace PrivateFiles
