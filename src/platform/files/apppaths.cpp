#include "platform/files/apppaths.h"

#include <QCryptographicHash>
#include <QDir>
#include <QStandardPaths>

namespace AppPaths {

QString root() {
    return qEnvironmentVariable("NVLDM_ROOT");
}

QString clientStoreFolder() {
    if (const QString folder = root(); !folder.isEmpty())
        return folder;
#ifdef Q_OS_WIN
    return QStringLiteral("C:/ProgramData/Norvell Inc/Device Manager");
#else
    return QStandardPaths::writableLocation(QStandardPaths::GenericDataLocation) +
           QStringLiteral("/Norvell Inc/Device Manager");
#endif
}

QString keyFile() {
    return clientStoreFolder() + QStringLiteral("/nvlcrypto.key");
}

QString serviceStoreFile() {
    if (const QString folder = root(); !folder.isEmpty())
        return folder + QStringLiteral("/nvldmsvc.sdb");
#ifdef Q_OS_WIN
    return QStringLiteral("C:\\Windows\\System32\\nvldmsvc.sdb");
#else
    return QStringLiteral("/var/lib/nvldm/nvldmsvc.sdb");
#endif
}

QString serviceStateFile() {
    return root() + QStringLiteral("/nvldm.state");
}

QString logFolder() {
    if (const QString folder = root(); !folder.isEmpty())
        return folder + QStringLiteral("/Logs");
    return QStandardPaths::writableLocation(QStandardPaths::AppDataLocation) + QStringLiteral("/Logs");
}

QString instanceKey() {
    QString key = QStringLiteral("NorvellDeviceManager");
    if (const QString folder = root(); !folder.isEmpty()) {
        const QByteArray canonical = QDir(folder).absolutePath().toUtf8();
        const QByteArray hash = QCryptographicHash::hash(canonical, QCryptographicHash::Sha256).toHex();
        key += QLatin1Char('-') + QString::fromLatin1(hash.first(16));
    }
    return key;
}

} // namespace AppPaths
