#include "api/client/orbservicestatus.h"
#include "support/isolatedroot.h"
#include "support/logcapture.h"
#include "support/scriptedpeer.h"
#include "support/testmain.h"
#include "testsession.h"

#include <QTest>

#include <functional>
#include <vector>

using TestSession::client;

using Call = std::function<unsigned(CApiClient &)>;
Q_DECLARE_METATYPE(Call)

namespace {

const JSON ids = {"DV000000000001", "DV000000000002"};

/// Every method of a session with a call that is sent, its path, and what it adds to the body.
struct Method {
    const char *name; ///< as it stands in the log
    Call call;
    std::string path;
    JSON members;
};

std::vector<Method> sessionMethods() {
    static JSON out;
    static std::string id;
    static bool flag;
    const JSON page = {{"start", 500}, {"count", 250}};
    return {
        {"logoutServe", [](CApiClient &c) { return c.logoutServer("any"); }, "/v1/logout", JSON::object()},
        {"addSite",
         [](CApiClient &c) { return c.addSite("Zürich", "SR1", id); },
         "/v1/site/new",
         {{"sitename", "Zürich"}, {"parentid", "SR1"}}},
        {"addSite",
         [](CApiClient &c) { return c.addSite("a", nullptr, id); },
         "/v1/site/new",
         {{"sitename", "a"}, {"parentid", "SR000000000000"}}},
        {"addSite",
         [](CApiClient &c) { return c.addSite("a", "", id); },
         "/v1/site/new",
         {{"sitename", "a"}, {"parentid", "SR000000000000"}}},
        {"updateSite",
         [](CApiClient &c) { return c.updateSite("SR1", "b\"'", "SR2"); },
         "/v1/site/update",
         {{"siteid", "SR1"}, {"sitename", "b\"'"}}},
        {"removeSite",
         [](CApiClient &c) { return c.removeSite("SR1"); },
         "/v1/site/rms",
         {{"siteid", "SR1"}}},
        {"listSites", [](CApiClient &c) { return c.listSites(500, 250, out); }, "/v1/site/list", page},
        {"commitSites",
         [](CApiClient &c) { return c.commitSites(JSON::array(), "all"); },
         "/v1/site/commit",
         {{"state", "all"}, {"sites", JSON::array()}}},
        {"listDevices", [](CApiClient &c) { return c.listDevices(500, 250, out); }, "/v1/dev/list", page},
        {"commitDevices",
         [](CApiClient &c) {
             return c.commitDevices({{{"d_ip", "1.2.3.4"}}}, "start");
         },
         "/v1/dev/commit",
         {{"state", "start"}, {"devices", {{{"d_ip", "1.2.3.4"}}}}}},
        {"commitDevices",
         [](CApiClient &c) { return c.commitDevices(JSON::array(), "update"); },
         "/v1/dev/commit",
         {{"state", "update"}, {"devices", JSON::array()}}},
        {"commitDevices",
         [](CApiClient &c) { return c.commitDevices(JSON::array(), "end"); },
         "/v1/dev/commit",
         {{"state", "end"}, {"devices", JSON::array()}}},
        {"deviceDiscovery",
         [](CApiClient &c) { return c.deviceDiscovery(5); },
         "/v1/dev/scan",
         {{"timeout", 5}}},
        {"deviceDiscoverByIP",
         [](CApiClient &c) { return c.deviceDiscoverByIP("1.2.3.4:80", 5); },
         "/v1/dev/scanip",
         {{"ip", "1.2.3.4:80"}, {"timeout", 5}}},
        {"deviceDicoverByIPs",
         [](CApiClient &c) { return c.deviceDiscoverByIPs("1.2.3.4", "1.2.3.9", 5); },
         "/v1/dev/scanips",
         {{"ip_start", "1.2.3.4"}, {"ip_end", "1.2.3.9"}, {"timeout", 5}}},
        {"discoveredDevices", [](CApiClient &c) { return c.discoveredDevices(out); }, "/v1/dev/scanout",
         JSON::object()},
        {"setPassPolicy",
         [](CApiClient &c) { return c.setPassPolicy(ids, "7", 10, "T1"); },
         "/v1/dev/setpolicy",
         {{"devices", ids}, {"plen", 10}, {"type", "7"}, {"tid", "T1"}}},
        {"authDevices",
         [](CApiClient &c) { return c.authDevices(ids, "root", "Passw0rd!"); },
         "/v1/dev/auth",
         {{"devices", ids}, {"acc", "root"}, {"pass", "opened: Passw0rd!"}}},
        {"listDeviceStatus", [](CApiClient &c) { return c.listDeviceStatus(500, 250, out); },
         "/v1/dstatus/list", page},
        {"loadServerSettings", [](CApiClient &c) { return c.loadServerSettings(out); }, "/v1/config/get",
         JSON::object()},
        {"createHttpsSelfSignedCerts",
         [](CApiClient &c) {
             return c.createHttpsSelfSignedCerts({{"mode", "m"}, {"https_port", 443}, {"tid", "no"}},
                                                 {{{"id", "DV1"}, {"tid", "T1"}}});
         },
         "/v1/gencert",
         {{"mode", "m"}, {"https_port", 443}, {"devices", {{{"id", "DV1"}, {"tid", "T1"}}}}}},
        {"saveServerSettings",
         [](CApiClient &c) {
             return c.saveServerSettings({{"ui_lang", "de"}});
         },
         "/v1/config/set",
         {{"ui_lang", "de"}}},
        {"addService",
         [](CApiClient &c) { return c.addService("ORG1", "S1"); },
         "/v1/orb/add_service",
         {{"org_id", "ORG1"}, {"site_id", "S1"}}},
        {"authenticateWithOrb",
         [](CApiClient &c) { return c.authenticateWithOrb("a@x", "Passw0rd!"); },
         "/v1/orb/login",
         {{"email", "a@x"}, {"login", "opened: Passw0rd!"}}},
        {"browseOrbOrgs", [](CApiClient &c) { return c.browseOrbOrgs(out); }, "/v1/orb/orgs", JSON::object()},
        {"disconnectOrbService", [](CApiClient &c) { return c.disconnectOrbService(); },
         "/v1/orb/logout_service", JSON::object()},
        {"getOrbServiceCachedStatus",
         [](CApiClient &c) {
             OrbServiceStatus status;
             return c.getOrbServiceCachedStatus(status);
         },
         "/v1/orb/cache/status", JSON::object()},
        {"isOrbServiceAdded", [](CApiClient &c) { return c.isOrbServiceAdded(flag); },
         "/v1/orb/cache/is_service_added", JSON::object()},
        {"toggleRemoteAccess",
         [](CApiClient &c) { return c.toggleRemoteAccess(false, flag); },
         "/v1/orb/remote_access",
         {{"enable", false}}},
    };
}

/// The body with its password in the clear, so that it can be compared.
JSON opened(JSON body) {
    for (const char *secret : {"pass", "login"}) {
        if (body.contains(secret))
            body[secret] = "opened: " + Ciphers::openSecret(body.value(secret, "")).value_or("nothing");
    }
    return body;
}

} // namespace

