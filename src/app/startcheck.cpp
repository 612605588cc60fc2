#include "startcheck.h"

#include "apilocalclient.h"
#include "clientstore.h"
#include "configstore.h"
#include "localstore.h"
#include "netjob.h"

#include <QDebug>

#include <nlohmann/json.hpp>

namespace {

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

StartCheck::StartCheck(QObject *parent) : QObject(parent), m_runner(new NetTask) {}

void StartCheck::start() {
    if (!CLocalStore::instance().isLocalServiceInstalled()) {
        emit loginNeeded(
            tr("Norvell Device Manager Service Control is not installed on this computer. Please "
               "connect to a remote server."));
        return;
    }
    const QString silent =
        tr("Norvell Device Manager Service Control is not running on this computer. Please "
           "check the status of local server or connect to a remote server.");
    NetJob::post(
        m_runner.get(), this, askLocalService,
        [this, silent](const LocalService &service) {
            if (service.state == LocalService::State::Fresh)
                emit accountSetupNeeded();
            else if (service.state == LocalService::State::OtherKey)
                emit keyChanged(QString::fromStdString(service.key));
            else
                emit loginNeeded(service.state == LocalService::State::Silent ? silent : QString());
        },
        [this, silent](JobEnd end) {
            if (end != JobEnd::Delivered)
                emit loginNeeded(silent);
        });
}
