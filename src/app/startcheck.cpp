#include "app/startcheck.h"

#include "api/client/apilocalclient.h"
#include "api/session/netjob.h"
#include "store/clientstore.h"
#include "store/configstore.h"
#include "store/localstore.h"

#include <QDebug>

#include <nlohmann/json.hpp>

#include <string>

namespace {

/// Somebody looks at the welcome page meanwhile.
constexpr std::chrono::seconds memberListTime{10};

struct LocalService {
    enum class State { Silent, Fresh, HasAccounts, OtherKey };
    State state = State::Silent;
    std::string key; ///< fingerprint, where it is another one
};

/// True for the one account that a service comes with.
bool isFactoryAccount(const JSON &members) {
    const auto list = members.is_object() ? members.find("data") : members.end();
    if (list == members.end() || !list->is_array() || list->size() != 1 || !list->front().is_object())
        return false;
    if (!list->front().contains("email") || !list->front()["email"].is_string())
        return false;
    const std::string_view email = textMember(list->front(), "email");
    return email.empty() || email == "admin";
}

LocalService askLocalService() {
    // The dialogs read this store; making its files takes longer than a window may stand still.
    CClientStore::instance();
    const quint32 port = CConfigStore().serverPort();
    qDebug("get local server port: %d", static_cast<int>(port));
    std::uint32_t online = 0;
    CApiLocalClient client(port);
    if (client.isServerOnline(online) == ApiKeyChanged)
        return {LocalService::State::OtherKey, client.serverKey()};
    if (!online) {
        qDebug("HTTP API(isServerOnline) failed!");
        return {};
    }
    qDebug("Local server online!");
    JSON members;
    client.setTotalTimeout(memberListTime);
    const unsigned result = client.memberList(0, 10, members);
    if (result == ApiKeyChanged)
        return {LocalService::State::OtherKey, client.serverKey()};
    if (result != ApiOk)
        qDebug("HTTP API(memberList) failed!");
    const auto list = members.is_object() ? members.find("data") : members.end();
    const std::size_t size = list != members.end() && list->is_array() ? list->size() : 0;
    qDebug("member list: %s, size: %d", dumpJson(members).c_str(), static_cast<int>(size));
    return {isFactoryAccount(members) ? LocalService::State::Fresh : LocalService::State::HasAccounts, {}};
}

} // namespace

StartCheck::StartCheck(QObject *parent) : QObject(parent) {}

void StartCheck::start() {
    if (m_running)
        return;
    if (CLocalStore::instance().isLocalServiceInstalled())
        return askService();
    emit loginNeeded(tr("Norvell Device Manager Service Control is not installed on this computer. Please "
                        "connect to a remote server."));
}

void StartCheck::abandon() {
    m_requests.cut();
    setRunning(false);
}

void StartCheck::setRunning(bool running) {
    if (m_running == running)
        return;
    m_running = running;
    emit runningChanged(running);
}

void StartCheck::askService() {
    m_requests = RequestGroup();
    setRunning(true);
    const QString silent =
        tr("Norvell Device Manager Service Control is not running on this computer. Please "
           "check the status of local server or connect to a remote server.");
    const bool started = NetJob::post(
        NetJob::createRunner("checkLoginDialog in FramelessWindow", NetTask::Turn::Beside), this,
        [requests = m_requests] {
            const RequestGroup::Scope scope(requests);
            return askLocalService();
        },
        [this, silent, requests = m_requests](const LocalService &service) {
            if (requests.isCut())
                return;
            setRunning(false);
            if (service.state == LocalService::State::Fresh)
                emit accountSetupNeeded();
            else if (service.state == LocalService::State::OtherKey)
                emit keyChanged(QString::fromStdString(service.key));
            else
                emit loginNeeded(service.state == LocalService::State::Silent ? silent : QString());
        },
        [this, requests = m_requests](JobOutcome end) {
            if (end != JobOutcome::Delivered && !requests.isCut())
                emitUnchecked();
        });
    if (!started)
        emitUnchecked();
}

/// Nothing is known of the service then, so nothing is said of it.
void StartCheck::emitUnchecked() {
    setRunning(false);
    emit loginNeeded({});
}
