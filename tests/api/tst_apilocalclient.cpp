#include "api/client/apilocalclient.h"
#include "store/configstore.h"
#include "store/localstore.h"
#include "support/emulatorprocess.h"
#include "support/isolatedroot.h"
#include "support/logcapture.h"
#include "support/scriptedpeer.h"
#include "support/testmain.h"
#include "testsession.h"

#include <QTest>

class TestApiLocalClient : public QObject {
    Q_OBJECT

private slots:
    void whatIsSent();
    void codes_data();
    void codes();
    void preconditions();
    void accountsOfAService();

private:
    IsolatedRoot m_root;
    ScriptedPeer m_peer;
};

void TestApiLocalClient::whatIsSent() {
    const LogCapture log;
    m_peer.answer(ScriptedPeer::json({{"code", 0}, {"data", TestSession::sealed(R"({"total_items":0})")}}));
    CApiLocalClient client(m_peer.port());
    client.setAccount(TestSession::account);
    QVERIFY(client.setAccessToken(Ciphers::sealSecret(TestSession::token).value_or("").c_str()));
    JSON members;
    QCOMPARE(client.memberList(0, 10, members), unsigned(ApiOk));
    QCOMPARE(members.dump(), R"({"total_items":0})");
    QCOMPARE(client.newMember("a@x", "Passw0rd!", nullptr, "admin", nullptr), unsigned(ApiOk));
    QCOMPARE(client.reviseMemberPassword("a@x", "old", "new"), unsigned(ApiOk));

    const std::vector<ScriptedPeer::Request> requests = m_peer.takeRequests();
    QCOMPARE(requests.size(), std::size_t(3));
    for (const ScriptedPeer::Request &request : requests)
        QVERIFY2(request.header("authorization").starts_with("G1:"), "never the session's token");
    QCOMPARE(requests[0].path, "/v1/accm/list");
    QCOMPARE(requests[0].body, R"({"count":10,"start":0})");
    QCOMPARE(requests[1].path, "/v1/accm/new");
    JSON made = requests[1].json();
    QCOMPARE(Ciphers::openSecret(made.value("pass", "")).value_or(""), "Passw0rd!");
    made.erase("pass");
    QCOMPARE(made.dump(), R"({"desp":"","email":"a@x","name":"","permi":"admin"})");
    QCOMPARE(requests[2].path, "/v1/accm/revpas");
    const JSON revised = requests[2].json();
    QCOMPARE(revised.size(), std::size_t(3));
    QCOMPARE(revised.value("email", ""), "a@x");
    QCOMPARE(Ciphers::openSecret(revised.value("old", "")).value_or(""), "old");
    QCOMPARE(Ciphers::openSecret(revised.value("new", "")).value_or(""), "new");
}

void TestApiLocalClient::codes_data() {
    QTest::addColumn<int>("code");
    QTest::addColumn<unsigned>("list");
    QTest::addColumn<unsigned>("create");
    QTest::addColumn<unsigned>("revise");
    QTest::newRow("ok, no data") << 0 << 14u << 0u << 0u;
    QTest::newRow("e-mail taken") << 107 << 15u << 1003u << 15u;
    QTest::newRow("wrong password") << 106 << 15u << 15u << 15u;
    QTest::newRow("no session to be lost here") << 105 << 15u << 15u << 15u;
    QTest::newRow("no session limit here") << 108 << 15u << 15u << 15u;
}

void TestApiLocalClient::codes() {
    QFETCH(int, code);
    QFETCH(unsigned, list);
    QFETCH(unsigned, create);
    QFETCH(unsigned, revise);
    const LogCapture log;
    m_peer.answer(ScriptedPeer::json({{"code", code}}));
    JSON members;
    QCOMPARE(CApiLocalClient(m_peer.port()).memberList(0, 10, members), list);
    QCOMPARE(CApiLocalClient(m_peer.port()).newMember("a@x", "p", "n", "admin", "d"), create);
    QCOMPARE(CApiLocalClient(m_peer.port()).reviseMemberPassword("a@x", "old", "new"), revise);
    m_peer.takeRequests();
}

void TestApiLocalClient::preconditions() {
    const LogCapture log;
    CApiLocalClient client(m_peer.port());
    QCOMPARE(client.newMember(nullptr, "p", "n", "admin", "d"), unsigned(ApiInvalidArgument));
    QCOMPARE(client.newMember("a@x", nullptr, "n", "admin", "d"), unsigned(ApiInvalidArgument));
    QCOMPARE(client.reviseMemberPassword(nullptr, "old", "new"), unsigned(ApiInvalidArgument));
    QCOMPARE(client.reviseMemberPassword("a@x", nullptr, "new"), unsigned(ApiInvalidArgument));
    QCOMPARE(client.reviseMemberPassword("a@x", "old", nullptr), unsigned(ApiInvalidArgument));
    QCOMPARE(client.reviseMemberPassword("a@x", "", "new"), unsigned(ApiCipherFailure));
    QCOMPARE(client.reviseMemberPassword("a@x", "old", ""), unsigned(ApiCipherFailure));
    QVERIFY(m_peer.takeRequests().empty());
}

void TestApiLocalClient::accountsOfAService() {
    const LogCapture log;
    EmulatorProcess emulator(m_root.path());
    QVERIFY(emulator.start());
    const quint32 port = CConfigStore().serverPort();
    QCOMPARE(port, emulator.port());
    const auto client = [port] { return CApiLocalClient(port); };
    JSON members;
    QCOMPARE(client().memberList(0, 10, members), unsigned(ApiOk));
    QCOMPARE(members.at("total_items").get<int>(), 1);
    QCOMPARE(members.at("data").at(0).value("email", ""), "admin");

    const char *email = "first@example.com";
    QCOMPARE(client().newMember(email, "Passw0rd!", "Zoë", "admin", nullptr), unsigned(ApiOk));
    QCOMPARE(client().newMember(email, "Other0ne!", "Zoë", "admin", nullptr), unsigned(ApiEmailTaken));
    QCOMPARE(client().memberList(0, 10, members), unsigned(ApiOk));
    QCOMPARE(members.at("data").size(), std::size_t(1));
    QCOMPARE(members.at("data").at(0).value("email", ""), email);
    QCOMPARE(members.at("data").at(0).value("name", ""), "Zoë");

    QCOMPARE(client().reviseMemberPassword(email, "wrong", "N3w-one!"), unsigned(ApiServerError));
    QCOMPARE(client().loginServer(email, "Passw0rd!"), unsigned(ApiOk));
    QCOMPARE(client().reviseMemberPassword(email, "Passw0rd!", "N3w-one!"), unsigned(ApiOk));
    QCOMPARE(client().loginServer(email, "Passw0rd!"), unsigned(ApiCode105));
    QCOMPARE(client().loginServer(email, "N3w-one!"), unsigned(ApiOk));
    QVERIFY(emulator.stop());
    QCOMPARE(client().memberList(0, 10, members), unsigned(ApiTransportError));
}

NVLDM_GUILESS_TEST(TestApiLocalClient)
#include "tst_apilocalclient.moc"
