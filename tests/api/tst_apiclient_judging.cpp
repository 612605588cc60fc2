#include "api/client/apilocalclient.h"
#include "api/session/nettask.h"
#include "api/transport/clientidentity.h"
#include "api/transport/requestdeadline.h"
#include "api/transport/serverkeycheck.h"
#include "store/localstore.h"
#include "support/certificatemaker.h"
#include "support/isolatedroot.h"
#include "support/logcapture.h"
#include "support/scriptedpeer.h"
#include "support/testmain.h"
#include "testsession.h"

#include <QDir>
#include <QElapsedTimer>
#include <QTest>

#include <openssl/ssl.h>
#include <openssl/ui.h>

#include <functional>
#include <future>

#include <sys/stat.h>
#include <unistd.h>

using TestSession::client;
using TestSession::sealed;

namespace {

constexpr std::size_t bodyLimit = 64u << 20;
constexpr const char *renewed = "renewed_token-0123456789ABCDEFGHIJKLMNOPQRS";

ScriptedPeer::Reply whole(const std::string &body, int status = 200) {
    return {ScriptedPeer::http(status, body)};
}

std::string padded(const std::string &json, std::size_t length) {
    return json + std::string(length - json.size(), ' ');
}

std::string nested(std::size_t levels) {
    return std::string(levels, '[') + std::string(levels, ']');
}

} // namespace

Q_DECLARE_METATYPE(ScriptedPeer::Reply)

class TestApiClientJudging : public QObject {
    Q_OBJECT

private slots:
    void cleanup();

    void judgesAnswers_data();
    void judgesAnswers();
    void outputIsFilledOnlyWithSuccess();
    void listsLongerThanAskedFor();
    void longHead_data();
    void longHead();
    void totalTime_data();
    void totalTime();
    void renewal_data();
    void renewal();
    void loginKeepsTheToken();
    void loginJudging_data();
    void loginJudging();
    void liveness_data();
    void liveness();
    void livenessOfASilentPeer();
    void nobodyListens();
    void clientCertificate_data();
    void clientCertificate();
    void certificateFilesOfNoUse();
    void nothingIsSentWithoutAKey();
    void anotherServerKeyGetsNothing();
    void keyOfAResumedSessionIsLookedAt();
    void endOfTheProgramCutsRequests();

private:
    IsolatedRoot m_root;
    ScriptedPeer m_peer;
};

void TestApiClientJudging::cleanup() {
    m_peer.greet(ScriptedPeer::Greeting::Handshake);
    m_peer.takeRequests();
}

