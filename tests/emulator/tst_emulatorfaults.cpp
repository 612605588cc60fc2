#include "emulatorprocess.h"
#include "servicecaller.h"
#include "support/testmain.h"

#include <QElapsedTimer>
#include <QTest>

#include <httplib.h>

namespace {

const Json aPage = {{"start", 0}, {"count", 2}};

} // namespace

/// Each fault must be seen by a caller as what it is, and by nobody else.
class EmulatorFaultsTest : public QObject {
    Q_OBJECT

private slots:
    void initTestCase();
    void init();
    void cleanup();

    void response_data();
    void response();
    void wrongTypes_data();
    void wrongTypes();
    void reset();
    void renew();
    void expire();

    void limits_data();
    void limits();
    void badSpec_data();
    void badSpec();

private:
    void put(const char *fault);

    EmulatorProcess m_emulator;
};

void EmulatorFaultsTest::initTestCase() {
    QVERIFY(m_emulator.start());
}

void EmulatorFaultsTest::init() {
    QVERIFY(m_emulator.isRunning() || m_emulator.start());
}

void EmulatorFaultsTest::cleanup() {
    if (m_emulator.isRunning())
        QCOMPARE(m_emulator.command("faults clear"), QString("ok"));
}

void EmulatorFaultsTest::put(const char *fault) {
    QCOMPARE(m_emulator.command(QString("fault ") + fault), QString("ok"));
}

void EmulatorFaultsTest::response_data() {
    QTest::addColumn<QString>("fault");
    QTest::addColumn<int>("status");
    QTest::addColumn<int>("code");
    QTest::addColumn<bool>("json");
    QTest::addColumn<bool>("hasData");
    QTest::newRow("none") << "code=9@/elsewhere" << 200 << 0 << true << true;
    QTest::newRow("code") << "code=17" << 200 << 17 << true << true;
    QTest::newRow("status 401") << "status=401" << 401 << 0 << true << true;
    QTest::newRow("status 500") << "status=500" << 500 << 0 << true << true;
    QTest::newRow("no JSON") << "not-json" << 200 << -1 << false << false;
    QTest::newRow("no data") << "no-data" << 200 << 0 << true << false;
    QTest::newRow("code as text") << "wrong-types=code" << 200 << -1 << true << true;
}

void EmulatorFaultsTest::response() {
    QFETCH(QString, fault);
    QFETCH(bool, json);
    QFETCH(bool, hasData);
    ServiceCaller admin(m_emulator.port());
    QCOMPARE(admin.login("admin", "admin").code, 0);
    put(fault.toUtf8().constData());
    const Reply reply = admin.call("/v1/dev/list", aPage);
    QTEST(reply.status, "status");
    QTEST(reply.code, "code");
    QCOMPARE(!reply.body.is_discarded(), json);
    QCOMPARE(reply.body.contains("data"), hasData);
}

void EmulatorFaultsTest::wrongTypes_data() {
    QTest::addColumn<QString>("fault");
    QTest::addColumn<bool>("deciphers");
    QTest::addColumn<QString>("shape");
    QTest::newRow("members") << "wrong-types" << true << "array";
    QTest::newRow("data") << "wrong-types=data" << true << "object";
    QTest::newRow("cipher") << "bad-cipher" << false << "null";
}

void EmulatorFaultsTest::wrongTypes() {
    QFETCH(QString, fault);
    QFETCH(bool, deciphers);
    QFETCH(QString, shape);
    ServiceCaller admin(m_emulator.port());
    QCOMPARE(admin.login("admin", "admin").code, 0);
    const Json sound = admin.call("/v1/dev/list", aPage).data;
    put(fault.toUtf8().constData());
    const Reply reply = admin.call("/v1/dev/list", aPage);
    QCOMPARE(reply.code, 0);
    QVERIFY(reply.secret);
    QCOMPARE(!reply.data.is_null(), deciphers);
    QCOMPARE(QString(reply.data.type_name()), shape);
    if (shape == "array") {
        QCOMPARE(reply.data.size(), sound.size());
        for (const auto &[name, value] : sound[0].items())
            QVERIFY2(reply.data[0].at(name).type_name() != std::string(value.type_name()), name.c_str());
    }
}

