#include "emulatorprocess.h"
#include "servicecaller.h"

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
    for (int shift = 56; shift >= 0; shift -= 8) {
        text += static_cast<char>(time >> shift);
    }
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
    for (const Json &record : records) {
        if (record.is_object() && record.value(name, Json()) == value) {
            return &record;
        }
    }
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
    void judging_data();
    void judging();
    void permission_data();
    void permission();
    void loginOutcome_data();
    void loginOutcome();
    void sessionLimit();
    void logoutEndsTheSession();
    void renewedToken();
    void refusalRenewsNothing();
    void firstAccount();
    void takenEmail();
    void changedPassword();
    void settings();

    void siteCommit_data();
    void siteCommit();
    void siteDeletion();
    void singleSites();

    void paging();
    void deviceUpsert();
    void deviceCommitRefused_data();
    void deviceCommitRefused();
    void deviceRemoval();
    void wholeBatch();
    void batchStage_data();
    void batchStage();
    void overdueBatch();
    void batchOfAnotherSession();

    void authorization_data();
    void authorization();
    void blockedAccount();
    void passwordPolicy();
    void scanResults_data();
    void scanResults();
    void foundDeviceIsAdded();

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
    if (QTest::currentTestFailed()) {
        qWarning("%s", qPrintable(m_emulator->describe()));
    }
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
    if (reply.code != 0) {
        QTest::qFail(("no login: " + reply.error + ' ' + reply.body.dump()).c_str(), __FILE__, __LINE__);
    }
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

void EmulatorServiceTest::judging_data() {
    QTest::addColumn<QString>("verb");
    QTest::addColumn<QString>("path");
    QTest::addColumn<QString>("type");
    QTest::addColumn<QString>("body");
    QTest::addColumn<bool>("session");
    QTest::addColumn<int>("status");
    QTest::addColumn<int>("code");
    const QString form = "application/x-www-form-urlencoded";
    const QString page = R"({"id":"boss@x.y","start":0,"count":5})";
    const auto row = [](const char *name, const char *verb, const char *path, const QString &type,
                        const QString &body, bool session, int status, int code) {
        QTest::newRow(name) << verb << path << type << body << session << status << code;
    };
    const auto list = "/v1/dev/list";
    row("sound", "POST", list, form, page, true, 200, 0);
    row("with charset", "POST", list, form + "; charset=utf-8", page, true, 200, 0);
    row("other content type", "POST", list, "application/json", page, true, 200, 3);
    row("longer content type", "POST", list, form + "x", page, true, 200, 3);
    row("unknown path", "POST", "/v1/dev/lists", form, page, true, 404, -1);
    row("path below", "POST", "/v1/dev/list/", form, page, true, 404, -1);
    row("GET", "GET", list, form, "", true, 405, -1);
    row("PUT", "PUT", list, form, page, true, 405, -1);
    row("POST to alive", "POST", "/isalive", form, "", false, 405, -1);
    row("no JSON", "POST", list, form, "id=boss", true, 200, 3);
    row("empty", "POST", list, form, "", true, 200, 3);
    row("an array", "POST", list, form, "[]", true, 200, 3);
    row("broken UTF-8", "POST", list, form, QString(page).replace("boss", QString(QChar(0xd800))), true, 200,
        105);
    row("nested", "POST", list, form,
        R"({"id":"boss@x.y","x":)" + QString(5000, '[') + QString(5000, ']') + "}", true, 200, 3);
    row("no id", "POST", list, form, R"({"start":0,"count":5})", true, 200, 3);
    row("id of another type", "POST", list, form, R"({"id":7,"start":0,"count":5})", true, 200, 3);
    row("somebody else's id", "POST", list, form, R"({"id":"op@x.y","start":0,"count":5})", true, 200, 105);
    row("generic token", "POST", list, form, page, false, 200, 105);
    row("start missing", "POST", list, form, R"({"id":"boss@x.y","count":5})", true, 200, 3);
    row("start as text", "POST", list, form, R"({"id":"boss@x.y","start":"0","count":5})", true, 200, 3);
    row("start below 0", "POST", list, form, R"({"id":"boss@x.y","start":-1,"count":5})", true, 200, 3);
    row("count broken", "POST", list, form, R"({"id":"boss@x.y","start":0,"count":1.5})", true, 200, 3);
    row("too long", "POST", list, form, QString(17 << 20, ' '), true, 413, -1);
    row("nearly too long", "POST", list, form, page + QString(15 << 20, ' '), true, 200, 0);
}

