#pragma once

#include "platform/toast/toast.h"

#include <QDBusConnection>
#include <QVariantList>

#include <deque>
#include <map>
#include <optional>

class QDBusPendingCall;

/// Toasts of the desktop's notification service, by way of the session bus. One call is under way at a time,
/// the other toasts queue: so the number of the toast that is to be replaced is always known.
class DBusToasts : public ToastPresenter {
    Q_OBJECT

public:
    ~DBusToasts() override { QDBusConnection::disconnectFromBus(m_connection.name()); }
    bool initialize(const QString &applicationName, const QString &applicationUserModelId) override;
    void showToast(const Toast &toast, std::unique_ptr<ToastHandler> handler) override;

private slots:
    void actionInvoked(uint number, const QString &key);
    void notificationClosed(uint number);
    /// Nobody is left who would tell about the open toasts.
    void failOpenToasts();

private:
    struct Entry {
        Toast toast;
        std::unique_ptr<ToastHandler> handler; ///< none once it was told of a click
    };
    using Answer = void (DBusToasts::*)(const QDBusPendingCall &);

    void listen();
    void changeOwner(const QString &oldOwner, const QString &newOwner);
    void call(const QString &method, const QVariantList &arguments, Answer answer);
    void callNext();
    void askCapabilities() { call(QStringLiteral("GetCapabilities"), {}, &DBusToasts::takeCapabilities); }
    void takeCapabilities(const QDBusPendingCall &call);
    bool can(const QString &capability) const {
        return m_capabilities && m_capabilities->contains(capability);
    }
    QVariantList notifyArguments(const Toast &toast) const;
    QStringList actionsOf(const Toast &toast) const;
    uint openNumber(const QString &subject) const;
    void takeNumber(const QDBusPendingCall &call);

    QDBusConnection m_connection{QString()};
    QString m_applicationName;
    std::optional<QStringList> m_capabilities; ///< none while the service has not told them
    bool m_hasAnswered = false;
    bool m_isCalling = false;
    std::deque<Entry> m_waiting;
    Entry m_sending;
    std::map<uint, Entry> m_open; ///< by the service's number
};
