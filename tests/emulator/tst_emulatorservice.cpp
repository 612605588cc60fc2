#include "emulatorprocess.h"
#include "servicecaller.h"
#include "support/testmain.h"

#include <QElapsedTimer>
#include <QTest>

#include <openssl/hmac.h>

#include <array>
#include <memory>

namespace {

constexpr auto overview = "DO000000000000";
constexpr auto rootSite = "SR000000000000";
constexpr auto password = "Secret-pass-1";

using Bytes = std::string;

Bytes bytesOfHex(const char *hex) {
    const QByteArray bytes = QByteArray::fromHex(hex);
    return {bytes.constData(), static_cast<std::size_t>(bytes.size())};
}

/// A token as its bytes are written down, with a key and a time of the test's choice.
std::string forgedToken(const Bytes &key, qint64 ageMs) {
    const auto time = static_cast<quint64>(QDateTime::currentMSecsSinceEpoch() - ageMs);
    Bytes text;
    for (int shift = 56; shift >= 0; shift -= 8)
        text += static_cast<char>(time >> shift);
    text += Bytes(16, 'r');
    std::array<unsigned char, EVP_MAX_MD_SIZE> mac{};
    unsigned length = 0;
    HMAC(EVP_sha256(), key.data(), static_cast<int>(key.size()),
         reinterpret_cast<const unsigned char *>(text.data()), text.size(), mac.data(), &length);
    text.append(reinterpret_cast<const char *>(mac.data()), length);
    return "G1:" + QByteArray::fromStdString(text)
                       .toBase64(QByteArray::Base64UrlEncoding | QByteArray::OmitTrailingEquals)
                       .toStdString();
}

const Bytes &tokenKey() {
    static const Bytes key = bytesOfHex("2ecaeb6cddbae6f619a032e234613385068fec96fd04da6e9b6b7fcb74544326");
    return key;
}

Json arrayOf(Json element) {
    // Braces around one element alone do not say whether they mean an array.
    Json array = Json::array();
    array.push_back(std::move(element));
    return array;
}

Json deletionOf(const char *id, const Json &deleted = true) {
    return arrayOf({{"siteid", id}, {"deleted", deleted}});
}

Json site(const char *id, const char *parent, const char *name = "A site") {
    return {{"siteid", id}, {"sitename", name}, {"parentid", parent}};
}

Json newDevice(const char *mac) {
    return {{"id", ""},
            {"d_mac", mac},
            {"d_ip", "10.9.9.9"},
            {"d_model", "NC-4210"},
            {"siteid", arrayOf(overview)}};
}

const Json *withMember(const Json &records, const char *name, const Json &value) {
    for (const Json &record : records)
        if (record.is_object() && record.value(name, Json()) == value)
            return &record;
    return nullptr;
}

} // namespace

class EmulatorServiceTest : public QObject {
    Q_OBJECT

private slots:
    void initTestCase();
    void cleanup();

    void genericToken_data();
    void genericToken();
    void permission_data();
    void permission();
    void renewedToken();
    void firstAccount();

    void siteCommit_data();
    void siteCommit();
    void siteDeletion();

    void deviceUpsert();
    void deviceRemoval();
    void wholeBatch();
    void batchStage_data();
    void batchStage();
    void overdueBatch();

private:
    /// Gives each test that changes something a service of its own.
    void fresh(const QStringList &more = {});
    ServiceCaller caller(const char *email = "boss@x.y");
    QString statusOf(ServiceCaller &from, const std::string &id);

    std::unique_ptr<EmulatorProcess> m_emulator;
};

void EmulatorServiceTest::initTestCase() {
    fresh();
}

void EmulatorServiceTest::cleanup() {
    if (QTest::currentTestFailed())
        qWarning("%s", qPrintable(m_emulator->describe()));
}

void EmulatorServiceTest::fresh(const QStringList &more) {
    const QString suffix = QString(":") + password + ":";
    m_emulator = std::make_unique<EmulatorProcess>();
    QVERIFY(m_emulator->start(QStringList{"--account", "boss@x.y" + suffix + "admin", "--account",
                                          "op@x.y" + suffix + "operator", "--account",
                                          "eye@x.y" + suffix + "viewer"} +
                              more));
}

