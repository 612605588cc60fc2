#pragma once

#include <QDBusConnection>
#include <QDBusContext>
#include <QObject>
#include <QVariantMap>

#include <vector>

/// The desktop's notification service, as a program of its own would be it on the session bus.
class NotificationService : public QObject, protected QDBusContext {
    Q_OBJECT
    Q_CLASSINFO("D-Bus Interface", "org.freedesktop.Notifications")

public:
    struct Notification {
        QString applicationName;
        uint replaced;
        QString icon, summary, body;
        QStringList actions;
        QVariantMap hints;
        int timeout;
        uint id;
    };

    ~NotificationService() override { vanish(); }

    /// Takes the service's name; false when somebody has it.
    bool appear();
    /// Leaves the bus as a crash would.
    void vanish();

    void invokeAction(uint id, const QString &key) { emit ActionInvoked(id, key); }
    void closeNotification(uint id, uint reason) { emit NotificationClosed(id, reason); }

    QStringList capabilities = {"body", "body-markup", "actions"};
    QString failing;   ///< the method that answers with an error
    QStringList calls; ///< names of methods
    std::vector<Notification> notifications;

public slots:
    QStringList GetCapabilities();
    uint Notify(const QString &applicationName, uint replaced, const QString &icon, const QString &summary,
                const QString &body, const QStringList &actions, const QVariantMap &hints, int timeout);
    void CloseNotification(uint id);
    QString GetServerInformation(QString &vendor, QString &version, QString &specVersion);

signals:
    void ActionInvoked(uint id, const QString &key);
    void NotificationClosed(uint id, uint reason);

private:
    void record(const QString &method);

    uint m_lastId = 0;
};
