#include "api/client/apiclient.h"
#include "api/session/pagereader.h"
#include "api/session/servicerequest.h"
#include "platform/system/processsetup.h"
#include "platform/system/servicecontrol.h"
#include "store/clientstore.h"
#include "store/configstore.h"
#include "store/localstore.h"
#include "support/emulatorprocess.h"
#include "support/isolatedroot.h"
#include "support/logcapture.h"
#include "support/testmain.h"

#include <QTest>

#include <nlohmann/json.hpp>

#include <algorithm>
#include <map>
#include <memory>
#include <set>

namespace {

constexpr const char *account = "admin@example.com";
constexpr const char *password = "Passw0rd!";
constexpr int devicesOfFleet = 620;

/// Reads pages as the program does: until one is short.
template <typename Page>
JSON allOf(Page readPage, int pageSize) {
    JSON all = JSON::array();
    while (true) {
        JSON page;
        if (readPage(static_cast<int>(all.size()), pageSize, page) != ApiOk || !page.is_array())
            return "failed";
        all.insert(all.end(), page.begin(), page.end());
        if (page.size() < static_cast<std::size_t>(pageSize))
            return all;
    }
}

std::set<std::string> idsOf(const JSON &records, const char *member) {
    std::set<std::string> ids;
    for (const JSON &record : records)
        ids.insert(record.value(member, ""));
    return ids;
}

} // namespace

class TestApiClientEmulator : public QObject {
    Q_OBJECT

private slots:
    void initTestCase();
    void init();
    void cleanup();

    void serviceIsFound();
    void login();
    void sessionLimit();
    void pages();
    void clickDuringALongReading();
    void sites();
    void commitOfDevices();
    void discoveryAndAuthorization();
    void uploads();
    void settings();
    void renewedTokenIsGood();
    void faults_data();
    void faults();
    void logout();
    void serviceThatDies();

private:
    /// A fresh client with the session of the last login.
    std::unique_ptr<CApiClient> client() const {
        auto made = std::make_unique<CApiClient>("127.0.0.1", m_emulator.port());
        made->setAccount(account);
        made->setAccessToken(CLocalStore::instance().access().constData());
        return made;
    }
    JSON devices(int pageSize = 500) const {
        return allOf(
            [this](int start, int count, JSON &page) { return client()->listDevices(start, count, page); },
            pageSize);
    }
    JSON listedSites() const {
        return allOf(
            [this](int start, int count, JSON &page) { return client()->listSites(start, count, page); },
            500);
    }

    IsolatedRoot m_root;
    EmulatorProcess m_emulator{m_root.path()};
    std::unique_ptr<LogCapture> m_log;
};

void TestApiClientEmulator::initTestCase() {
    ProcessSetup::ignoreBrokenPipes();
    QVERIFY(m_emulator.start({"--devices", QString::number(devicesOfFleet), "--account",
                              QStringLiteral("%1:%2").arg(account, password)}));
}

void TestApiClientEmulator::init() {
    m_log = std::make_unique<LogCapture>();
    QCOMPARE(CApiClient("127.0.0.1", m_emulator.port()).loginServer(account, password), unsigned(ApiOk));
}

void TestApiClientEmulator::cleanup() {
    m_log.reset();
}

void TestApiClientEmulator::serviceIsFound() {
    QCOMPARE(CConfigStore().serverPort(), m_emulator.port());
    QCOMPARE(ServiceControl::queryLocalService(), LocalServiceState::Running);
    std::uint32_t online = 0;
    QCOMPARE(CApiClient("127.0.0.1", m_emulator.port()).isServerOnline(online), unsigned(ApiOk));
    QCOMPARE(online, 1u);
}

void TestApiClientEmulator::login() {
    CApiClient made("127.0.0.1", m_emulator.port());
    QCOMPARE(made.loginServer(account, "wrong"), unsigned(ApiCode105));
    QCOMPARE(made.loginServer("nobody@example.com", password), unsigned(ApiCode105));
    QCOMPARE(made.loginServer(account, password), unsigned(ApiOk));
    JSON page;
    QCOMPARE(made.listSites(0, 500, page), unsigned(ApiOk));
}