ServiceCaller EmulatorServiceTest::caller(const char *email) {
    ServiceCaller result(m_emulator->port());
    const Reply reply = result.login(email, password);
    if (reply.code != 0)
        QTest::qFail(("no login: " + reply.error + ' ' + reply.body.dump()).c_str(), __FILE__, __LINE__);
    return result;
}

QString EmulatorServiceTest::statusOf(ServiceCaller &from, const std::string &id) {
    const Json all = from.list("/v1/dstatus/list");
    const Json *status = withMember(all, "id", id);
    return status ? QString::fromStdString(status->at("auth_status")) : QString();
}

void EmulatorServiceTest::genericToken_data() {
    constexpr qint64 minute = 60000;
    const std::string sound = forgedToken(tokenKey(), 0);
    QTest::addColumn<QString>("token");
    QTest::addColumn<int>("code");
    const auto row = [](const char *name, const std::string &token, int code) {
        QTest::newRow(name) << QString::fromStdString(token) << code;
    };
    row("now", sound, 0);
    row("library's", ServiceCaller::genericToken(), 0);
    row("nine minutes old", forgedToken(tokenKey(), 9 * minute), 0);
    row("eleven minutes old", forgedToken(tokenKey(), 11 * minute), 105);
    row("eleven minutes ahead", forgedToken(tokenKey(), -11 * minute), 105);
    row("other key", forgedToken(Bytes(32, 'k'), 0), 105);
    row("none", "", 105);
    row("prefix alone", "G1:", 105);
    row("no prefix", sound.substr(3), 105);
    row("cut", sound.substr(0, sound.size() - 4), 105);
    row("longer", sound + "AAAA", 105);
    row("foreign character", sound.substr(0, 20) + "!" + sound.substr(21), 105);
    row("changed", sound.substr(0, 30) + (sound[30] == 'A' ? "B" : "A") + sound.substr(31), 105);
}

void EmulatorServiceTest::genericToken() {
    QFETCH(QString, token);
    QFETCH(int, code);
    const ServiceCaller anybody(m_emulator->port());
    ServiceCaller::Request list;
    list.path = "/v1/accm/list";
    list.body = R"({"start":0,"count":10})";
    list.token = token.toStdString();
    QCOMPARE(anybody.send(list).code, code);
    ServiceCaller::Request alive;
    alive.verb = "GET";
    alive.path = "/isalive";
    alive.contentType = "text/plain";
    alive.token = token.toStdString();
    QCOMPARE(anybody.send(alive).code, code);
}

void EmulatorServiceTest::permission_data() {
    QTest::addColumn<QString>("path");
    QTest::addColumn<bool>("writes");
    for (const char *path :
         {"/v1/config/set",  "/v1/site/new",         "/v1/site/update",  "/v1/site/rms",
          "/v1/site/commit", "/v1/dev/commit",       "/v1/dev/scan",     "/v1/dev/scanip",
          "/v1/dev/scanips", "/v1/dev/setpolicy",    "/v1/dev/auth",     "/v1/task/init",
          "/v1/task/rm",     "/v1/task/updateState", "/v1/alarm/rm",     "/v1/cgi/commit",
          "/v1/cgi/custom",  "/v1/cgi/customx",      "/v1/assip/auto",   "/v1/assip/manual",
          "/v1/quicksetup",  "/v1/config/config",    "/v1/export/debif", "/v1/gencert"})
        QTest::newRow(path) << path << true;
    for (const char *path : {"/v1/config/get", "/v1/site/list", "/v1/dev/list", "/v1/dev/scanout",
                             "/v1/dstatus/list", "/v1/task/list", "/v1/alarm/list", "/v1/cgi/list"})
        QTest::newRow(path) << path << false;
}

void EmulatorServiceTest::permission() {
    QFETCH(QString, path);
    QFETCH(bool, writes);
    const Json page = {{"start", 0}, {"count", 1}};
    const std::string where = path.toStdString();
    ServiceCaller eye = caller("eye@x.y");
    QCOMPARE(eye.call(where, page).code, writes ? 5 : 0);
    ServiceCaller op = caller("op@x.y");
    QVERIFY(op.call(where, page).code != 5);
}