void EmulatorServiceTest::judging() {
    QFETCH(QString, verb);
    QFETCH(QString, path);
    QFETCH(QString, type);
    QFETCH(QString, body);
    QFETCH(bool, session);
    ServiceCaller boss = caller();
    ServiceCaller::Request request;
    request.verb = verb.toStdString();
    request.path = path.toStdString();
    request.body = body.toStdString();
    request.contentType = type.toStdString();
    request.token = session ? boss.token() : ServiceCaller::genericToken();
    const Reply reply = boss.send(request);
    QTEST(reply.status, "status");
    QTEST(reply.code, "code");
}

void EmulatorServiceTest::permission_data() {
    QTest::addColumn<QString>("path");
    QTest::addColumn<bool>("writes");
    for (const char *path : {"/v1/config/set", "/v1/site/new", "/v1/site/update", "/v1/site/rms",
                             "/v1/site/commit", "/v1/dev/commit", "/v1/dev/scan", "/v1/dev/scanip",
                             "/v1/dev/scanips", "/v1/dev/setpolicy", "/v1/dev/auth"}) {
        QTest::newRow(path) << path << true;
    }
    for (const char *path : {"/v1/config/get", "/v1/site/list", "/v1/dev/list", "/v1/dev/scanout",
                             "/v1/dstatus/list", "/v1/task/list", "/v1/alarm/list"}) {
        QTest::newRow(path) << path << false;
    }
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

void EmulatorServiceTest::loginOutcome_data() {
    QTest::addColumn<QString>("email");
    QTest::addColumn<QString>("cipher");
    QTest::addColumn<int>("code");
    const QString right = QString::fromStdString(ServiceCaller::cipheredPassword(password));
    const QString wrong = QString::fromStdString(ServiceCaller::cipheredPassword("Secret-pass-2"));
    QTest::newRow("right") << "boss@x.y" << right << 0;
    QTest::newRow("other case of the e-mail") << "Boss@X.y" << right << 0;
    QTest::newRow("wrong password") << "boss@x.y" << wrong << 105;
    QTest::newRow("unknown account") << "nobody@x.y" << right << 105;
    QTest::newRow("factory account is replaced") << "admin" << right << 105;
    QTest::newRow("plain password") << "boss@x.y" << QString(password) << 105;
    QTest::newRow("tampered") << "boss@x.y" << right.left(right.size() - 6) + "AAAAA=" << 105;
    QTest::newRow("empty") << "boss@x.y" << QString() << 105;
}

void EmulatorServiceTest::loginOutcome() {
    QFETCH(QString, email);
    QFETCH(QString, cipher);
    const ServiceCaller anybody(m_emulator->port());
    const Reply reply =
        anybody.post("/v1/login", {{"email", email.toStdString()}, {"pass", cipher.toStdString()}});
    QTEST(reply.code, "code");
    QCOMPARE(reply.token.size(), reply.code == 0 ? std::size_t{43} : std::size_t{0});
}

void EmulatorServiceTest::sessionLimit() {
    fresh({"--session-limit", "2"});
    ServiceCaller first = caller();
    caller();
    ServiceCaller third(m_emulator->port());
    QCOMPARE(third.login("boss@x.y", password).code, 108);
    QCOMPARE(third.login("boss@x.y", "wrong").code, 105);
    QCOMPARE(first.call("/v1/logout").code, 0);
    QCOMPARE(third.login("boss@x.y", password).code, 0);
}

void EmulatorServiceTest::logoutEndsTheSession() {
    fresh();
    ServiceCaller boss = caller();
    ServiceCaller other = caller();
    QCOMPARE(boss.call("/v1/logout").code, 0);
    QCOMPARE(boss.call("/v1/config/get").code, 105);
    QCOMPARE(other.call("/v1/config/get").code, 0);
}

void EmulatorServiceTest::renewedToken() {
    fresh({"--fault", "renew@/v1/config/get,times=1", "--token-grace", "600"});
    ServiceCaller boss = caller();
    const std::string old = boss.token();
    QCOMPARE(boss.call("/v1/config/get").code, 0);
    QVERIFY(boss.token() != old);
    const std::string renewed = boss.token();
    boss.setToken(old);
    QCOMPARE(boss.call("/v1/config/get").code, 0);
    QTRY_COMPARE(boss.call("/v1/config/get").code, 105);
    boss.setToken(renewed);
    QCOMPARE(boss.call("/v1/config/get").code, 0);
}

void EmulatorServiceTest::refusalRenewsNothing() {
    fresh({"--fault", "renew"});
    ServiceCaller boss = caller();
    QVERIFY(boss.call("/v1/dev/list").token.empty());
    QVERIFY(!boss.call("/v1/site/list", {{"start", 0}, {"count", 1}}).token.empty());
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

void EmulatorServiceTest::takenEmail() {
    fresh();
    const ServiceCaller anybody(m_emulator->port());
    Json account = {
        {"email", "OP@x.y"}, {"pass", ServiceCaller::cipheredPassword(password)}, {"permi", "viewer"}};
    QCOMPARE(anybody.post("/v1/accm/new", account).code, 107);
    account["email"] = "new@x.y";
    account["permi"] = "owner";
    QCOMPARE(anybody.post("/v1/accm/new", account).code, 3);
    account["permi"] = "viewer";
    account["pass"] = password;
    QCOMPARE(anybody.post("/v1/accm/new", account).code, 3);
    account["pass"] = ServiceCaller::cipheredPassword(password);
    QCOMPARE(anybody.post("/v1/accm/new", account).code, 0);
    QCOMPARE(anybody.post("/v1/accm/list", {{"start", 3}, {"count", 10}}).data.at("data").size(),
             std::size_t{1});
}

void EmulatorServiceTest::changedPassword() {
    fresh();
    ServiceCaller boss = caller();
    const auto change = [&](const char *email, const char *old, const char *fresh) {
        return boss
            .post("/v1/accm/revpas", {{"email", email},
                                      {"old", ServiceCaller::cipheredPassword(old)},
                                      {"new", ServiceCaller::cipheredPassword(fresh)}})
            .code;
    };
    QCOMPARE(change("boss@x.y", "not it", "Other-pass-2"), 106);
    QCOMPARE(change("nobody@x.y", password, "Other-pass-2"), 4);
    QCOMPARE(change("boss@x.y", password, ""), 3);
    QCOMPARE(change("boss@x.y", password, "Other-pass-2"), 0);
    ServiceCaller again(m_emulator->port());
    QCOMPARE(again.login("boss@x.y", password).code, 105);
    QCOMPARE(again.login("boss@x.y", "Other-pass-2").code, 0);
}

void EmulatorServiceTest::settings() {
    fresh();
    ServiceCaller boss = caller();
    const Json before = boss.call("/v1/config/get").data;
    QCOMPARE(boss.call("/v1/config/set", {{"nf_alarms", false}, {"days", 45}, {"unheard_of", 1}}).code, 0);
    Json expected = before;
    expected["nf_alarms"] = false;
    expected["log_keepdays"] = 45;
    COMPARE_JSON(boss.call("/v1/config/get").data, expected);
    QCOMPARE(boss.call("/v1/config/set", {{"nf_tasks", false}, {"rp_keepnum", "3"}}).code, 3);
    QCOMPARE(boss.call("/v1/config/set", {{"log_keepdays", -1}}).code, 3);
    COMPARE_JSON(boss.call("/v1/config/get").data, expected);
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
    if (code == 0 && !deletes) {
        expected.insert(expected.end(), sent.begin(), sent.end());
    }
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

void EmulatorServiceTest::singleSites() {
    fresh();
    ServiceCaller boss = caller();
    const Reply top = boss.call("/v1/site/new", {{"sitename", "Top"}});
    QVERIFY(top.secret);
    const std::string topId = top.data.at("siteid");
    QCOMPARE(topId.substr(0, 2), std::string("SR"));
    const std::string below =
        boss.call("/v1/site/new", {{"sitename", "Below"}, {"parentid", topId}}).data.at("siteid");
    COMPARE_JSON(*withMember(boss.list("/v1/site/list"), "siteid", below),
                 site(below.c_str(), topId.c_str(), "Below"));
    const auto update = [&](const std::string &id, const std::string &parent) {
        return boss.call("/v1/site/update", {{"siteid", id}, {"sitename", "Renamed"}, {"parentid", parent}})
            .code;
    };
    QCOMPARE(update(below, rootSite), 0);
    QCOMPARE(update(topId, below), 0);
    QCOMPARE(update(below, topId), 3);
    QCOMPARE(update("SR404", rootSite), 4);
    QCOMPARE(update(below, "SR404"), 3);
    COMPARE_JSON(*withMember(boss.list("/v1/site/list"), "siteid", below),
                 site(below.c_str(), rootSite, "Renamed"));
}

void EmulatorServiceTest::paging() {
    ServiceCaller boss = caller();
    const Json whole = boss.list("/v1/dev/list");
    QCOMPARE(whole.size(), std::size_t{20});
    COMPARE_JSON(boss.list("/v1/dev/list", 7), whole);
    const Json statuses = boss.list("/v1/dstatus/list", 3);
    QCOMPARE(statuses.size(), whole.size());
    for (std::size_t i = 0; i < whole.size(); ++i) {
        COMPARE_JSON(statuses[i].at("id"), whole[i].at("id"));
    }
    COMPARE_JSON(boss.call("/v1/dev/list", {{"start", 20}, {"count", 5}}).data, Json::array());
    COMPARE_JSON(boss.call("/v1/dev/list", {{"start", 0}, {"count", 0}}).data, Json::array());
    QVERIFY(boss.call("/v1/dev/list", {{"start", 0}, {"count", 1}}).secret);
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

void EmulatorServiceTest::deviceCommitRefused_data() {
    QTest::addColumn<QByteArray>("bad");
    QTest::addColumn<int>("code");
    const auto row = [](const char *name, Json changes, int code) {
        Json device = newDevice("00:1B:07:00:00:01");
        device.update(changes);
        QTest::newRow(name) << QByteArray::fromStdString(device.dump()) << code;
    };
    row("unknown id", {{"id", "DV000000000404"}}, 4);
    row("unknown site", {{"siteid", {overview, "SR404"}}}, 4);
    row("removal of nothing", {{"siteid", Json::array()}}, 4);
    row("no MAC", {{"d_mac", ""}}, 3);
    row("broken MAC", {{"d_mac", "00:1B:07:00:00"}}, 3);
    row("port as text", {{"d_http", "80"}}, 3);
    row("model as number", {{"d_model", 4210}}, 3);
    row("flag as number", {{"https_enable", 1}}, 3);
    row("policy as text", {{"d_policy", "strong"}}, 3);
    row("sites as object", {{"siteid", Json::object()}}, 3);
    row("sites as other text", {{"siteid", "SR1"}}, 3);
    row("site as number", {{"siteid", arrayOf(1)}}, 3);
    QTest::newRow("no object") << QByteArray("[]") << 3;
}

void EmulatorServiceTest::deviceCommitRefused() {
    QFETCH(QByteArray, bad);
    ServiceCaller boss = caller();
    const Json before = boss.list("/v1/dev/list");
    Json renamed = before.front();
    renamed["d_hostname"] = "renamed";
    const Json devices = {renamed, newDevice("00:1B:07:00:00:02"), Json::parse(bad.toStdString())};
    QTEST(boss.call("/v1/dev/commit", {{"state", "all"}, {"devices", devices}}).code, "code");
    COMPARE_JSON(boss.list("/v1/dev/list"), before);
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
         {std::pair("/v1/dev/commit", "devices"), std::pair("/v1/site/commit", "sites")}) {
        for (const char *state : {"update", "end", "begin", "", "ALL"}) {
            QTest::addRow("%s \"%s\"", path, state) << path << list << state;
        }
    }
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

void EmulatorServiceTest::batchOfAnotherSession() {
    fresh();
    ServiceCaller boss = caller();
    ServiceCaller op = caller("op@x.y");
    const Json devices = arrayOf(newDevice("00:1B:07:00:00:01"));
    QCOMPARE(boss.call("/v1/dev/commit", {{"state", "start"}, {"devices", devices}}).code, 0);
    QCOMPARE(op.call("/v1/dev/commit", {{"state", "end"}, {"devices", Json::array()}}).code, 3);
    QCOMPARE(boss.call("/v1/site/commit", {{"state", "end"}, {"sites", Json::array()}}).code, 3);
    QCOMPARE(boss.call("/v1/dev/commit", {{"state", "end"}, {"devices", Json::array()}}).code, 0);
}

void EmulatorServiceTest::authorization_data() {
    QTest::addColumn<QString>("account");
    QTest::addColumn<QString>("password");
    QTest::addColumn<QString>("connect");
    QTest::addColumn<QString>("outcome");
    QTest::newRow("right") << "root"
                           << "longenough"
                           << "Connected"
                           << "Authorized";
    QTest::newRow("wrong") << "root"
                           << "wrong"
                           << "Connected"
                           << "Invalid Password";
    QTest::newRow("short") << "root"
                           << "1234567"
                           << "Connected"
                           << "Invalid Password";
    QTest::newRow("other account") << "guest"
                                   << "longenough"
                                   << "Connected"
                                   << "Access Denied";
    QTest::newRow("out of reach") << "root"
                                  << "longenough"
                                  << "Unreachable"
                                  << "Unauthorized";
}

void EmulatorServiceTest::authorization() {
    fresh();
    QFETCH(QString, account);
    QFETCH(QString, password);
    QFETCH(QString, connect);
    QFETCH(QString, outcome);
    ServiceCaller boss = caller();
    QCOMPARE(
        boss.call("/v1/dev/commit", {{"state", "all"}, {"devices", arrayOf(newDevice("00:1B:07:00:00:01"))}})
            .code,
        0);
    const Json device = boss.list("/v1/dev/list").back();
    const std::string id = device.at("id");
    QVERIFY(!device.contains("d_fw"));
    QCOMPARE(statusOf(boss, id), QString("Unauthorized"));
    QVERIFY(m_emulator->command("status " + QString::fromStdString(id) + " - " + connect + " -")
                .startsWith("ok"));

    const Json body = {{"devices", arrayOf(id)},
                       {"acc", account.toStdString()},
                       {"pass", ServiceCaller::cipheredPassword(password.toStdString())}};
    QCOMPARE(boss.call("/v1/dev/auth", body).code, 0);
    QCOMPARE(statusOf(boss, id), QString("Unauthorized"));
    if (connect == "Unreachable") {
        QTest::qWait(1200);
    }
    QTRY_COMPARE(statusOf(boss, id), outcome);
    const Json known = boss.list("/v1/dev/list").back();
    QCOMPARE(known.contains("d_fw") && known.contains("d_hostname"), outcome == "Authorized");
}

void EmulatorServiceTest::blockedAccount() {
    fresh();
    ServiceCaller boss = caller();
    const std::string id = boss.list("/v1/dev/list").front().at("id");
    QVERIFY(m_emulator->command(QString::fromStdString("status " + id + " Unauthorized Connected -"))
                .startsWith("ok"));
    const auto offer = [&](const char *secret) {
        const Json body = {{"devices", arrayOf({{"id", id}})},
                           {"acc", "root"},
                           {"pass", ServiceCaller::cipheredPassword(secret)}};
        return boss.call("/v1/dev/auth", body).code;
    };
    QCOMPARE(offer("wrong"), 0);
    QTRY_COMPARE(statusOf(boss, id), QString("Invalid Password"));
    QCOMPARE(offer("wrong"), 0);
    QCOMPARE(offer("wrong"), 0);
    QTRY_COMPARE(statusOf(boss, id), QString("Account Blocked"));
    QCOMPARE(offer("longenough"), 0);
    QTest::qWait(1200);
    QCOMPARE(statusOf(boss, id), QString("Account Blocked"));

    const Json unknown = {
        {"devices", arrayOf("DV404")}, {"acc", "root"}, {"pass", ServiceCaller::cipheredPassword("x")}};
    QCOMPARE(boss.call("/v1/dev/auth", unknown).code, 4);
    QCOMPARE(boss.call("/v1/dev/auth", {{"devices", arrayOf(id)}, {"acc", "root"}, {"pass", "plain"}}).code,
             3);
}

void EmulatorServiceTest::passwordPolicy() {
    fresh();
    ServiceCaller boss = caller();
    const Json id = boss.list("/v1/dev/list").front().at("id");
    const auto set = [&](const Json &devices, const Json &type) {
        return boss
            .call("/v1/dev/setpolicy", {{"devices", devices}, {"plen", 12}, {"type", type}, {"tid", "T1"}})
            .code;
    };
    QCOMPARE(set(arrayOf(id), "11"), 0);
    COMPARE_JSON(boss.list("/v1/dev/list").front().at("d_policy"), Json({{"plen", 12}, {"type", 11}}));
    QCOMPARE(set(arrayOf(id), 11), 3);
    QCOMPARE(set(arrayOf(id), "eleven"), 3);
    QCOMPARE(set({id, "DV404"}, "7"), 4);
    QCOMPARE(boss.list("/v1/dev/list").front().at("d_policy").at("type").get<int>(), 11);
}

void EmulatorServiceTest::scanResults_data() {
    QTest::addColumn<QString>("path");
    QTest::addColumn<QByteArray>("body");
    QTest::addColumn<int>("code");
    QTest::addColumn<int>("unmanaged");
    const auto row = [](const char *name, const char *path, const char *body, int code, int unmanaged) {
        QTest::newRow(name) << path << QByteArray(body) << code << unmanaged;
    };
    row("network", "/v1/dev/scan", R"({"timeout":5})", 0, 40);
    row("no time", "/v1/dev/scan", R"({"timeout":0})", 3, 0);
    row("address", "/v1/dev/scanip", R"({"ip":"10.99.0.12","timeout":5})", 0, 1);
    row("address and port", "/v1/dev/scanip", R"({"ip":"10.99.0.10:80","timeout":5})", 0, 1);
    row("closed port", "/v1/dev/scanip", R"({"ip":"10.99.0.10:81","timeout":5})", 0, 0);
    row("nobody there", "/v1/dev/scanip", R"({"ip":"10.99.0.9","timeout":5})", 0, 0);
    row("no address", "/v1/dev/scanip", R"({"ip":"10.99.0","timeout":5})", 3, 0);
    row("no port", "/v1/dev/scanip", R"({"ip":"10.99.0.12:http","timeout":5})", 3, 0);
    row("range", "/v1/dev/scanips", R"({"ip_start":"10.99.0.1","ip_end":"10.99.0.19","timeout":5})", 0, 10);
    row("range of one", "/v1/dev/scanips", R"({"ip_start":"10.99.0.49","ip_end":"10.99.0.49","timeout":5})",
        0, 1);
    row("backward", "/v1/dev/scanips", R"({"ip_start":"10.99.0.19","ip_end":"10.99.0.1","timeout":5})", 3, 0);
}

void EmulatorServiceTest::scanResults() {
    QFETCH(QString, path);
    QFETCH(QByteArray, body);
    QFETCH(int, code);
    QFETCH(int, unmanaged);
    ServiceCaller boss = caller();
    // An earlier scan's results must not be taken for this one's.
    QCOMPARE(boss.call("/v1/dev/scanip", {{"ip", "10.99.0.1"}, {"timeout", 5}}).code, 0);
    QCOMPARE(boss.call(path.toStdString(), Json::parse(body.toStdString())).code, code);
    COMPARE_JSON(boss.call("/v1/dev/scanout").data, Json::array());
    const auto found = [&] {
        int count = 0;
        for (const Json &device : boss.call("/v1/dev/scanout").data) {
            count += device.at("id") == "" ? 1 : 0;
        }
        return count;
    };
    QTRY_COMPARE_WITH_TIMEOUT(found(), unmanaged, 4000);
}

void EmulatorServiceTest::foundDeviceIsAdded() {
    fresh();
    ServiceCaller boss = caller();
    const Json scan = {{"ip", "10.99.0.20"}, {"timeout", 5}};
    QCOMPARE(boss.call("/v1/dev/scanip", scan).code, 0);
    Json found;
    QTRY_VERIFY(!(found = boss.call("/v1/dev/scanout").data).empty());
    QCOMPARE(boss.call("/v1/dev/commit", {{"state", "all"}, {"devices", found}}).code, 0);
    const Json added = boss.list("/v1/dev/list").back();
    COMPARE_JSON(added.at("d_mac"), found[0].at("d_mac"));
    // Found once more it is a managed device, by its id.
    QCOMPARE(boss.call("/v1/dev/scanip", scan).code, 0);
    QTRY_COMPARE(boss.call("/v1/dev/scanout").data.size(), std::size_t{1});
    COMPARE_JSON(boss.call("/v1/dev/scanout").data[0].at("id"), added.at("id"));
}

QTEST_GUILESS_MAIN(EmulatorServiceTest)
#include "tst_emulatorservice.moc"
