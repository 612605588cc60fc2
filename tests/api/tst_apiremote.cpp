#include "api/client/orbservicestatus.h"
#include "api/session/servicesession.h"
#include "platform/crypto/ciphers.h"
#include "store/localstore.h"
#include "support/emulatorprocess.h"
#include "support/isolatedroot.h"
#include "support/logcapture.h"
#include "support/scriptedpeer.h"
#include "support/testmain.h"
#include "testsession.h"

#include <QTest>

using TestSession::client;
using TestSession::sealed;

namespace {

constexpr const char *password = "Passw0rd!";
constexpr const char *partner = "partner@norvell.example";
constexpr const char *partnerPassword = "Partner-1";

} // namespace

/// The calls about the remote-access service, against a scripted peer and against the emulator.
class TestApiRemote : public QObject {
    Q_OBJECT

private slots:
    void outputs_data();
    void outputs();
    void failuresAreLogged();
    void theWayThroughASignIn();
    void onlyAdministratorsChangeTheLink();
    void whoseSessionCode105Ends_data();
    void whoseSessionCode105Ends();

private:
    void logIn(const char *account);
    unsigned call(const std::function<unsigned(CApiClient &)> &endpoint) {
        return ServiceSession(CLocalStore::instance().loginInfo()).call(endpoint);
    }
    unsigned signIn(const char *email, const char *secret) {
        return call([=](CApiClient &c) { return c.authenticateWithOrb(email, secret); });
    }
    unsigned add(const char *organization, const char *site) {
        return call([=](CApiClient &c) { return c.addService(organization, site); });
    }
    unsigned browse(JSON &organizations) {
        return call([&](CApiClient &c) { return c.browseOrbOrgs(organizations); });
    }

    IsolatedRoot m_root;
    ScriptedPeer m_peer;
    EmulatorProcess m_service{m_root.path()};
};

void TestApiRemote::outputs_data() {
    QTest::addColumn<QString>("data");
    QTest::addColumn<unsigned>("added");
    QTest::addColumn<unsigned>("toggled");
    QTest::addColumn<unsigned>("status");
    QTest::newRow("all there") << R"({"is_orb_service_added":true,"enable":true,"connected":true,
        "machineUUID":"u","deviceId":"d","remoteAccess":{"enable":true}})"
                               << 0u << 0u << 0u;
    QTest::newRow("no members") << "{}" << 14u << 14u << 14u;
    QTest::newRow("wrong types") << R"({"is_orb_service_added":"true","enable":1,"connected":1,
        "machineUUID":7,"deviceId":null,"remoteAccess":true})"
                                 << 14u << 14u << 14u;
    QTest::newRow("switch of another type") << R"({"remoteAccess":{"enable":"on"}})" << 14u << 14u << 14u;
    QTest::newRow("no object") << "[true]" << 14u << 14u << 14u;
}

void TestApiRemote::outputs() {
    QFETCH(QString, data);
    QFETCH(unsigned, added);
    QFETCH(unsigned, toggled);
    QFETCH(unsigned, status);
    const LogCapture log;
    m_peer.answer(ScriptedPeer::json({{"code", 0}, {"data", sealed(data.toStdString())}}));
    bool isAdded = false;
    bool state = false;
    OrbServiceStatus read;
    QCOMPARE(client(m_peer.port())->isOrbServiceAdded(isAdded), added);
    QCOMPARE(client(m_peer.port())->toggleRemoteAccess(true, state), toggled);
    QCOMPARE(client(m_peer.port())->getOrbServiceCachedStatus(read), status);
    const bool whole = added == ApiOk;
    QCOMPARE(isAdded, whole);
    QCOMPARE(state, whole);
    QCOMPARE(read.connected && read.remoteAccess, whole);
    QCOMPARE(read.machineUuid + read.deviceId, whole ? "ud" : "");
    m_peer.answer(ScriptedPeer::json({{"code", 0}}));
    QCOMPARE(client(m_peer.port())->isOrbServiceAdded(isAdded), unsigned(ApiMissingData));
    // The new state of the switch may come in three forms.
    for (const char *form : {"true", R"({"enable":true})", R"({"remoteAccess":{"enable":true}})"}) {
        state = false;
        m_peer.answer(ScriptedPeer::json({{"code", 0}, {"data", sealed(form)}}));
        QCOMPARE(client(m_peer.port())->toggleRemoteAccess(true, state), unsigned(ApiOk));
        QVERIFY2(state, form);
    }
}

void TestApiRemote::failuresAreLogged() {
    const LogCapture log;
    m_peer.answer({{}, ScriptedPeer::End::Reset});
    QCOMPARE(client(m_peer.port())->disconnectOrbService(), unsigned(ApiTransportError));
    QCOMPARE(log.count("Encountered HTTP request error when CApiClient::disconnectOrbService: "), 1);
    m_peer.answer({ScriptedPeer::http(200, "<html>")});
    QCOMPARE(client(m_peer.port())->addService("ORG1", "S1"), unsigned(ApiException));
    QCOMPARE(log.count("Encountered unexpected error when CApiClient::addService: "), 1);
}

