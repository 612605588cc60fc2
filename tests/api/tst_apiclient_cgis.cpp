#include "support/isolatedroot.h"
#include "support/logcapture.h"
#include "support/scriptedpeer.h"
#include "support/testmain.h"
#include "testsession.h"

#include <QTest>

#include <functional>

using TestSession::client;

using Call = std::function<unsigned(CApiClient &, JSON &)>;
Q_DECLARE_METATYPE(Call)

namespace {

const JSON targets = {{{"id", "DV1"}, {"tid", "T1"}}};
const JSON commands = {"/cgi-bin/one.cgi", "/cgi-bin/two.cgi"};

} // namespace

/// Commands on devices and their configuration, as they go over the wire.
class TestApiClientCgis : public QObject {
    Q_OBJECT

private slots:
    void whatIsSent_data();
    void whatIsSent();
    void refusedBeforeSending();
    void generalAnswerIsLoggedBeforeItIsJudged();

private:
    IsolatedRoot m_root;
    ScriptedPeer m_peer;
};

void TestApiClientCgis::whatIsSent_data() {
    QTest::addColumn<Call>("call");
    QTest::addColumn<QString>("path");
    QTest::addColumn<std::string>("members");
    QTest::addColumn<QString>("data"); // "sealed", "plain", or nothing where the method has no output
    const auto row = [](const char *name, Call call, const char *path, const JSON &members,
                        const char *data) {
        QTest::newRow(name) << std::move(call) << QString(path) << members.dump() << QString(data);
    };
    row(
        "listCgis", [](CApiClient &c, JSON &out) { return c.listCgis(500, 250, out); }, "/v1/cgi/list",
        {{"start", 500}, {"count", 250}}, "sealed");
    row(
        "commitCgis", [](CApiClient &c, JSON &) { return c.commitCgis(commands, "update"); },
        "/v1/cgi/commit", {{"state", "update"}, {"cgis", commands}}, "");
    row(
        "runCustomCgis", [](CApiClient &c, JSON &) { return c.runCustomCgis(commands, targets); },
        "/v1/cgi/custom", {{"cgis", commands}, {"devices", targets}}, "");
    row(
        "runGeneralCgis",
        [](CApiClient &c, JSON &) {
            return c.runGeneralCgis("/v1/assip/auto", {{"tid", "T1"}, {"devices", {"DV1"}}});
        },
        "/v1/assip/auto", {{"tid", "T1"}, {"devices", {"DV1"}}}, "");
    row(
        "runConfigQuery", [](CApiClient &c, JSON &out) { return c.runConfigQuery("DV1", out); },
        "/v1/config/query", {{"deviceid", "DV1"}}, "plain");
    row(
        "setTemplate", [](CApiClient &c, JSON &out) { return c.setTemplate(targets, "a: 1\n", out); },
        "/v1/config/config", {{"devices", targets}, {"template", "a: 1\n"}}, "plain");
    const JSON all = {{"posixTz", "UTC0"},   {"timesync", "ntp"},    {"time", "10:00"},
                      {"powerfreq", 50},     {"mute", true},         {"server1", "1"},
                      {"server2", "2"},      {"server3", "3"},       {"server4", "4"},
                      {"server5", "5"},      {"date", "2026/01/01"}, {"daylightEnable", 0},
                      {"updateInterval", 60}};
    JSON sent = all;
    sent["devices"] = targets;
    row(
        "runQuickSetup",
        [all](CApiClient &c, JSON &out) {
            JSON settings = all;
            settings["id"] = "somebody else";
            settings["pass"] = "secret";
            return c.runQuickSetup(targets, settings, out);
        },
        "/v1/quicksetup", sent, "plain");
    row(
        "runQuickSetup",
        [](CApiClient &c, JSON &out) {
            return c.runQuickSetup(targets, {{"mute", nullptr}}, out);
        },
        "/v1/quicksetup", {{"devices", targets}, {"mute", nullptr}}, "plain");
}

