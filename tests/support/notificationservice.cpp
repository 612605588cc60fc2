#include "notificationservice.h"

namespace {

const QString connectionName = QStringLiteral("notificationservice");
const QString serviceName = QStringLiteral("org.freedesktop.Notifications");
constexpr uint closedByCall = 3;

} // namespace

bool NotificationService::appear() {
    QDBusConnection connection = QDBusConnection::connectToBus(QDBusConnection::SessionBus, connectionName);
    return connection.registerObject(QStringLiteral("/org/freedesktop/Notifications"), this,
                                     QDBusConnection::ExportAllSlots | QDBusConnection::ExportAllSignals) &&
           connection.registerService(serviceName);
}

void NotificationService::vanish() {
    QDBusConnection::disconnectFromBus(connectionName);
}

void NotificationService::record(const QString &method) {
    calls += method;
    if (method == failing)
        sendErrorReply(QDBusError::Failed, QStringLiteral("told to fail"));
}

QStringList NotificationService::GetCapabilities() {
    record(QStringLiteral("GetCapabilities"));
    return capabilities;
}

uint NotificationService::Notify(const QString &applicationName, uint replaced, const QString &icon,
                                 const QString &summary, const QString &body, const QStringList &actions,
                                 const QVariantMap &hints, int timeout) {
    record(QStringLiteral("Notify"));
    const uint id = replaced ? replaced : ++m_lastId;
    notifications.push_back({applicationName, replaced, icon, summary, body, actions, hints, timeout, id});
    return id;
}

void NotificationService::CloseNotification(uint id) {
    record(QStringLiteral("CloseNotification"));
    emit NotificationClosed(id, closedByCall);
}

QString NotificationService::GetServerInformation(QString &vendor, QString &version, QString &specVersion) {
    record(QStringLiteral("GetServerInformation"));
    vendor = version = QStringLiteral("tests");
    specVersion = QStringLiteral("1.2");
    return QStringLiteral("notificationservice");
}
