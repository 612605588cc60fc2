#include "platform/toast/dbustoasts.h"

#include "platform/toast/toasttext.h"

#include <QDBusMessage>
#include <QDBusPendingCallWatcher>
#include <QDBusPendingReply>
#include <QDBusServiceWatcher>

#include <utility>

namespace {

const QString service = QStringLiteral("org.freedesktop.Notifications");
const QString path = QStringLiteral("/org/freedesktop/Notifications");
const QString programId = QStringLiteral("norvell-device-manager");
const QString bodyAction = QStringLiteral("default");
constexpr uchar normalUrgency = 1;
constexpr int timeOfTheService = -1;
constexpr int answerMilliseconds = 5000;
constexpr std::size_t maxPending = 64;
/// Some services never tell that a toast has gone.
constexpr std::size_t maxOpen = 256;

/// Left to itself, the bus library would start a bus of its own where there is none.
QString sessionBusAddress() {
    const QString address = qEnvironmentVariable("DBUS_SESSION_BUS_ADDRESS");
    return address.startsWith(u"autolaunch:") ? QString() : address;
}

void dismiss(const std::unique_ptr<ToastHandler> &handler) {
    if (handler)
        handler->toastDismissed();
}

} // namespace

std::unique_ptr<ToastPresenter> ToastPresenter::create() {
    return std::make_unique<DBusToasts>();
}

bool DBusToasts::initialize(const QString &applicationName, const QString &) {
    m_applicationName = shortApplicationName(applicationName);
    const QString address = sessionBusAddress();
    if (address.isEmpty())
        return false;
    const QString name = QStringLiteral("toasts-%1").arg(reinterpret_cast<quintptr>(this));
    m_connection = QDBusConnection::connectToBus(address, name);
    if (!m_connection.isConnected())
        return false;
    listen();
    askCapabilities();
    return true;
}

void DBusToasts::listen() {
    // The bus knows slots by their text only.
    m_connection.connect(service, path, service, QStringLiteral("ActionInvoked"), this,
                         SLOT(actionInvoked(uint, QString)));
    m_connection.connect(service, path, service, QStringLiteral("NotificationClosed"), this,
                         SLOT(notificationClosed(uint)));
    m_connection.connect({}, QStringLiteral("/org/freedesktop/DBus/Local"),
                         QStringLiteral("org.freedesktop.DBus.Local"), QStringLiteral("Disconnected"), this,
                         SLOT(failOpenToasts()));
    const auto *watcher =
        new QDBusServiceWatcher(service, m_connection, QDBusServiceWatcher::WatchForOwnerChange, this);
    connect(watcher, &QDBusServiceWatcher::serviceOwnerChanged, this,
            [this](const QString &, const QString &from, const QString &to) { changeOwner(from, to); });
}

void DBusToasts::changeOwner(const QString &oldOwner, const QString &newOwner) {
    m_capabilities.reset();
    if (!newOwner.isEmpty() && !m_isCalling)
        askCapabilities();
    if (!oldOwner.isEmpty())
        failOpenToasts();
}

void DBusToasts::failOpenToasts() {
    // Moved away first: a handler may show a toast.
    const std::map<uint, Entry> failed = std::exchange(m_open, {});
    for (const auto &[number, entry] : failed)
        if (entry.handler)
            entry.handler->toastFailed();
}

void DBusToasts::showToast(const Toast &toast, std::unique_ptr<ToastHandler> handler) {
    if (!m_connection.isConnected() || m_waiting.size() >= maxPending) {
        emit launchFailed();
        return;
    }
    m_waiting.push_back({toast, std::move(handler)});
    callNext();
}