void TestApiClientJudging::judgesAnswers_data() {
    QTest::addColumn<ScriptedPeer::Reply>("reply");
    QTest::addColumn<unsigned>("withOutput");
    QTest::addColumn<unsigned>("withoutOutput");
    const auto json = [](const std::string &text) { return whole(text); };
    const std::string list = R"({"code":0,"data":")" + sealed("[1,2]") + "\"}";
    using End = ScriptedPeer::End;

    QTest::newRow("success") << json(list) << 0u << 0u;
    QTest::newRow("no data") << json(R"({"code":0,"msg":"ok"})") << 14u << 0u;
    QTest::newRow("code 105") << json(R"({"code":105,"data":""})") << 17u << 17u;
    QTest::newRow("code 108") << json(R"({"code":108})") << 18u << 18u;
    QTest::newRow("code 3") << json(R"({"code":3})") << 15u << 15u;
    QTest::newRow("code -1") << json(R"({"code":-1})") << 15u << 15u;
    QTest::newRow("code 107 means nothing here") << json(R"({"code":107})") << 15u << 15u;

    QTest::newRow("401") << whole(list, 401) << 13u << 13u;
    QTest::newRow("500") << whole(list, 500) << 13u << 13u;
    QTest::newRow("404 with code 105") << whole(R"({"code":105})", 404) << 13u << 13u;
    QTest::newRow("302 is not followed") << whole("", 302) << 13u << 13u;
    QTest::newRow("201") << whole(list, 201) << 13u << 13u;

    QTest::newRow("a page") << json("<html>It works!</html>") << 1u << 1u;
    QTest::newRow("empty body") << json("") << 1u << 1u;
    QTest::newRow("cut off JSON") << json(R"({"code":0)") << 1u << 1u;
    QTest::newRow("no object") << json("[0]") << 1u << 1u;
    QTest::newRow("null") << json("null") << 1u << 1u;
    QTest::newRow("no UTF-8") << json("{\"code\":0,\"msg\":\"\xff\"}") << 1u << 1u;
    QTest::newRow("deep nesting") << json(R"({"code":0,"data":)" + nested(100000) + "}") << 1u << 1u;
    QTest::newRow("deep nesting in the ciphered data")
        << json(R"({"code":0,"data":")" + sealed(nested(100000)) + "\"}") << 1u << 0u;

    QTest::newRow("no code") << json(R"({"data":""})") << 1u << 1u;
    QTest::newRow("code as text") << json(R"({"code":"0"})") << 1u << 1u;
    QTest::newRow("code null") << json(R"({"code":null})") << 1u << 1u;
    QTest::newRow("code false") << json(R"({"code":false})") << 1u << 1u;
    QTest::newRow("code 0.5") << json(R"({"code":0.5})") << 1u << 1u;
    QTest::newRow("code 2^32") << json(R"({"code":4294967296})") << 15u << 15u;
    QTest::newRow("code 2^64-1") << json(R"({"code":18446744073709551615})") << 15u << 15u;

    const std::string two = sealed("[1,2]");
    QTest::newRow("data before the code") << json(R"({ "data" : ")" + two + R"(" , "code":0})") << 0u << 0u;
    QTest::newRow("other letters around data")
        << json(R"({"msg":"\"data\": \u00e4 ä","data":")" + two + R"(","code":0})") << 0u << 0u;
    QTest::newRow("data with an escaped letter")
        << json(R"({"code":0,"data":"\u0044)" + two.substr(1) + "\"}") << 0u << 0u;
    QTest::newRow("an inner data is none")
        << json(R"({"code":0,"more":{"data":")" + two + "\"}}") << 14u << 0u;
    QTest::newRow("data as a text") << json(R"({"code":0,"more":["data"]})") << 14u << 0u;
    QTest::newRow("data twice: the last counts")
        << json(R"({"code":0,"data":"D1:AAAA","data":")" + two + "\"}") << 0u << 0u;
    QTest::newRow("data does not end") << json(R"({"code":0,"data":")" + two + "}") << 1u << 1u;
    QTest::newRow("broken behind data") << json(list + "}") << 1u << 1u;

    QTest::newRow("data not ciphered") << json(R"({"code":0,"data":[1,2]})") << 1u << 0u;
    QTest::newRow("data null") << json(R"({"code":0,"data":null})") << 1u << 0u;
    QTest::newRow("data does not decipher") << json(R"({"code":0,"data":"D1:AAAA"})") << 1u << 0u;
    QTest::newRow("data ciphered, no JSON")
        << json(R"({"code":0,"data":")" + sealed("oops") + "\"}") << 1u << 0u;

    QTest::newRow("64 MiB") << json(padded(list, bodyLimit)) << 0u << 0u;
    QTest::newRow("over 64 MiB") << json(padded(list, bodyLimit + 1)) << 12u << 12u;
    QTest::newRow("reset in mid-body")
        << ScriptedPeer::Reply{ScriptedPeer::http(200, list).substr(0, 60), End::Reset} << 12u << 12u;
    QTest::newRow("short body")
        << ScriptedPeer::Reply{"HTTP/1.1 200 OK\r\nContent-Length: 99\r\n\r\n{\"code\":0}"} << 12u << 12u;
    QTest::newRow("body without length")
        << ScriptedPeer::Reply{"HTTP/1.1 200 OK\r\nConnection: close\r\n\r\n" + list} << 0u << 0u;
    QTest::newRow("chunks") << ScriptedPeer::Reply{"HTTP/1.1 200 OK\r\nTransfer-Encoding: chunked\r\n\r\n"
                                                   "5\r\n{\"cod\r\n5\r\ne\":7}\r\n0\r\n\r\n"}
                            << 15u << 15u;
    const std::string chunked = "HTTP/1.1 200 OK\r\nTransfer-Encoding: chunked\r\n\r\n5\r\n{\"cod\r\n";
    const std::string longLine = ";" + std::string(6000, 'x') + "\r\n";
    QTest::newRow("long line before a chunk")
        << ScriptedPeer::Reply{chunked + "5" + longLine + "e\":7}\r\n0\r\n\r\n"} << 12u << 12u;
    std::string many;
    while (many.size() < bodyLimit)
        many += "Trailer: x\r\n";
    QTest::newRow("64 MiB after the last chunk")
        << ScriptedPeer::Reply{chunked + "5\r\ne\":7}\r\n0\r\n" + many + "\r\n"} << 12u << 12u;
    QTest::newRow("chunk that ends wrongly")
        << ScriptedPeer::Reply{chunked + "5\r\ne\":7}}\r\n0\r\n\r\n"} << 12u << 12u;
    QTest::newRow("said to be compressed")
        << ScriptedPeer::Reply{ScriptedPeer::http(200, list, {"Content-Encoding: gzip"})} << 0u << 0u;
    QTest::newRow("no HTTP") << ScriptedPeer::Reply{"SSH-2.0-Server\r\n"} << 12u << 12u;
    QTest::newRow("closed without an answer") << ScriptedPeer::Reply{} << 12u << 12u;
    QTest::newRow("reset without an answer") << ScriptedPeer::Reply{{}, End::Reset} << 12u << 12u;
}