void TestApiClientCgis::whatIsSent() {
    QFETCH(Call, call);
    QFETCH(QString, path);
    QFETCH(std::string, members);
    QFETCH(QString, data);
    const LogCapture log;
    JSON expected = JSON::parse(members);
    expected["id"] = TestSession::account;
    JSON answer = {{"code", 0}};
    m_peer.answer(ScriptedPeer::json(answer));
    JSON out;
    // An answer without the promised data is no success, and leaves the output alone.
    QCOMPARE(call(*client(m_peer.port()), out), unsigned(data.isEmpty() ? ApiOk : ApiMissingData));
    QVERIFY(out.is_null());
    answer["data"] = data == "sealed" ? JSON(TestSession::sealed("[1]")) : JSON::array({1});
    m_peer.answer(ScriptedPeer::json(answer));
    QCOMPARE(call(*client(m_peer.port()), out), unsigned(ApiOk));
    QVERIFY(out == (data.isEmpty() ? JSON() : JSON::array({1})));

    const std::vector<ScriptedPeer::Request> requests = m_peer.takeRequests();
    QCOMPARE(requests.size(), std::size_t(2));
    QCOMPARE(QString::fromStdString(requests[0].path), path);
    QCOMPARE(requests[0].json().dump(), expected.dump());
    const QString method = QString::fromLatin1(QTest::currentDataTag());
    QCOMPARE(log.count("CApiClient::" + method + " > Set authorization to " + TestSession::token), 2);
    CApiClient noSession("127.0.0.1", m_peer.port());
    QCOMPARE(call(noSession, out), unsigned(ApiInvalidArgument));
    QVERIFY(m_peer.takeRequests().empty());
}

void TestApiClientCgis::refusedBeforeSending() {
    const LogCapture log;
    const int before = m_peer.connections();
    const auto made = client(m_peer.port());
    JSON out;
    const unsigned results[] = {
        made->commitCgis(commands, "begin"),
        made->commitCgis(JSON::object(), "all"),
        made->runCustomCgis("/one.cgi", targets),
        made->runCustomCgis(commands, "DV1"),
        made->runGeneralCgis("/v1/x", JSON::object()),
        made->runGeneralCgis("/v1/x", {"devices"}),
        made->runGeneralCgis("", {{"devices", targets}}),
        made->runConfigQuery("", out),
        made->setTemplate(targets, nullptr, out),
        made->runQuickSetup("DV1", JSON::object(), out),
    };
    for (const unsigned result : results)
        QCOMPARE(result, unsigned(ApiInvalidArgument));
    QCOMPARE(m_peer.connections(), before);
}

void TestApiClientCgis::generalAnswerIsLoggedBeforeItIsJudged() {
    const LogCapture log;
    m_peer.answer({ScriptedPeer::http(200, R"({"code":4,"msg":"100%s unknown"})")});
    QCOMPARE(client(m_peer.port())->runGeneralCgis("/v1/x", {{"devices", targets}}),
             unsigned(ApiServerError));
    QCOMPARE(log.count(R"(Request /v1/x gets result: {"code":4,"msg":"100%s unknown"})"), 1);
    m_peer.answer({ScriptedPeer::http(500, "down")});
    QCOMPARE(client(m_peer.port())->runGeneralCgis("/v1/x", {{"devices", targets}}),
             unsigned(ApiHttpStatusError));
    QCOMPARE(log.count("Request /v1/x gets result: down"), 1);
    m_peer.answer({ScriptedPeer::http(500, std::string(5000, 'x'))});
    client(m_peer.port())->runGeneralCgis("/v1/x", {{"devices", targets}});
    QCOMPARE(log.count(QString(4096, u'x')), 1);
    QCOMPARE(log.count(QString(4097, u'x')), 0);
}

NVLDM_GUILESS_TEST(TestApiClientCgis)
#include "tst_apiclient_cgis.moc"