void TestApiClientEmulator::sessionLimit() {
    EmulatorProcess other(m_root.filePath("other"));
    QVERIFY(other.start({"--session-limit", "1"}));
    CApiClient first("127.0.0.1", other.port());
    QCOMPARE(first.loginServer("admin", "admin"), unsigned(ApiOk));
    CApiClient second("127.0.0.1", other.port());
    QCOMPARE(second.loginServer("admin", "admin"), unsigned(ApiCode108));
    QCOMPARE(first.logoutServer("any"), unsigned(ApiOk));
    QCOMPARE(second.loginServer("admin", "admin"), unsigned(ApiOk));
}

void TestApiClientEmulator::pages() {
    const JSON all = devices(500);
    QCOMPARE(all.size(), std::size_t(devicesOfFleet));
    const std::set<std::string> ids = idsOf(all, "id");
    QCOMPARE(ids.size(), std::size_t(devicesOfFleet));
    QVERIFY(idsOf(devices(310), "id") == ids);
    const JSON statuses = allOf(
        [this](int start, int count, JSON &page) { return client()->listDeviceStatus(start, count, page); },
        500);
    QVERIFY(idsOf(statuses, "id") == ids);
    QVERIFY(statuses[0].contains("connect_status") && statuses[0].contains("auth_status"));
    JSON page;
    QCOMPARE(client()->listDevices(devicesOfFleet, 500, page), unsigned(ApiOk));
    QCOMPARE(page.dump(), "[]");
}

/// What a user does waits for one request of a reading, however many pages that has.
void TestApiClientEmulator::clickDuringALongReading() {
    constexpr int late = 250;
    constexpr int pageSize = 31;
    CLocalStore::instance().setLoginInfo("127.0.0.1", m_emulator.port(), account,
                                         CLocalStore::instance().access());
    QVERIFY(m_emulator.command(QStringLiteral("fault late=%1@/v1/").arg(late)).startsWith("ok"));
    int pagesRead = 0;
    int pagesAtClick = 0;
    unsigned reading = ApiException;
    unsigned clicked = ApiException;
    QVERIFY(ServiceRequest::post(
        NetJob::createRunner("reading", NetTask::Turn::Reading), this,
        [&pagesRead](ServiceSession &session) {
            return PageReader::readAll(session, &CApiClient::listDevices, pageSize,
                                       [&](JSON &) { ++pagesRead; });
        },
        [&](unsigned result) { reading = result; }));
    QTest::qWait(3 * late / 2);
    QVERIFY(ServiceRequest::post(
        NetJob::createRunner("click"), this,
        [&](ServiceSession &session) {
            pagesAtClick = pagesRead;
            JSON settings;
            return session.call([&](CApiClient &client) { return client.loadServerSettings(settings); });
        },
        [&](unsigned result) { clicked = result; }));
    QTRY_COMPARE_WITH_TIMEOUT(reading, unsigned(ApiOk), 60000);
    QCOMPARE(m_emulator.command("faults clear"), "ok");
    QCOMPARE(clicked, unsigned(ApiOk));
    QCOMPARE(pagesRead, devicesOfFleet / pageSize + 1);
    QVERIFY2(pagesAtClick <= 4, qPrintable(QString::number(pagesAtClick)));
}