void TestApiClientJudging::judgesAnswers() {
    QFETCH(ScriptedPeer::Reply, reply);
    QFETCH(unsigned, withOutput);
    QFETCH(unsigned, withoutOutput);
    const LogCapture log;
    m_peer.answer(reply);
    JSON devices;
    QCOMPARE(client(m_peer.port())->listDevices(0, 500, devices), withOutput);
    QCOMPARE(devices.dump(), withOutput == 0 ? "[1,2]" : "null");
    const auto made = client(m_peer.port());
    QCOMPARE(made->removeSite("SR1"), withoutOutput);
    // A code and a status of the client's fault say no; everything else leaves open what was done.
    const bool isNo = withoutOutput >= 15 || QByteArray(QTest::currentDataTag()).startsWith("40");
    QCOMPARE(made->isUnanswered(), withoutOutput != 0 && !isNo);
    QCOMPARE(m_peer.takeRequests().size(), std::size_t(2));
}

void TestApiClientJudging::outputIsFilledOnlyWithSuccess() {
    const LogCapture log;
    JSON devices = "as before";
    std::string id = "as before";
    for (const char *data : {"[]", "{}", R"({"siteid":7})"}) {
        m_peer.answer(ScriptedPeer::json({{"code", 0}, {"data", sealed(data)}}));
        QCOMPARE(client(m_peer.port())->addSite("name", nullptr, id), unsigned(ApiMissingData));
    }
    m_peer.answer(ScriptedPeer::json({{"code", 105}, {"data", sealed(R"({"siteid":"SR1"})")}}));
    QCOMPARE(client(m_peer.port())->addSite("name", nullptr, id), unsigned(ApiCode105));
    QCOMPARE(client(m_peer.port())->listSites(0, 1, devices), unsigned(ApiCode105));
    QCOMPARE(id, "as before");
    QCOMPARE(devices.dump(), "\"as before\"");
}

void TestApiClientJudging::listsLongerThanAskedFor() {
    const LogCapture log;
    m_peer.answer(ScriptedPeer::sealed(JSON::array({1, 2, 3})));
    using ListCall = unsigned (CApiClient::*)(int, int, JSON &);
    for (const ListCall list : {&CApiClient::listSites, &CApiClient::listDevices, &CApiClient::listCgis,
                                &CApiClient::listDeviceStatus, &CApiClient::listTaskStatus}) {
        JSON records;
        QCOMPARE((client(m_peer.port()).get()->*list)(0, 2, records), unsigned(ApiException));
        QVERIFY(records.is_null());
        QCOMPARE((client(m_peer.port()).get()->*list)(0, 3, records), unsigned(ApiOk));
    }
    m_peer.answer(ScriptedPeer::sealed({{"items", JSON::array({1, 2, 3})}, {"total_items", 3}}));
    JSON alarms;
    QCOMPARE(client(m_peer.port())->listAlarmInfo(0, 2, alarms), unsigned(ApiOk));
    QCOMPARE(alarms.dump(), R"({"items":[1,2],"total_items":3})");
    QCOMPARE(log.count("CApiClient > 3 records came, those after the first 2 are dropped"), 1);
}