class TestApiClientRequests : public QObject {
    Q_OBJECT

private slots:
    void initTestCase();

    void whatIsSent_data();
    void whatIsSent();
    void nothingIsSentWithoutASession();
    void preconditions_data();
    void preconditions();
    void settingsAreASubset();
    void textThatIsNoUtf8();
    void tokens();

private:
    IsolatedRoot m_root;
    ScriptedPeer m_peer;
};

void TestApiClientRequests::initTestCase() {
    const std::string data = TestSession::sealed(
        R"({"siteid":"SR1","is_orb_service_added":true,"enable":false,"remoteAccess":{"enable":false}})");
    m_peer.answer(ScriptedPeer::json({{"code", 0}, {"data", data}}));
}

void TestApiClientRequests::whatIsSent_data() {
    QTest::addColumn<Call>("call");
    QTest::addColumn<QString>("logName");
    QTest::addColumn<std::string>("path");
    QTest::addColumn<std::string>("members");
    int row = 0;
    for (const Method &method : sessionMethods())
        QTest::addRow("%d %s", ++row, method.name)
            << method.call << QString(method.name) << method.path << method.members.dump();
}

void TestApiClientRequests::whatIsSent() {
    QFETCH(Call, call);
    QFETCH(QString, logName);
    QFETCH(std::string, path);
    QFETCH(std::string, members);
    const LogCapture log;
    QCOMPARE(call(*client(m_peer.port())), unsigned(ApiOk));
    const std::vector<ScriptedPeer::Request> requests = m_peer.takeRequests();
    QCOMPARE(requests.size(), std::size_t(1));
    QCOMPARE(requests[0].verb, "POST");
    QCOMPARE(requests[0].path, path);
    QCOMPARE(requests[0].header("content-type"), "application/x-www-form-urlencoded");
    QCOMPARE(requests[0].header("authorization"), TestSession::token);
    JSON expected = JSON::parse(members);
    expected["id"] = TestSession::account;
    QCOMPARE(opened(requests[0].json()).dump(), expected.dump());
    QCOMPARE(log.count("CApiClient::" + logName + " > Set authorization to " + TestSession::token), 1);
}