void TestApiClientEmulator::sites() {
    const std::size_t before = listedSites().size();
    std::string top;
    std::string below;
    QCOMPARE(client()->addSite("Zürich", nullptr, top), unsigned(ApiOk));
    QCOMPARE(client()->addSite("Halle 1", top.c_str(), below), unsigned(ApiOk));
    QCOMPARE(client()->addSite("nowhere", "SR999", below), unsigned(ApiServerError));
    QCOMPARE(client()->updateSite(below.c_str(), "Halle 2", top.c_str()), unsigned(ApiOk));
    std::map<std::string, JSON> byId;
    for (const JSON &site : listedSites())
        byId[site.value("siteid", "")] = site;
    QCOMPARE(byId.size(), before + 2);
    QCOMPARE(byId[top].value("sitename", ""), "Zürich");
    QCOMPARE(byId[top].value("parentid", ""), "SR000000000000");
    QCOMPARE(byId[below].value("sitename", ""), "Halle 2");
    QCOMPARE(byId[below].value("parentid", ""), top);

    const JSON made = {{"siteid", "SR1700000000000"}, {"sitename", "C"}, {"parentid", below}};
    QCOMPARE(client()->commitSites(JSON::array({made}), "all"), unsigned(ApiOk));
    QCOMPARE(listedSites().size(), before + 3);
    QCOMPARE(client()->removeSite("SR1700000000000"), unsigned(ApiOk));
    QCOMPARE(client()->commitSites(JSON::array({{{"siteid", top}, {"deleted", true}}}), "all"),
             unsigned(ApiOk));
    QCOMPARE(listedSites().size(), before);
}

void TestApiClientEmulator::commitOfDevices() {
    const JSON all = devices();
    JSON changed = {all[0], all[1]};
    changed[0]["d_hostname"] = "Eingang \"Süd\"";
    changed[1]["siteid"] = JSON::array();
    QCOMPARE(client()->commitDevices(changed, "all"), unsigned(ApiOk));
    JSON after = devices();
    QCOMPARE(after.size(), all.size() - 1);
    const auto isFirst = [&](const JSON &device) { return device["id"] == all[0]["id"]; };
    QCOMPARE(std::find_if(after.begin(), after.end(), isFirst)->value("d_hostname", ""), "Eingang \"Süd\"");

    JSON removed = {after[5], after[6], after[7]};
    for (JSON &device : removed)
        device["siteid"] = JSON::array();
    QCOMPARE(client()->commitDevices(JSON::array({removed[0]}), "start"), unsigned(ApiOk));
    QCOMPARE(client()->commitDevices(JSON::array({removed[1]}), "update"), unsigned(ApiOk));
    QCOMPARE(devices().size(), after.size());
    QCOMPARE(client()->commitDevices(JSON::array({removed[2]}), "end"), unsigned(ApiOk));
    QCOMPARE(devices().size(), after.size() - 3);
}

void TestApiClientEmulator::discoveryAndAuthorization() {
    QCOMPARE(client()->deviceDiscoverByIPs("10.99.0.10", "10.99.0.12", 1), unsigned(ApiOk));
    JSON found;
    QTRY_COMPARE_WITH_TIMEOUT((client()->discoveredDevices(found), found.size()), std::size_t(3), 15000);
    QCOMPARE(found[0].value("id", "none"), "");
    const JSON ids = JSON::array({devices()[0]["id"]});
    QCOMPARE(client()->authDevices(ids, "root", "Passw0rd!"), unsigned(ApiOk));
    QCOMPARE(client()->authDevices(JSON::array({"DVffffffffffff"}), "root", "Passw0rd!"),
             unsigned(ApiServerError));
}

void TestApiClientEmulator::uploads() {
    QVERIFY(m_root.write("a.bin", QByteArray(3u << 20, 'x')));
    const QByteArray path = m_root.filePath("a.bin").toUtf8();
    const JSON one = JSON::array({devices()[0].at("id")});
    const auto taskOf = [&](const char *type) {
        JSON task;
        return client()->newTaskState(type, one, task) == ApiOk ? task.value("tid", "") : std::string();
    };
    const std::string config = taskOf("deviceConfigFileUpload");
    QCOMPARE(client()->uploadConfigFile(config.c_str(), path, "a.bin", one), unsigned(ApiOk));
    QCOMPARE(client()->uploadConfigFile(config.c_str(), path, "a.bin", one), unsigned(ApiServerError));
    QCOMPARE(client()->uploadPackage(taskOf("devicePackageUpload").c_str(), path, "a.bin", one, false),
             unsigned(ApiOk));
    for (const bool isHere : {false, true}) {
        QVERIFY(CClientStore::instance().setThisComputer(isHere));
        CLocalStore &store = CLocalStore::instance();
        store.setLoginInfo("127.0.0.1", m_emulator.port(), account, store.access(), isHere);
        QCOMPARE(client()->uploadFWFile(taskOf("deviceFWUpgrade").c_str(), path, "a.bin"), unsigned(ApiOk));
    }
    QCOMPARE(client()->exportFile(config.c_str(), m_root.filePath("a.zip").toUtf8()),
             unsigned(ApiServerError));
    QVERIFY(!QFile::exists(m_root.filePath("a.zip")));
}