void EmulatorServiceTest::renewedToken() {
    fresh({"--fault", "renew@/v1/config/get", "--token-grace", "600"});
    ServiceCaller boss = caller();
    const std::string old = boss.token();
    QCOMPARE(boss.call("/v1/config/get").code, 0);
    QVERIFY(boss.token() != old);
    const std::string renewed = boss.token();
    boss.setToken(old);
    QCOMPARE(boss.call("/v1/config/get").code, 0);
    // A request that was under way meanwhile renews nothing: the caller may take the responses in any order.
    QCOMPARE(boss.token(), old);
    QTRY_COMPARE(boss.call("/v1/config/get").code, 105);
    boss.setToken(renewed);
    QCOMPARE(boss.call("/v1/config/get").code, 0);
}

void EmulatorServiceTest::firstAccount() {
    m_emulator = std::make_unique<EmulatorProcess>();
    QVERIFY(m_emulator->start());
    ServiceCaller factory(m_emulator->port());
    const Json page = {{"start", 0}, {"count", 10}};
    Reply members = factory.post("/v1/accm/list", page);
    QVERIFY(members.secret);
    QCOMPARE(members.data.at("total_items").get<int>(), 1);
    QCOMPARE(members.data.at("data").at(0).at("email").get<std::string>(), std::string("admin"));
    QCOMPARE(factory.login("admin", "admin").code, 0);

    Json account = {{"email", "first@x.y"},
                    {"pass", ServiceCaller::cipheredPassword(password)},
                    {"name", "First"},
                    {"permi", "operator"},
                    {"desp", nullptr}};
    QCOMPARE(factory.post("/v1/accm/new", account).code, 3);
    account["permi"] = "admin";
    QCOMPARE(factory.post("/v1/accm/new", account).code, 0);
    members = factory.post("/v1/accm/list", page);
    QCOMPARE(members.data.at("data").size(), std::size_t{1});
    COMPARE_JSON(members.data.at("data").at(0),
                 Json({{"email", "first@x.y"}, {"name", "First"}, {"permi", "admin"}, {"desp", ""}}));
    QCOMPARE(factory.call("/v1/config/get").code, 105);
    QCOMPARE(factory.login("admin", "admin").code, 105);
    QCOMPARE(factory.login("first@x.y", password).code, 0);
}

void EmulatorServiceTest::siteCommit_data() {
    QTest::addColumn<QByteArray>("sites");
    QTest::addColumn<int>("code");
    const auto row = [](const char *name, const Json &sites, int code) {
        QTest::newRow(name) << QByteArray::fromStdString(sites.dump()) << code;
    };
    const auto chain = [](int length) {
        Json sites = Json::array();
        for (int i = 0; i < length; ++i) {
            sites.push_back(site(("SR9" + std::to_string(i)).c_str(),
                                 i == 0 ? rootSite : ("SR9" + std::to_string(i - 1)).c_str()));
        }
        return sites;
    };
    row("nothing", Json::array(), 0);
    row("child before parent", {site("SR2", "SR1"), site("SR1", rootSite)}, 0);
    row("five levels", chain(5), 0);
    row("six levels", chain(6), 3);
    row("its own parent", arrayOf(site("SR1", "SR1")), 3);
    row("cycle of two", {site("SR1", "SR2"), site("SR2", "SR1")}, 3);
    row("unknown parent", {site("SR1", rootSite), site("SR2", "SR404")}, 3);
    row("parent is the overview", arrayOf(site("SR1", overview)), 3);
    row("root itself", arrayOf(site(rootSite, rootSite)), 3);
    row("root deleted", deletionOf(rootSite), 3);
    row("no name", arrayOf({{"siteid", "SR1"}, {"parentid", rootSite}}), 3);
    row("name of another type", arrayOf({{"siteid", "SR1"}, {"sitename", 1}, {"parentid", rootSite}}), 3);
    row("no object", arrayOf("SR1"), 3);
    row("deleted as text", deletionOf("SR1", "true"), 3);
    row("deletion of a site never sent", deletionOf("SR404"), 0);
    row("below a site deleted with it",
        {site("SR1", rootSite), site("SR2", "SR1"), {{"siteid", "SR1"}, {"deleted", true}}}, 0);
}