void TestApiClientJudging::longHead_data() {
    QTest::addColumn<std::string>("head");
    QTest::addColumn<unsigned>("result");
    const std::string ok = "HTTP/1.1 200 OK\r\n";
    std::string headers;
    for (int i = 0; i < 10000; ++i)
        headers += "X-Header: " + std::string(100, 'x') + "\r\n";
    QTest::newRow("1 MiB status line") << "HTTP/1.1 200 " + std::string(1 << 20, 'x') + "\r\n" << 12u;
    QTest::newRow("1 MiB, no line") << std::string(1 << 20, 'x') << 12u;
    QTest::newRow("1 MiB of headers") << ok + headers << 12u;
    QTest::newRow("10 KiB status line") << "HTTP/1.1 200 " + std::string(10000, 'x') + "\r\n" << 17u;
    QTest::newRow("10 KiB of headers") << ok + headers.substr(0, 112 * 90) << 17u;
}

void TestApiClientJudging::longHead() {
    QFETCH(std::string, head);
    QFETCH(unsigned, result);
    const LogCapture log;
    // It takes what the client sends meanwhile, or its end would destroy what the client has not read yet.
    m_peer.answer({head + "Content-Length: 12\r\n\r\n" + R"({"code":105})", ScriptedPeer::End::Hold});
    unsigned onRunner = ApiOk;
    NetTask::runAndWait([&] { onRunner = client(m_peer.port())->removeSite("SR1"); });
    QCOMPARE(onRunner, result);
    m_peer.greet(ScriptedPeer::Greeting::Renegotiate);
    QCOMPARE(client(m_peer.port())->removeSite("SR1"), result);
    QCOMPARE(client(m_peer.port())->loginServer("somebody", "secret"), result);
    m_peer.greet(ScriptedPeer::Greeting::Handshake);
    QCOMPARE(client(m_peer.port())->removeSite("SR1"), result);
}

void TestApiClientJudging::totalTime_data() {
    QTest::addColumn<ScriptedPeer::Reply>("reply");
    QTest::addColumn<bool>("handshake");
    const std::string answer = ScriptedPeer::http(200, padded(R"({"code":0})", 4000));
    const std::chrono::milliseconds pause(100);
    QTest::newRow("byte by byte") << ScriptedPeer::Reply{answer, ScriptedPeer::End::Close, 1, pause} << true;
    QTest::newRow("body in drips") << ScriptedPeer::Reply{answer, ScriptedPeer::End::Close, 60, pause}
                                   << true;
    QTest::newRow("nothing answered") << ScriptedPeer::Reply{{}, ScriptedPeer::End::Hold} << true;
    QTest::newRow("no handshake") << ScriptedPeer::Reply{} << false;
}

void TestApiClientJudging::totalTime() {
    QFETCH(ScriptedPeer::Reply, reply);
    QFETCH(bool, handshake);
    const LogCapture log;
    m_peer.answer(reply);
    if (!handshake)
        m_peer.greet(ScriptedPeer::Greeting::Silence);
    const auto made = client(m_peer.port());
    made->setTotalTimeout(std::chrono::milliseconds(800));
    QElapsedTimer timer;
    timer.start();
    QCOMPARE(made->removeSite("SR1"), unsigned(ApiTransportError));
    QVERIFY2(timer.elapsed() < 4000, "well before the transport's own time-out for each wait");
    QCOMPARE(made->isUnanswered(), handshake);
}