void EmulatorFaultsTest::reset() {
    put("reset@/v1/accm/list");
    httplib::SSLClient client("127.0.0.1", m_emulator.port());
    client.enable_server_certificate_verification(false);
    std::string received;
    std::size_t announced = 0;
    httplib::Request request;
    request.method = "POST";
    request.path = "/v1/accm/list";
    request.body = aPage.dump();
    request.headers = {{"Authorization", ServiceCaller::genericToken()},
                       {"Content-Type", "application/x-www-form-urlencoded"}};
    request.content_receiver = [&](const char *data, std::size_t length, std::uint64_t, std::uint64_t total) {
        received.append(data, length);
        announced = total;
        return true;
    };
    const httplib::Result result = client.send(request);
    QVERIFY(!result);
    QVERIFY(announced > 0);
    QCOMPARE(received.size(), announced / 2);
}

void EmulatorFaultsTest::renew() {
    ServiceCaller admin(m_emulator.port());
    QCOMPARE(admin.login("admin", "admin").code, 0);
    QVERIFY(admin.call("/v1/config/get").token.empty());
    put("renew");
    std::string last = admin.token();
    for (int i = 0; i < 3; ++i) {
        QCOMPARE(admin.call("/v1/config/get").code, 0);
        QVERIFY(admin.token() != last);
        last = admin.token();
    }
}

void EmulatorFaultsTest::expire() {
    ServiceCaller admin(m_emulator.port());
    QCOMPARE(admin.login("admin", "admin").code, 0);
    put("expire@/v1/dev,times=1");
    QCOMPARE(admin.call("/v1/config/get").code, 0);
    QCOMPARE(admin.call("/v1/dev/list", aPage).code, 105);
    QCOMPARE(admin.call("/v1/config/get").code, 105);
    QCOMPARE(admin.login("admin", "admin").code, 0);
    QCOMPARE(admin.call("/v1/dev/list", aPage).code, 0);
}

/// A caller that saw a failure cannot know whether the work was done; the emulator plays both.
void EmulatorFaultsTest::limits_data() {
    QTest::addColumn<QString>("fault");
    QTest::addColumn<QString>("expected");
    QTest::newRow("always") << "code=9"
                            << "999999";
    QTest::newRow("after") << "code=9,after=2"
                           << "..9999";
    QTest::newRow("times") << "code=9,times=2"
                           << "99....";
    QTest::newRow("both") << "code=9,after=1,times=3"
                          << ".999..";
    QTest::newRow("never") << "code=9,rate=0"
                           << "......";
    QTest::newRow("no times") << "code=9,times=0"
                              << "......";
}

void EmulatorFaultsTest::limits() {
    QFETCH(QString, fault);
    put(fault.toUtf8().constData());
    const ServiceCaller anybody(m_emulator.port());
    QString seen;
    for (int i = 0; i < 6; ++i)
        seen += anybody.post("/v1/accm/list", aPage).code == 9 ? '9' : '.';
    QTEST(seen, "expected");
}

void EmulatorFaultsTest::badSpec_data() {
    QTest::addColumn<QString>("spec");
    for (const char *spec :
         {"nonsense", "", "late", "late=", "late=soon", "late=-1", "status=99", "status", "early=99",
          "cut-body", "slow-body=fast", "reset=1", "wrong-types=colour", "code=1@v1", "code=1,often=2",
          "code=1,times=x", "code=1,rate=2", "code=1,rate=-0.5", "code=1,rate=nan"})
        QTest::newRow(spec) << spec;
}

void EmulatorFaultsTest::badSpec() {
    QFETCH(QString, spec);
    const auto outcome = EmulatorProcess::run({"--root", m_emulator.root() + "-other", "--fault", spec});
    QCOMPARE(outcome.status, 2);
    QVERIFY(outcome.errors.startsWith("nvldm-emulator: --fault: "));
    QVERIFY(m_emulator.command("fault \"" + spec + '"').startsWith("error"));
    QCOMPARE(ServiceCaller(m_emulator.port()).post("/v1/accm/list", aPage).code, 0);
}

NVLDM_GUILESS_TEST(EmulatorFaultsTest)
#include "tst_emulatorfaults.moc"