void EmulatorServiceTest::siteCommit() {
    fresh();
    QFETCH(QByteArray, sites);
    QFETCH(int, code);
    ServiceCaller boss = caller();
    Json expected = boss.list("/v1/site/list");
    const Json sent = Json::parse(sites.toStdString());
    QCOMPARE(boss.call("/v1/site/commit", {{"state", "all"}, {"sites", sent}}).code, code);
    const bool deletes = withMember(sent, "deleted", true) != nullptr;
    if (code == 0 && !deletes)
        expected.insert(expected.end(), sent.begin(), sent.end());
    COMPARE_JSON(boss.list("/v1/site/list", 5), expected);
}

void EmulatorServiceTest::siteDeletion() {
    fresh();
    ServiceCaller boss = caller();
    const Json changes = {site("SR1", rootSite), site("SR2", "SR1"), site("SR3", rootSite)};
    QCOMPARE(boss.call("/v1/site/commit", {{"state", "all"}, {"sites", changes}}).code, 0);
    Json device = boss.list("/v1/dev/list").front();
    device["siteid"] = {overview, "SR1", "SR2", "SR3"};
    QCOMPARE(boss.call("/v1/dev/commit", {{"state", "all"}, {"devices", arrayOf(device)}}).code, 0);

    const Json deletion = deletionOf("SR1");
    QCOMPARE(boss.call("/v1/site/commit", {{"state", "all"}, {"sites", deletion}}).code, 0);
    const Json sites = boss.list("/v1/site/list");
    QVERIFY(!withMember(sites, "siteid", "SR1") && !withMember(sites, "siteid", "SR2"));
    QVERIFY(withMember(sites, "siteid", "SR3"));
    COMPARE_JSON(boss.list("/v1/dev/list").front().at("siteid"), Json({overview, "SR3"}));

    QCOMPARE(boss.call("/v1/site/rms", {{"siteid", "SR3"}}).code, 0);
    QCOMPARE(boss.call("/v1/site/rms", {{"siteid", "SR3"}}).code, 4);
    COMPARE_JSON(boss.list("/v1/dev/list").front().at("siteid"), arrayOf(overview));
}

void EmulatorServiceTest::deviceUpsert() {
    fresh();
    ServiceCaller boss = caller();
    const auto commit = [&](const Json &device) {
        return boss.call("/v1/dev/commit", {{"state", "all"}, {"devices", arrayOf(device)}}).code;
    };
    Json added = newDevice("00-1b-07-aa-bb-0c");
    added["siteid"] = R"(["DO000000000000"])";
    added["x_note"] = {{"kept", {1, 2.5, nullptr}}};
    QCOMPARE(commit(added), 0);
    Json kept = boss.list("/v1/dev/list").back();
    const std::string id = kept.at("id");
    QCOMPARE(id.size(), std::size_t{14});
    COMPARE_JSON(kept.at("x_note"), added.at("x_note"));
    COMPARE_JSON(kept.at("siteid"), arrayOf(overview));
    QCOMPARE(kept.at("d_svrtype").get<std::string>(), std::string("Camera"));

    // The same MAC, written in another way, is the same device.
    const std::string someSite = boss.list("/v1/site/list").front().at("siteid");
    QCOMPARE(commit({{"d_mac", "001B07AABB0C"}, {"d_ip", "10.9.9.10"}, {"siteid", arrayOf(someSite)}}), 0);
    kept = boss.list("/v1/dev/list").back();
    QCOMPARE(kept.at("id").get<std::string>(), id);
    QCOMPARE(kept.at("d_ip").get<std::string>(), std::string("10.9.9.10"));
    COMPARE_JSON(kept.at("siteid"), Json({overview, someSite}));

    // The id outweighs the MAC, which may have been replaced with the device.
    QCOMPARE(commit({{"id", id}, {"d_mac", "00:1B:07:AA:BB:0D"}}), 0);
    QCOMPARE(boss.list("/v1/dev/list").size(), std::size_t{21});
    COMPARE_JSON(boss.list("/v1/dev/list").back().at("siteid"), Json({overview, someSite}));
    QCOMPARE(commit(newDevice("00:1B:07:AA:BB:0C")), 0);
    QCOMPARE(boss.list("/v1/dev/list").size(), std::size_t{22});
}