void TestApiClientJudging::renewal_data() {
    QTest::addColumn<int>("code");
    QTest::addColumn<std::string>("header");
    QTest::addColumn<bool>("taken");
    const std::string token = renewed;
    QTest::newRow("success") << 0 << token << true;
    QTest::newRow("failure") << 3 << token << false;
    QTest::newRow("session gone") << 105 << token << false;
    QTest::newRow("scheme word") << 0 << "Bearer " + token << false;
    QTest::newRow("short") << 0 << std::string("short") << false;
    QTest::newRow("long") << 0 << std::string(257, 'a') << false;
    QTest::newRow("padded") << 0 << token + "==" << true;
    QTest::newRow("padded too much") << 0 << token + "===" << false;
    QTest::newRow("padding before the end") << 0 << "=" + token << false;
    QTest::newRow("other alphabet") << 0 << token + "+" << false;
    QTest::newRow("coded line feed") << 0 << token + "%0D%0AX" << false;
    QTest::newRow("no ASCII") << 0 << token + "\xc3\xa4" << false;
    QTest::newRow("empty") << 0 << std::string() << false;
}

void TestApiClientJudging::renewal() {
    QFETCH(int, code);
    QFETCH(std::string, header);
    QFETCH(bool, taken);
    const LogCapture log;
    m_peer.answer(ScriptedPeer::json({{"code", code}}, {"Authorization: " + header}));
    const auto made = client(m_peer.port());
    QCOMPARE(made->removeSite("SR1") == ApiOk, code == 0);
    QCOMPARE(made->accessToken(), taken ? header : std::string(TestSession::token));
    QCOMPARE(log.count("CApiClient::removeSite > m_strAccess: " + QString::fromStdString(header)),
             taken ? 1 : 0);
    const bool refused = code == 0 && !taken && !header.empty();
    QCOMPARE(log.count("the renewed token is malformed"), refused ? 1 : 0);
}

void TestApiClientJudging::loginKeepsTheToken() {
    const LogCapture log;
    CLocalStore &store = CLocalStore::instance();
    m_peer.answer(ScriptedPeer::json({{"code", 0}}, {std::string("Authorization: ") + renewed}));
    CApiClient first("127.0.0.1", m_peer.port());
    QCOMPARE(first.loginServer(TestSession::account, "Passw0rd!"), unsigned(ApiOk));
    QCOMPARE(first.accessToken(), renewed);
    QCOMPARE(Ciphers::openSecret(store.access().toStdString()).value_or(""), std::string(renewed));
    const ScriptedPeer::Request request = m_peer.takeRequests().at(0);
    QCOMPARE(request.path, "/v1/login");
    QVERIFY(request.header("authorization").starts_with("G1:"));
    const JSON body = request.json();
    QCOMPARE(body.size(), std::size_t(2));
    QCOMPARE(body.value("email", ""), TestSession::account);
    QCOMPARE(Ciphers::openSecret(body.value("pass", "")).value_or(""), "Passw0rd!");

    const QByteArray before = store.access();
    m_peer.answer(ScriptedPeer::json({{"code", 0}}));
    const auto second = client(m_peer.port());
    QCOMPARE(second->loginServer(TestSession::account, "Passw0rd!"), unsigned(ApiOk));
    QVERIFY(second->accessToken().empty());
    QCOMPARE(store.access(), before);
}

void TestApiClientJudging::loginJudging_data() {
    QTest::addColumn<int>("code");
    QTest::addColumn<unsigned>("result");
    QTest::newRow("wrong") << 105 << 17u;
    QTest::newRow("no more sessions") << 108 << 18u;
    QTest::newRow("other") << 5 << 15u;
}

void TestApiClientJudging::loginJudging() {
    QFETCH(int, code);
    QFETCH(unsigned, result);
    const LogCapture log;
    const QByteArray before = CLocalStore::instance().access();
    m_peer.answer(ScriptedPeer::json({{"code", code}}, {std::string("Authorization: ") + renewed}));
    CApiClient made("127.0.0.1", m_peer.port());
    QCOMPARE(made.loginServer(TestSession::account, "wrong"), result);
    QVERIFY(made.accessToken().empty());
    QCOMPARE(CLocalStore::instance().access(), before);
}