void TestApiClientEmulator::settings() {
    JSON before;
    QCOMPARE(client()->loadServerSettings(before), unsigned(ApiOk));
    const int days = before.at("log_keepdays").get<int>() == 30 ? 60 : 30;
    QCOMPARE(client()->saveServerSettings({{"log_keepdays", days}}), unsigned(ApiOk));
    JSON after;
    QCOMPARE(client()->loadServerSettings(after), unsigned(ApiOk));
    before["log_keepdays"] = days;
    QCOMPARE(after.dump(), before.dump());
}

void TestApiClientEmulator::renewedTokenIsGood() {
    QCOMPARE(m_emulator.command("fault renew,times=1"), "ok");
    const auto first = client();
    const std::string before = first->accessToken();
    JSON page;
    QCOMPARE(first->listSites(0, 1, page), unsigned(ApiOk));
    QVERIFY(first->accessToken() != before);
    QCOMPARE(first->listSites(0, 1, page), unsigned(ApiOk));
    QCOMPARE(m_emulator.command("faults clear"), "ok");
}

void TestApiClientEmulator::faults_data() {
    QTest::addColumn<QString>("fault");
    QTest::addColumn<unsigned>("result");
    QTest::newRow("status=500") << "status=500" << 13u;
    QTest::newRow("status=401") << "status=401" << 13u;
    QTest::newRow("not-json") << "not-json" << 1u;
    QTest::newRow("wrong code") << "wrong-types=code" << 1u;
    QTest::newRow("no-data") << "no-data" << 14u;
    QTest::newRow("bad-cipher") << "bad-cipher" << 1u;
    QTest::newRow("code=4") << "code=4" << 15u;
    QTest::newRow("code=105") << "code=105" << 17u;
    QTest::newRow("code=108") << "code=108" << 18u;
    QTest::newRow("expire") << "expire" << 17u;
    QTest::newRow("reset") << "reset" << 12u;
    QTest::newRow("drip") << "drip" << 12u;
    QTest::newRow("no-answer") << "no-answer" << 12u;
}

void TestApiClientEmulator::faults() {
    QFETCH(QString, fault);
    QFETCH(unsigned, result);
    QCOMPARE(m_emulator.command("fault " + fault + "@/v1/dev/list,times=1"), "ok");
    const auto made = client();
    made->setTotalTimeout(std::chrono::seconds(2));
    JSON page;
    QCOMPARE(made->listDevices(0, 500, page), result);
    QVERIFY(page.is_null());
    QCOMPARE(m_emulator.command("faults clear"), "ok");
    init();
    QCOMPARE(client()->listDevices(0, 500, page), unsigned(ApiOk));
}

void TestApiClientEmulator::logout() {
    QCOMPARE(client()->logoutServer("any"), unsigned(ApiOk));
    JSON page;
    QCOMPARE(client()->listSites(0, 1, page), unsigned(ApiCode105));
    QCOMPARE(client()->logoutServer("any"), unsigned(ApiCode105));
}

void TestApiClientEmulator::serviceThatDies() {
    m_emulator.kill();
    JSON page;
    std::uint32_t online = 1;
    QCOMPARE(client()->listSites(0, 1, page), unsigned(ApiTransportError));
    QCOMPARE(client()->isServerOnline(online), unsigned(ApiTransportError));
    QCOMPARE(online, 0u);
}

NVLDM_GUILESS_TEST(TestApiClientEmulator)
#include "tst_apiclient_emulator.moc"
