#include "privatefiles.h"

#include <QDir>
#include <QFile>
#include <QFileInfo>

#ifdef Q_OS_WIN
#include "owneraccess.h"
#endif

namespace PrivateFiles {

namespace {

#ifdef Q_OS_WIN

// The toolkit's permissions leave in force what the folder above grants to everybody.
bool makeFolder(const QString &folder) {
    return OwnerAccess::makeFolder(QDir::toNativeSeparators(folder).toStdWString());
}

bool makeFile(const QString &path) {
    return OwnerAccess::makeFile(QDir::toNativeSeparators(path).toStdWString());
}

#else

constexpr QFileDevice::Permissions ownerFile = QFileDevice::ReadOwner | QFileDevice::WriteOwner;

bool makeFolder(const QString &folder) {
    return QDir().mkdir(folder, ownerFile | QFileDevice::ExeOwner);
}

bool makeFile(const QString &path) {
    return QFile(path).open(QIODevice::NewOnly | QIODevice::WriteOnly, ownerFile);
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

} // namespace PrivateFiles