void TestApiRemote::logIn(const char *account) {
    CApiClient opened("127.0.0.1", m_service.port());
    QCOMPARE(opened.loginServer(account, password), unsigned(ApiOk));
    CLocalStore &store = CLocalStore::instance();
    store.setLoginInfo("127.0.0.1", m_service.port(), account, store.access());
}

void TestApiRemote::theWayThroughASignIn() {
    const LogCapture log;
    QVERIFY(m_service.start({"--fresh", "--account", QStringLiteral("boss@x:%1").arg(password)}));
    logIn("boss@x");
    JSON organizations;
    QCOMPARE(browse(organizations), unsigned(ApiCode105));
    QCOMPARE(signIn(partner, "wrong"), unsigned(ApiCode105));
    QCOMPARE(signIn("expired@norvell.example", partnerPassword), unsigned(ApiCode108));
    QCOMPARE(signIn("nobody@norvell.example", partnerPassword), unsigned(ApiServerError));
    QCOMPARE(browse(organizations), unsigned(ApiCode105));
    QCOMPARE(signIn(partner, partnerPassword), unsigned(ApiOk));
    QCOMPARE(browse(organizations), unsigned(ApiOk));
    QCOMPARE(organizations.at(1).value("enableRemoteAccess", true), false);
    const std::string site = organizations.at(1).at("sites").at(0).value("id", "");

    QCOMPARE(add("ORG9", site.c_str()), unsigned(ApiServerError));
    QCOMPARE(m_service.command("orb expire"), QStringLiteral("ok"));
    QCOMPARE(add("ORG2", site.c_str()), unsigned(ApiCode105));
    QCOMPARE(signIn(partner, partnerPassword), unsigned(ApiOk));
    QCOMPARE(add("ORG2", site.c_str()), unsigned(ApiOk));
    bool state = false;
    const auto toggle = [&](bool on) {
        return call([&](CApiClient &c) { return c.toggleRemoteAccess(on, state); });
    };
    QCOMPARE(toggle(true), unsigned(ApiServerError));

    // The link outlives the service's process.
    QVERIFY(m_service.stop());
    QVERIFY(m_service.start());
    OrbServiceStatus status;
    QCOMPARE(call([&](CApiClient &c) { return c.getOrbServiceCachedStatus(status); }), unsigned(ApiOk));
    QVERIFY(status.connected && !status.remoteAccess && !status.machineUuid.empty());
    QCOMPARE(call([](CApiClient &c) { return c.disconnectOrbService(); }), unsigned(ApiOk));
    bool added = true;
    QCOMPARE(call([&](CApiClient &c) { return c.isOrbServiceAdded(added); }), unsigned(ApiOk));
    QVERIFY(!added);
    QCOMPARE(call([](CApiClient &c) { return c.disconnectOrbService(); }), unsigned(ApiServerError));
    m_service.kill();
}

void TestApiRemote::onlyAdministratorsChangeTheLink() {
    const LogCapture log;
    QVERIFY(m_service.start({"--fresh", "--account", QStringLiteral("boss@x:%1").arg(password), "--account",
                             QStringLiteral("op@x:%1:operator").arg(password)}));
    logIn("op@x");
    bool flag = true;
    QCOMPARE(signIn(partner, partnerPassword), unsigned(ApiServerError));
    QCOMPARE(call([&](CApiClient &c) { return c.isOrbServiceAdded(flag); }), unsigned(ApiOk));
    QCOMPARE(m_service.command("permission op@x admin"), QStringLiteral("ok"));
    QCOMPARE(signIn(partner, partnerPassword), unsigned(ApiOk));
    QCOMPARE(m_service.command("permission op@x viewer"), QStringLiteral("ok"));
    QCOMPARE(m_service.command("permission boss@x viewer"),
             QStringLiteral("error an administrator has to remain"));
    m_service.kill();
}

void TestApiRemote::whoseSessionCode105Ends_data() {
    QTest::addColumn<int>("probe");
    QTest::addColumn<bool>("lost");
    QTest::newRow("the sign-in's") << 0 << false;
    QTest::newRow("this client's") << 105 << true;
}

void TestApiRemote::whoseSessionCode105Ends() {
    QFETCH(int, probe);
    QFETCH(bool, lost);
    const LogCapture log;
    m_peer.takeRequests();
    m_peer.follow([probe](const ScriptedPeer::Request &request) {
        const bool isSignIn = request.path == "/v1/orb/login";
        return ScriptedPeer::json(
            {{"code", isSignIn ? 105 : probe}, {"data", sealed(R"({"is_orb_service_added":false})")}});
    });
    CLocalStore::instance().setLoginInfo(
        "127.0.0.1", m_peer.port(), TestSession::account,
        QByteArray::fromStdString(Ciphers::sealSecret(TestSession::token).value_or("")));
    ServiceSession session(CLocalStore::instance().loginInfo());
    QCOMPARE(session.callWithSignIn([](CApiClient &c) { return c.authenticateWithOrb("a@x", "p"); }),
             unsigned(ApiCode105));
    QCOMPARE(session.isLost(), lost);
    QCOMPARE(m_peer.takeRequests().size(), std::size_t(2));
}

NVLDM_GUILESS_TEST(TestApiRemote)
#include "tst_apiremote.moc"