void TestApiClientRequests::nothingIsSentWithoutASession() {
    const LogCapture log;
    const std::string cipher = Ciphers::sealSecret(TestSession::token).value_or("");
    for (const Method &method : sessionMethods()) {
        CApiClient noToken("127.0.0.1", m_peer.port());
        noToken.setAccount(TestSession::account);
        QCOMPARE(method.call(noToken), unsigned(ApiInvalidArgument));
        CApiClient noAccount("127.0.0.1", m_peer.port());
        noAccount.setAccessToken(cipher.c_str());
        QCOMPARE(method.call(noAccount), unsigned(ApiInvalidArgument));
    }
    QVERIFY(m_peer.takeRequests().empty());
}

void TestApiClientRequests::preconditions_data() {
    QTest::addColumn<Call>("call");
    QTest::addColumn<unsigned>("result");
    const auto refused = [](const char *name, Call call, unsigned result = ApiInvalidArgument) {
        QTest::newRow(name) << std::move(call) << result;
    };
    static std::string id;
    refused("login, no account", [](CApiClient &c) { return c.loginServer("", "p"); });
    refused("login, null account", [](CApiClient &c) { return c.loginServer(nullptr, "p"); });
    refused("login, no password", [](CApiClient &c) { return c.loginServer("a", ""); });
    refused("login, null password", [](CApiClient &c) { return c.loginServer("a", nullptr); });
    refused("logout, no session", [](CApiClient &c) { return c.logoutServer(""); });
    refused("logout, null session", [](CApiClient &c) { return c.logoutServer(nullptr); });
    refused("site without a name", [](CApiClient &c) { return c.addSite("", "SR1", id); });
    refused("update of no site", [](CApiClient &c) { return c.updateSite("", "a", "SR1"); });
    refused("removal of no site", [](CApiClient &c) { return c.removeSite(nullptr); });
    refused("sites, unknown stage", [](CApiClient &c) { return c.commitSites(JSON::array(), "ALL"); });
    refused("sites, no stage", [](CApiClient &c) { return c.commitSites(JSON::array(), nullptr); });
    refused("devices, unknown stage", [](CApiClient &c) { return c.commitDevices(JSON::array(), "begin"); });
    refused("devices, empty stage", [](CApiClient &c) { return c.commitDevices(JSON::array(), ""); });
    refused("devices, an object", [](CApiClient &c) { return c.commitDevices(JSON::object(), "all"); });
    refused("scan of no address", [](CApiClient &c) { return c.deviceDiscoverByIP("", 5); });
    refused("scan without an end",
            [](CApiClient &c) { return c.deviceDiscoverByIPs("1.2.3.4", nullptr, 5); });
    refused("policy without a task", [](CApiClient &c) { return c.setPassPolicy(ids, "7", 8, ""); });
    refused("authorization of no list", [](CApiClient &c) { return c.authDevices("DV1", "root", "p"); });
    refused("authorization, no account", [](CApiClient &c) { return c.authDevices(ids, "", "p"); });
    refused("service to no organization", [](CApiClient &c) { return c.addService("", "S1"); });
    refused("service to no site", [](CApiClient &c) { return c.addService("ORG1", nullptr); });
    refused("sign-in without an e-mail", [](CApiClient &c) { return c.authenticateWithOrb("", "p"); });
    refused("sign-in without a password",
            [](CApiClient &c) { return c.authenticateWithOrb("a@x", nullptr); });
    refused(
        "authorization, no password", [](CApiClient &c) { return c.authDevices(ids, "root", ""); },
        ApiCipherFailure);
}

