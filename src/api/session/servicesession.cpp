#include "api/session/servicesession.h"

#include "api/session/sessionevents.h"
#include "platform/log/messagelog.h"

#include <QDebug>

#include <mutex>

namespace {

/// The requests of the latest session that made any.
class LatestRequests {
public:
    static LatestRequests &instance() {
        static LatestRequests latest;
        return latest;
    }

    /// A later session than the one before ends that one's requests; an earlier one has none any more.
    RequestGroup of(quint64 generation) {
        const std::lock_guard lock(m_mutex);
        if (generation == m_generation)
            return m_group;
        if (generation > m_generation) {
            m_group.cut();
            m_generation = generation;
            m_group = RequestGroup();
            return m_group;
        }
        const RequestGroup ended;
        ended.cut();
        return ended;
    }

private:
    std::mutex m_mutex;
    quint64 m_generation = 0;
    RequestGroup m_group;
};

} // namespace

ServiceSession::ServiceSession(LoginInfo login) : m_login(std::move(login)) {}

bool ServiceSession::isPresent() const {
    return CLocalStore::instance().loginInfo().generation == m_login.generation;
}

unsigned ServiceSession::call(const std::function<unsigned(CApiClient &)> &endpoint) {
    unsigned result = send(endpoint);
    // Only that token was refused when there is another one; its refusal was the answer, so nothing is done
    // twice.
    while (result == ApiCode105 && CLocalStore::instance().replaceRefused(m_carried, m_login.generation))
        result = send(endpoint);
    if (result == ApiCode105)
        m_lost = true;
    return result;
}

unsigned ServiceSession::callWithSignIn(const std::function<unsigned(CApiClient &)> &endpoint) {
    const unsigned result = send(endpoint);
    if (result != ApiCode105)
        return result;
    const QByteArray carried = m_carried;
    bool added = false;
    call([&](CApiClient &client) { return client.isOrbServiceAdded(added); });
    // It was the token that was refused, and the question has found a better one.
    return m_lost || m_carried == carried ? result : send(endpoint);
}

RequestGroup ServiceSession::requests() const {
    return LatestRequests::instance().of(m_login.generation);
}

void ServiceSession::end() {
    CLocalStore &store = CLocalStore::instance();
    store.clearLoginInfo();
    // To be logged off is a generation of its own.
    LatestRequests::instance().of(store.loginInfo().generation);
}

void ServiceSession::log(const LoginInfo &login) {
    qDebug("login info ip: %s, port: %d, account: %s, token: %s", qUtf8Printable(login.address),
           static_cast<int>(login.port), qUtf8Printable(login.account),
           MessageLog::secret(login.token).constData());
}

unsigned ServiceSession::send(const std::function<unsigned(CApiClient &)> &endpoint) {
    m_unanswered = false;
    const LoginInfo present = CLocalStore::instance().loginInfo();
    if (present.generation != m_login.generation)
        return ApiInvalidArgument;
    log(present);
    m_carried = present.token;
    CApiClient client(present.address.toUtf8().constData(), present.port);
    client.setAccount(present.account.toUtf8().constData());
    client.setAccessToken(present.token.constData());
    client.expectServerKey(present.serverKey);
    const std::string before = client.accessToken();
    const RequestGroup::Scope scope(requests());
    const unsigned result = endpoint(client);
    if (result == ApiKeyChanged)
        SessionEvents::instance().reportKeyChanged(m_login.generation, client.serverKey());
    m_unanswered = result != ApiOk && client.isUnanswered();
    if (client.accessToken() != before)
        CLocalStore::instance().renewAccess(QByteArray::fromStdString(client.accessToken()), m_carried,
                                            m_login.generation);
    return result;
}