void TestApiClientJudging::liveness_data() {
    QTest::addColumn<ScriptedPeer::Reply>("reply");
    QTest::addColumn<unsigned>("result");
    QTest::newRow("alive") << whole("whatever") << 0u;
    const std::string longer = "HTTP/1.1 200 OK\r\nContent-Length: 100\r\n\r\nthe rest";
    QTest::newRow("body breaks") << ScriptedPeer::Reply{longer} << 0u;
    QTest::newRow("body stays away") << ScriptedPeer::Reply{longer, ScriptedPeer::End::Hold} << 0u;
    QTest::newRow("refused") << whole(R"({"code":0})", 401) << 13u;
    QTest::newRow("head breaks") << ScriptedPeer::Reply{"HTTP/1.1 200 OK\r\nContent-"} << 12u;
    QTest::newRow("closed") << ScriptedPeer::Reply{} << 12u;
}

void TestApiClientJudging::liveness() {
    QFETCH(ScriptedPeer::Reply, reply);
    QFETCH(unsigned, result);
    const LogCapture log;
    m_peer.answer(reply);
    std::uint32_t online = 7;
    QElapsedTimer timer;
    timer.start();
    QCOMPARE(client(m_peer.port())->isServerOnline(online), result);
    QVERIFY2(timer.elapsed() < 1500, "nothing more was to be waited for");
    QCOMPARE(online, result == 0 ? 1u : 0u);
    const ScriptedPeer::Request request = m_peer.takeRequests().at(0);
    QCOMPARE(request.verb + " " + request.path, "GET /isalive");
    QCOMPARE(request.header("content-type"), "text/plain");
    QVERIFY(request.header("authorization").starts_with("G1:"));
    QVERIFY(request.body.empty());
}

void TestApiClientJudging::livenessOfASilentPeer() {
    const LogCapture log;
    m_peer.answer({{}, ScriptedPeer::End::Hold});
    std::uint32_t online = 7;
    QElapsedTimer timer;
    timer.start();
    QCOMPARE(client(m_peer.port())->isServerOnline(online), unsigned(ApiTransportError));
    QVERIFY(timer.elapsed() < 4500);
    QCOMPARE(online, 0u);
}

void TestApiClientJudging::nobodyListens() {
    const LogCapture log;
    m_peer.greet(ScriptedPeer::Greeting::HangUp);
    QCOMPARE(client(m_peer.port())->removeSite("SR1"), unsigned(ApiTransportError));
    CApiClient made("127.0.0.1", m_peer.port());
    QCOMPARE(made.loginServer("a", "b"), unsigned(ApiTransportError));
    QCOMPARE(log.count("Login occuring error: "), 1);
    for (const std::uint32_t port : {0u, 65536u, 4294967295u})
        QCOMPARE(client(port)->removeSite("SR1"), unsigned(ApiTransportError));
    const int before = m_peer.connections();
    QCOMPARE(CApiClient("", m_peer.port()).loginServer("a", "b"), unsigned(ApiTransportError));
    QCOMPARE(m_peer.connections(), before);
    std::uint32_t closedPort = 0;
    {
        const ScriptedPeer gone;
        closedPort = gone.port();
    }
    const auto refused = client(closedPort);
    QCOMPARE(refused->removeSite("SR1"), unsigned(ApiTransportError));
    QVERIFY(!refused->isUnanswered());
}

void TestApiClientJudging::clientCertificate_data() {
    QTest::addColumn<QByteArray>("certificate");
    QTest::addColumn<QByteArray>("key");
    QTest::addColumn<bool>("shown");
    const auto key = CertificateMaker::makeKey();
    const QByteArray certificate =
        CertificateMaker::pem(CertificateMaker::makeCertificate(key.get(), "gate"));
    const QByteArray plain = CertificateMaker::pem(key);
    QTest::newRow("pair") << certificate << plain << true;
    QTest::newRow("key under a pass phrase") << certificate << CertificateMaker::pem(key, "secret") << false;
    QTest::newRow("no certificate") << QByteArray("no certificate") << plain << false;
    QTest::newRow("no key") << certificate << QByteArray() << false;
    QTest::newRow("key of another") << certificate << CertificateMaker::pem(CertificateMaker::makeKey())
                                    << true;
}