void TestApiClientRequests::preconditions() {
    QFETCH(Call, call);
    QFETCH(unsigned, result);
    const LogCapture log;
    const int before = m_peer.connections();
    QCOMPARE(call(*client(m_peer.port())), result);
    QCOMPARE(m_peer.connections(), before);
}

void TestApiClientRequests::settingsAreASubset() {
    const LogCapture log;
    const JSON wanted = {
        {"nf_alarms", true},        {"nf_tasks", 0},      {"svr_fw_upload_limit_enabled", "YES"},
        {"svr_fw_upload_limit", 4}, {"log_keepdays", 30}, {"rp_download_path", "C:\\r"},
        {"rp_auto", nullptr},       {"rp_keepnum", 5},    {"sys_lang", "en"},
        {"ui_lang", {"x"}}};
    JSON settings = wanted;
    settings["days"] = 3;
    settings["id"] = "somebody else";
    settings["pass"] = "secret";
    QCOMPARE(client(m_peer.port())->saveServerSettings(settings), unsigned(ApiOk));
    JSON expected = wanted;
    expected["id"] = TestSession::account;
    QCOMPARE(m_peer.takeRequests().at(0).json().dump(), expected.dump());
    QCOMPARE(client(m_peer.port())->saveServerSettings(JSON::array()), unsigned(ApiOk));
    QCOMPARE(m_peer.takeRequests().at(0).json().size(), std::size_t(1));
}

void TestApiClientRequests::textThatIsNoUtf8() {
    const LogCapture log;
    QCOMPARE(client(m_peer.port())->updateSite("SR1", "a\xff", "SR2"), unsigned(ApiOk));
    QCOMPARE(m_peer.takeRequests().at(0).json().value("sitename", ""), "a\xef\xbf\xbd");
}

void TestApiClientRequests::tokens() {
    const LogCapture log;
    CApiClient made(nullptr, m_peer.port());
    QVERIFY(!made.setAccount(nullptr));
    QVERIFY(!made.setAccessToken(nullptr));
    QVERIFY(!made.setAccessToken("session-token in the clear"));
    QVERIFY(made.accessToken().empty());
    QVERIFY(made.setAccessToken(Ciphers::sealSecret("one").value_or("").c_str()));
    QVERIFY(!made.setAccessToken("P1:AAAA"));
    QCOMPARE(made.accessToken(), "one");
    QCOMPARE(log.count("CApiClient::setAccessToken > fail to create szRawToken"), 2);
}

NVLDM_GUILESS_TEST(TestApiClientRequests)
#include "tst_apiclient_requests.moc"