void DBusToasts::call(const QString &method, const QVariantList &arguments, Answer answer) {
    QDBusMessage message = QDBusMessage::createMethodCall(service, path, service, method);
    message.setArguments(arguments);
    auto *watcher = new QDBusPendingCallWatcher(m_connection.asyncCall(message, answerMilliseconds), this);
    connect(watcher, &QDBusPendingCallWatcher::finished, this, [this, answer](QDBusPendingCallWatcher *call) {
        call->deleteLater();
        m_isCalling = false;
        (this->*answer)(*call);
        callNext();
    });
    m_isCalling = true;
}

void DBusToasts::callNext() {
    if (m_isCalling || m_waiting.empty())
        return;
    if (!m_capabilities)
        return askCapabilities();
    m_sending = std::move(m_waiting.front());
    m_waiting.pop_front();
    call(QStringLiteral("Notify"), notifyArguments(m_sending.toast), &DBusToasts::takeNumber);
}

void DBusToasts::takeCapabilities(const QDBusPendingCall &call) {
    const QDBusPendingReply<QStringList> reply = call;
    const bool isFirst = !std::exchange(m_hasAnswered, true);
    if (reply.isValid()) {
        m_capabilities = reply.value();
        return;
    }
    if (isFirst)
        emit incompatible();
    for (std::size_t failed = std::exchange(m_waiting, {}).size(); failed > 0; --failed)
        emit launchFailed();
}

QVariantList DBusToasts::notifyArguments(const Toast &toast) const {
    const QString text = toastLine(toast.text);
    const QString body = can(QStringLiteral("body-markup")) ? text.toHtmlEscaped() : text;
    const bool hasBody = can(QStringLiteral("body"));
    const QVariantMap hints = {{QStringLiteral("desktop-entry"), programId},
                               {QStringLiteral("urgency"), QVariant::fromValue(normalUrgency)}};
    return {
        m_applicationName,          openNumber(toast.subject), programId, hasBody ? m_applicationName : text,
        hasBody ? body : QString(), actionsOf(toast),          hints,     timeOfTheService};
}

QStringList DBusToasts::actionsOf(const Toast &toast) const {
    if (!can(QStringLiteral("actions")))
        return {};
    QStringList actions = {bodyAction, tr("Open")};
    for (qsizetype i = 0; i < toast.actions.size(); ++i)
        actions << QString::number(i) << toastLine(toast.actions[i]);
    return actions;
}

/// The toast whose place one of this subject takes; 0, as the service has it, for none.
uint DBusToasts::openNumber(const QString &subject) const {
    for (const auto &[number, entry] : m_open)
        if (!subject.isEmpty() && entry.toast.subject == subject)
            return number;
    return 0;
}

void DBusToasts::takeNumber(const QDBusPendingCall &call) {
    Entry shown = std::move(m_sending);
    const QDBusPendingReply<uint> reply = call;
    if (!reply.isValid()) {
        emit launchFailed();
        return;
    }
    // A service may have left the earlier toast where it was: it can be clicked, but is replaced no more.
    if (const auto earlier = m_open.find(openNumber(shown.toast.subject)); earlier != m_open.end())
        earlier->second.toast.subject.clear();
    const Entry replaced = std::exchange(m_open[reply.value()], std::move(shown));
    const Entry oldest =
        m_open.size() > maxOpen ? std::move(m_open.extract(m_open.begin()).mapped()) : Entry();
    dismiss(replaced.handler);
    dismiss(oldest.handler);
}

void DBusToasts::actionInvoked(uint number, const QString &key) {
    const auto open = m_open.find(number);
    if (open == m_open.end())
        return;
    bool isNumber = false;
    const int index = key.toInt(&isNumber);
    const bool isAction = isNumber && index >= 0 && index < open->second.toast.actions.size();
    if (!open->second.handler || (key != bodyAction && !isAction))
        return;
    const std::unique_ptr<ToastHandler> handler = std::move(open->second.handler);
    if (isAction)
        handler->toastActivated(index);
    else
        handler->toastActivated();
}

void DBusToasts::notificationClosed(uint number) {
    if (const auto closed = m_open.extract(number))
        dismiss(closed.mapped().handler);
}
