#pragma once

#include "api/session/nettask.h"
#include "api/session/servicesession.h"
#include "emulatorprocess.h"
#include "isolatedroot.h"
#include "store/localstore.h"

#include <QTest>

#include <functional>

/// An emulator with an account, and the client's session on it. For tests that link the service client.
class SignedInService {
public:
    static constexpr const char *account = "admin@norvell.example";
    static constexpr const char *password = "Passw0rd!";

    /// A fresh service with the arguments of the emulator, and a session on it.
    void start(const QStringList &arguments) {
        restart(arguments + QStringList{"--fresh"});
        logIn();
    }

    /// With the fleet and the sessions that it had.
    void restart(const QStringList &arguments) {
        QVERIFY(m_service.start(QStringList{"--account", QString::fromLatin1(account) + u':' + password} +
                                arguments));
    }

    void logIn() {
        unsigned result = ApiException;
        NetTask::runAndWait(
            [&] { result = CApiClient("127.0.0.1", m_service.port()).loginServer(account, password); });
        QCOMPARE(result, unsigned(ApiOk));
        CLocalStore &store = CLocalStore::instance();
        store.setLoginInfo("127.0.0.1", m_service.port(), account, store.access());
    }

    /// A call that has to succeed.
    static void call(const std::function<unsigned(CApiClient &)> &endpoint) {
        unsigned result = ApiException;
        NetTask::runAndWait(
            [&] { result = ServiceSession(CLocalStore::instance().loginInfo()).call(endpoint); });
        QCOMPARE(result, unsigned(ApiOk));
    }

    /// A control command that has to succeed.
    void tell(const QString &command) {
        const QString answer = m_service.command(command);
        QVERIFY2(answer.startsWith("ok"), qPrintable(answer));
    }

    EmulatorProcess &process() { return m_service; }
    const IsolatedRoot &root() const { return m_root; }

private:
    IsolatedRoot m_root;
    EmulatorProcess m_service{m_root.path()};
};