/// One that cannot be used is left out. Nobody is asked for its pass phrase: no thread may wait for that.
void TestApiClientJudging::clientCertificate() {
    QFETCH(QByteArray, certificate);
    QFETCH(QByteArray, key);
    QFETCH(bool, shown);
    static int questions;
    questions = 0;
    const std::unique_ptr<UI_METHOD, decltype(&UI_destroy_method)> terminal(UI_create_method("test"),
                                                                            &UI_destroy_method);
    UI_method_set_opener(terminal.get(), [](UI *) { return ++questions, 0; });
    const UI_METHOD *before = UI_get_default_method();
    UI_set_default_method(terminal.get());
    const LogCapture log;
    const QString folder = QDir::currentPath();
    QVERIFY(m_root.write("client.cer", certificate) && m_root.write("client.key", key));
    QVERIFY(QDir::setCurrent(m_root.path()));
    m_peer.answer(ScriptedPeer::json({{"code", 0}}));
    const unsigned result = client(m_peer.port())->removeSite("SR1");
    const bool isThere = ClientIdentity().isThere();
    QVERIFY(QDir::setCurrent(folder));
    UI_set_default_method(before);
    QCOMPARE(result, unsigned(ApiOk));
    QCOMPARE(isThere, shown);
    QCOMPARE(questions, 0);
}

/// A pipe must not hold every request, and another user must not put a key under this one's hands.
void TestApiClientJudging::certificateFilesOfNoUse() {
    const auto key = CertificateMaker::makeKey();
    const QByteArray plain = CertificateMaker::pem(key);
    const QByteArray path = m_root.filePath("client.key").toUtf8();
    const QString folder = QDir::currentPath();
    QVERIFY(m_root.write("client.cer",
                         CertificateMaker::pem(CertificateMaker::makeCertificate(key.get(), "gate"))));
    QVERIFY(m_root.write("client.key", plain) && QDir::setCurrent(m_root.path()));
    QVERIFY(ClientIdentity().isThere());
    if (::geteuid() == 0) {
        QCOMPARE(::chown(path.constData(), 65534, 65534), 0);
        QVERIFY(!ClientIdentity().isThere());
    }
    QVERIFY(m_root.write("client.key", plain + QByteArray(64 << 10, '\n')));
    QVERIFY(!ClientIdentity().isThere());
    QVERIFY(QFile::remove(QString::fromUtf8(path)) && ::mkfifo(path.constData(), 0600) == 0);
    QVERIFY(!ClientIdentity().isThere());
    QVERIFY(QDir::setCurrent(folder));
    QVERIFY(QFile::remove(QString::fromUtf8(path)) && QFile::remove(m_root.filePath("client.cer")));
}

void TestApiClientJudging::nothingIsSentWithoutAKey() {
    const LogCapture log;
    const int before = m_peer.connections();
    QVERIFY(m_root.write("nvlcrypto.key", "no key"));
    std::uint32_t online = 7;
    CApiLocalClient local(m_peer.port());
    JSON members;
    const unsigned results[] = {local.isServerOnline(online), local.memberList(0, 1, members)};
    const unsigned login = CApiClient("127.0.0.1", m_peer.port()).loginServer("a", "b");
    QVERIFY(QFile::remove(m_root.filePath("nvlcrypto.key")));
    for (const unsigned result : results)
        QCOMPARE(result, unsigned(ApiException));
    QCOMPARE(login, unsigned(ApiCipherFailure));
    QCOMPARE(online, 0u);
    QCOMPARE(m_peer.connections(), before);
    QCOMPARE(log.count("The key file " + m_root.filePath("nvlcrypto.key")), 1);
}

