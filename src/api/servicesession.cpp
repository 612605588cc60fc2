#include "servicesession.h"

#include "messagelog.h"

#include <QDebug>

ServiceSession::ServiceSession(LoginInfo login) : m_login(std::move(login)) {}

bool ServiceSession::isPresent() const {
    return CLocalStore::instance().loginInfo().generation == m_login.generation;
}

unsigned ServiceSession::call(const std::function<unsigned(CApiClient &)> &endpoint) {
    const unsigned result = send(endpoint);
    if (result == ApiCode105)
        m_lost = true;
    return result;
}

unsigned ServiceSession::callWithSignIn(const std::function<unsigned(CApiClient &)> &endpoint) {
    const unsigned result = send(endpoint);
    bool added = false;
    if (result == ApiCode105)
        call([&](CApiClient &client) { return client.isOrbServiceAdded(added); });
    return result;
}

unsigned ServiceSession::send(const std::function<unsigned(CApiClient &)> &endpoint) {
    const LoginInfo present = CLocalStore::instance().loginInfo();
    if (present.generation != m_login.generation)
        return ApiInvalidArgument;
    qDebug("login info ip: %s, port: %d, account: %s, token: %s", qUtf8Printable(present.address),
           static_cast<int>(present.port), qUtf8Printable(present.account),
           MessageLog::secret(present.token).constData());
    CApiClient client(present.address.toUtf8().constData(), present.port);
    client.setAccount(present.account.toUtf8().constData());
    client.setAccessToken(present.token.constData());
    const std::string before = client.accessToken();
    const unsigned result = endpoint(client);
    if (client.accessToken() != before)
        CLocalStore::instance().renewAccess(QByteArray::fromStdString(client.accessToken()),
                                            m_login.generation);
    return result;
}