void EmulatorServiceTest::deviceRemoval() {
    fresh();
    ServiceCaller boss = caller();
    const Json before = boss.list("/v1/dev/list");
    const Json removal = {{{"id", before[3].at("id")}, {"siteid", Json::array()}},
                          {{"d_mac", before[5].at("d_mac")}, {"siteid", "[]"}}};
    QCOMPARE(boss.call("/v1/dev/commit", {{"state", "all"}, {"devices", removal}}).code, 0);
    Json expected = before;
    expected.erase(5);
    expected.erase(3);
    COMPARE_JSON(boss.list("/v1/dev/list"), expected);
    QVERIFY(!withMember(boss.list("/v1/dstatus/list"), "id", before[3].at("id")));
    // It is still on the network, for anybody to find.
    QCOMPARE(boss.call("/v1/dev/scanip", {{"ip", before[3].at("d_ip")}, {"timeout", 5}}).code, 0);
    QTRY_COMPARE(boss.call("/v1/dev/scanout").data.size(), std::size_t{1});
    COMPARE_JSON(boss.call("/v1/dev/scanout").data[0].at("d_mac"), before[3].at("d_mac"));
}

void EmulatorServiceTest::wholeBatch() {
    fresh();
    ServiceCaller boss = caller();
    const auto stage = [&](const char *state, const Json &devices) {
        return boss.call("/v1/dev/commit", {{"state", state}, {"devices", devices}}).code;
    };
    const auto count = [&] { return boss.list("/v1/dev/list").size(); };
    QCOMPARE(stage("start", arrayOf(newDevice("00:1B:07:00:00:01"))), 0);
    QCOMPARE(stage("update", arrayOf(newDevice("00:1B:07:00:00:02"))), 0);
    QCOMPARE(count(), std::size_t{20});
    QCOMPARE(stage("end", arrayOf(newDevice("00:1B:07:00:00:03"))), 0);
    QCOMPARE(count(), std::size_t{23});

    // A second start forgets the first, and one bad record spoils its batch alone.
    QCOMPARE(stage("start", arrayOf(newDevice("00:1B:07:00:00:04"))), 0);
    QCOMPARE(stage("start", arrayOf(newDevice("00:1B:07:00:00:05"))), 0);
    QCOMPARE(stage("end", arrayOf(newDevice("nonsense"))), 3);
    QCOMPARE(count(), std::size_t{23});
    QCOMPARE(stage("end", Json::array()), 3);
}

void EmulatorServiceTest::batchStage_data() {
    QTest::addColumn<QString>("path");
    QTest::addColumn<QString>("list");
    QTest::addColumn<QString>("state");
    for (const auto &[path, list] :
         {std::pair("/v1/dev/commit", "devices"), std::pair("/v1/site/commit", "sites")})
        for (const char *state : {"update", "end", "begin", "", "ALL"})
            QTest::addRow("%s \"%s\"", path, state) << path << list << state;
}

void EmulatorServiceTest::batchStage() {
    QFETCH(QString, path);
    QFETCH(QString, list);
    QFETCH(QString, state);
    ServiceCaller boss = caller();
    const Json body = {{"state", state.toStdString()}, {list.toStdString(), Json::array()}};
    QCOMPARE(boss.call(path.toStdString(), body).code, 3);
}

void EmulatorServiceTest::overdueBatch() {
    fresh({"--batch-timeout", "300"});
    ServiceCaller boss = caller();
    const auto stage = [&](const char *state, const char *mac) {
        return boss.call("/v1/dev/commit", {{"state", state}, {"devices", arrayOf(newDevice(mac))}}).code;
    };
    QCOMPARE(stage("start", "00:1B:07:00:00:01"), 0);
    QTest::qWait(400);
    QCOMPARE(stage("update", "00:1B:07:00:00:02"), 3);
    QCOMPARE(stage("end", "00:1B:07:00:00:03"), 3);
    QCOMPARE(boss.list("/v1/dev/list").size(), std::size_t{20});
}

NVLDM_GUILESS_TEST(EmulatorServiceTest)
#include "tst_emulatorservice.moc"