/// The last one: no request gets through afterwards.
void TestApiClientJudging::anotherServerKeyGetsNothing() {
    const LogCapture log;
    m_peer.answer(ScriptedPeer::json({{"code", 0}}));
    const std::string first = m_peer.keyFingerprint();
    const auto asked = client(m_peer.port());
    QCOMPARE(asked->removeSite("SR1"), unsigned(ApiOk));
    QCOMPARE(asked->serverKey(), first);
    asked->expectServerKey(first);
    QCOMPARE(asked->removeSite("SR1"), unsigned(ApiOk));
    QCOMPARE(m_peer.takeRequests().size(), std::size_t(2));

    m_peer.renewKey();
    QVERIFY(m_root.write("fw.bin", QByteArray(100000, 'f')));
    const std::string file = m_root.filePath("fw.bin").toStdString();
    const std::string target = m_root.filePath("export.zip").toStdString();
    std::uint32_t online = 7;
    JSON out;
    const std::vector<std::function<unsigned()>> calls = {
        [&] { return asked->removeSite("SR1"); },
        [&] { return asked->listSites(0, 10, out); },
        [&] { return asked->isServerOnline(online); },

        [&] { return asked->uploadPackage("T1", file.c_str(), "fw.bin", {"DV1"}, false); },
        [&] { return asked->exportFile("T1", target.c_str()); },
        [&] { return asked->loginServer("a", "b"); }};
    const int before = m_peer.connections();
    for (const auto &call : calls) {
        QCOMPARE(call(), unsigned(ApiKeyChanged));
        QCOMPARE(asked->serverKey(), m_peer.keyFingerprint());
    }
    QCOMPARE(online, 0u);
    QCOMPARE(m_peer.connections() - before, int(calls.size()));
    QVERIFY(m_peer.takeRequests().empty());
    QCOMPARE(m_peer.brokenOffBytes(), 0);
    QVERIFY(!QFile::exists(QString::fromStdString(target)));
}

/// Such a handshake brings no certificate.
void TestApiClientJudging::keyOfAResumedSessionIsLookedAt() {
    m_peer.answer({ScriptedPeer::http(200, "x")});
    const std::unique_ptr<SSL_CTX, decltype(&SSL_CTX_free)> context(SSL_CTX_new(TLS_client_method()),
                                                                    &SSL_CTX_free);
    std::unique_ptr<SSL_SESSION, decltype(&SSL_SESSION_free)> kept(nullptr, &SSL_SESSION_free);
    for (const std::string &expected : {m_peer.keyFingerprint(), std::string(64, '0')}) {
        const bool isFirst = !kept;
        ServerKeyCheck check(expected);
        check.watch(context.get());
        const std::unique_ptr<SSL, decltype(&SSL_free)> session(SSL_new(context.get()), &SSL_free);
        BIO *line = BIO_new_connect(("127.0.0.1:" + std::to_string(m_peer.port())).c_str());
        QCOMPARE(BIO_do_connect(line), 1);
        SSL_set_bio(session.get(), line, line);
        if (!isFirst)
            SSL_set_session(session.get(), kept.get());
        QCOMPARE(SSL_connect(session.get()), 1);
        QCOMPARE(SSL_session_reused(session.get()), isFirst ? 0 : 1);
        QCOMPARE(check.hasRefused(), !isFirst);
        QCOMPARE(SSL_write(session.get(), "GET / HTTP/1.1\r\n\r\n", 18) > 0, isFirst);
        char byte = 0;
        if (isFirst)
            QCOMPARE(SSL_read(session.get(), &byte, 1), 1);
        kept.reset(SSL_get1_session(session.get()));
        SSL_shutdown(session.get());
    }
    QCOMPARE(m_peer.takeRequests().size(), std::size_t(1));
}

void TestApiClientJudging::endOfTheProgramCutsRequests() {
    const LogCapture log;
    m_peer.answer({{}, ScriptedPeer::End::Hold});
    const int before = m_peer.connections();
    QElapsedTimer timer;
    timer.start();
    auto result = std::async(std::launch::async, [this] { return client(m_peer.port())->removeSite("SR1"); });
    QTRY_VERIFY(m_peer.connections() > before);
    RequestDeadline::cutAll();
    QCOMPARE(result.get(), unsigned(ApiTransportError));
    QVERIFY2(timer.elapsed() < 4500, "before the transport's own time-out");
    m_peer.answer(ScriptedPeer::json({{"code", 0}}));
    QCOMPARE(client(m_peer.port())->removeSite("SR1"), unsigned(ApiTransportError));
}

NVLDM_GUILESS_TEST(TestApiClientJudging)
#include "tst_apiclient_judging.moc"
