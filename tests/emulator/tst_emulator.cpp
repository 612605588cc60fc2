#include "emulatorprocess.h"
#include "platform/crypto/nvlcrypto.h"
#include "servicecaller.h"
#include "support/testmain.h"

#include <QDir>
#include <QFile>
#include <QFileInfo>
#include <QRegularExpression>
#include <QTest>

#include <httplib.h>
#include <openssl/x509_vfy.h>
#include <sqlite3.h>

#include <set>

namespace {

/// What a reader that may only read finds in the service's store file.
QString storedPort(const QString &root) {
    sqlite3 *database = nullptr;
    QString value;
    const QByteArray path = QFile::encodeName(root + "/nvldmsvc.sdb");
    if (sqlite3_open_v2(path.constData(), &database, SQLITE_OPEN_READONLY, nullptr) == SQLITE_OK) {
        sqlite3_exec(
            database, "SELECT value FROM svcMainT WHERE key='kSvcAndTrayServerPort'",
            [](void *out, int, char **columns, char **) {
                *static_cast<QString *>(out) = columns[0];
                return 0;
            },
            &value, nullptr);
    }
    sqlite3_close(database);
    return value;
}

QString stateOf(const QString &root) {
    QFile file(root + "/nvldm.state");
    if (!file.open(QIODevice::ReadOnly))
        return {};
    const QRegularExpression state("STATE\\s*:\\s*(\\d+)");
    auto matches = state.globalMatch(QString::fromUtf8(file.readAll()));
    QString last;
    while (matches.hasNext())
        last = matches.next().captured(1);
    return last;
}

/// How the certificate that the server shows stands to the one in the file.
long verifyCertificate(int port, const QString &file) {
    httplib::SSLClient client("127.0.0.1", port);
    client.enable_server_certificate_verification(true);
    client.set_ca_cert_path(QFile::encodeName(file).constData());
    client.Get("/");
    return client.get_openssl_verify_result();
}

ServiceCaller admin(const EmulatorProcess &emulator) {
    ServiceCaller caller(emulator.port());
    caller.login("admin", "admin");
    return caller;
}

std::set<std::string> unreachable(ServiceCaller &from) {
    std::set<std::string> ids;
    for (const Json &status : from.list("/v1/dstatus/list"))
        if (status.at("connect_status") == "Unreachable")
            ids.insert(status.at("id"));
    return ids;
}

} // namespace

class EmulatorTest : public QObject {
    Q_OBJECT

private slots:
    void init();

    void files();
    void portInUse();
    void keyFile();
    void survives_data();
    void survives();
    void nothingPlainAtRest();
    void sameSeed_data();
    void sameSeed();
    void malformedDevices();
    void pageSize();
    void commands();
};

void EmulatorTest::init() {
    // A test with a key of its own must not leave it to the next.
    QVERIFY(nvlcryptoSetKeyFolder("/nonexistent", 12) == 0);
}

void EmulatorTest::files() {
    EmulatorProcess emulator;
    QVERIFY(emulator.start());
    QCOMPARE(emulator.readyLine(),
             QString("nvldm-emulator: listening on https://127.0.0.1:%1").arg(emulator.port()));
    QCOMPARE(storedPort(emulator.root()), QString("{\"port\": %1}").arg(emulator.port()));
    QCOMPARE(stateOf(emulator.root()), QString("4"));
    const auto ownerAll = QFile::ReadOwner | QFile::WriteOwner | QFile::ExeOwner | QFile::ReadUser |
                          QFile::WriteUser | QFile::ExeUser;
    QCOMPARE(QFile::permissions(emulator.root()) & ~ownerAll, QFile::Permissions());
    const auto entries = QDir(emulator.root()).entryInfoList(QDir::Files);
    QVERIFY(entries.size() >= 3);
    for (const QFileInfo &entry : entries)
        QCOMPARE(entry.permissions() & ~ownerAll, QFile::Permissions());
    QCOMPARE(emulator.stop(), 0);
    QCOMPARE(stateOf(emulator.root()), QString("1"));
}

void EmulatorTest::portInUse() {
    EmulatorProcess emulator;
    QVERIFY(emulator.start());
    QTemporaryDir other;
    const auto second =
        EmulatorProcess::run({"--root", other.path(), "--port", QString::number(emulator.port())});
    QCOMPARE(second.status, 1);
    QVERIFY(second.errors.contains("cannot listen"));
    QCOMPARE(stateOf(other.path()), QString());
}

void EmulatorTest::keyFile() {
    EmulatorProcess emulator;
    QVERIFY(QDir().mkpath(emulator.root()));
    QFile file(emulator.root() + "/nvlcrypto.key");
    QVERIFY(file.open(QIODevice::WriteOnly));
    file.write(" " + QByteArray(32, '\x5a').toHex().toUpper() + "\n");
    file.close();
    QVERIFY(emulator.start());
    QCOMPARE(ServiceCaller(emulator.port()).login("admin", "admin").code, 105);
    const QByteArray folder = QFile::encodeName(emulator.root());
    QVERIFY(nvlcryptoSetKeyFolder(folder.constData(), static_cast<std::size_t>(folder.size())) == 0);
    ServiceCaller caller(emulator.port());
    QCOMPARE(caller.login("admin", "admin").code, 0);
    QVERIFY(caller.call("/v1/config/get").data.is_object());
}

void EmulatorTest::survives_data() {
    QTest::addColumn<bool>("crash");
    QTest::newRow("stop") << false;
    QTest::newRow("crash") << true;
}

void EmulatorTest::survives() {
    QFETCH(bool, crash);
    EmulatorProcess emulator;
    QVERIFY(emulator.start());
    ServiceCaller first(emulator.port());
    QCOMPARE(first
                 .post("/v1/accm/new", {{"email", "me@x.y"},
                                        {"pass", ServiceCaller::cipheredPassword("Secret-1")},
                                        {"permi", "admin"}})
                 .code,
             0);
    QCOMPARE(first.login("me@x.y", "Secret-1").code, 0);
    QCOMPARE(first.call("/v1/config/set", {{"rp_keepnum", 9}}).code, 0);
    Json sitesToAdd = Json::array();
    sitesToAdd.push_back({{"siteid", "SR1"}, {"sitename", "N"}, {"parentid", "SR000000000000"}, {"x", 1}});
    QCOMPARE(first.call("/v1/site/commit", {{"state", "all"}, {"sites", sitesToAdd}}).code, 0);
    Json changed = first.list("/v1/dev/list").front();
    changed["x_unknown"] = {{"deep", {1, "zwölf", 2.5}}};
    changed["siteid"] = {"DO000000000000", "SR1"};
    const Json removed = {{"id", first.list("/v1/dev/list").back().at("id")}, {"siteid", Json::array()}};
    QCOMPARE(first.call("/v1/dev/commit", {{"state", "all"}, {"devices", {changed, removed}}}).code, 0);
    const QString id = QString::fromStdString(changed.at("id"));
    QCOMPARE(emulator.command("status " + id + " \"Access Denied\" Unreachable -"), QString("ok 1 device"));
    QCOMPARE(emulator.command("fault renew"), QString("ok"));

    const Json devices = first.list("/v1/dev/list");
    const Json statuses = first.list("/v1/dstatus/list");
    const Json sites = first.list("/v1/site/list");
    const Json settings = first.call("/v1/config/get").data;
    const Json accounts = first.post("/v1/accm/list", {{"start", 0}, {"count", 10}}).data;
    const QString certificate = emulator.root() + "/../certificate.pem";
    QVERIFY(QFile::copy(emulator.root() + "/nvldm-emulator.pem", certificate));
    crash ? emulator.kill() : static_cast<void>(emulator.stop());

    QVERIFY(emulator.start({"--devices", "3", "--sites", "1", "--seed", "99"}));
    ServiceCaller second(emulator.port());
    COMPARE_JSON(second.post("/v1/accm/list", {{"start", 0}, {"count", 10}}).data, accounts);
    // The last renewed token is still the session's.
    second.setToken(first.token());
    const auto get = [&](const char *path) {
        return second.call(path, {{"id", "me@x.y"}, {"start", 0}, {"count", 1000}}).data;
    };
    COMPARE_JSON(get("/v1/dev/list"), devices);
    COMPARE_JSON(get("/v1/dstatus/list"), statuses);
    COMPARE_JSON(get("/v1/site/list"), sites);
    COMPARE_JSON(get("/v1/config/get"), settings);
    QCOMPARE(verifyCertificate(emulator.port(), certificate), long{X509_V_OK});
    QVERIFY(emulator.command("counts").startsWith("ok devices=19 "));
    QVERIFY(emulator.diagnostics().contains("keeps the 19 devices"));
}

void EmulatorTest::nothingPlainAtRest() {
    EmulatorProcess emulator;
    QVERIFY(emulator.start({"--account", "me@x.y:Very-Secret-77:admin"}));
    ServiceCaller caller(emulator.port());
    QCOMPARE(caller.login("me@x.y", "Very-Secret-77").code, 0);
    QVERIFY(!emulator.command("counts").isEmpty());
    bool accountIsThere = false;
    for (const QFileInfo &entry : QDir(emulator.root()).entryInfoList(QDir::Files)) {
        QFile file(entry.filePath());
        QVERIFY(file.open(QIODevice::ReadOnly));
        const QByteArray content = file.readAll();
        accountIsThere = accountIsThere || content.contains("me@x.y");
        QVERIFY(!content.contains("Very-Secret-77"));
        QVERIFY(!content.contains(caller.token().c_str()));
    }
    QVERIFY(accountIsThere);
    emulator.stop();
    QVERIFY(!emulator.diagnostics().contains("Very-Secret-77"));
}

void EmulatorTest::sameSeed_data() {
    QTest::addColumn<QString>("seed");
    QTest::addColumn<bool>("same");
    QTest::newRow("same") << "7" << true;
    QTest::newRow("other") << "8" << false;
}

void EmulatorTest::sameSeed() {
    QFETCH(QString, seed);
    QFETCH(bool, same);
    EmulatorProcess left;
    EmulatorProcess right;
    QVERIFY(left.start({"--seed", "7"}));
    QVERIFY(right.start({"--seed", seed}));
    ServiceCaller ofLeft = admin(left);
    ServiceCaller ofRight = admin(right);
    QCOMPARE(ofLeft.list("/v1/dev/list") == ofRight.list("/v1/dev/list"), same);
    QCOMPARE(ofLeft.list("/v1/dstatus/list") == ofRight.list("/v1/dstatus/list"), same);
}

void EmulatorTest::malformedDevices() {
    EmulatorProcess emulator;
    QVERIFY(emulator.start({"--malformed-devices"}));
    ServiceCaller caller = admin(emulator);
    const Json devices = caller.list("/v1/dev/list");
    const auto any = [&](const auto &condition) {
        return std::any_of(devices.begin(), devices.end(), condition);
    };
    QVERIFY(any([](const Json &d) { return !d.contains("d_mac"); }));
    QVERIFY(any([](const Json &d) { return d.contains("d_http") && d.at("d_http").is_string(); }));
    QVERIFY(any([](const Json &d) { return d.at("siteid").is_string(); }));
    QVERIFY(any([](const Json &d) { return d.value("d_ip", Json()) == "not-an-address"; }));
    QVERIFY(any([](const Json &d) {
        return d.value("d_model", Json()).is_string() &&
               d["d_model"].get_ref<const std::string &>().size() == 10000;
    }));
    QVERIFY(any([](const Json &d) {
        return d.value("d_model", Json()).is_string() &&
               d["d_model"].get_ref<const std::string &>().find("<b>") == 0;
    }));
    // What the service itself handed out it takes back.
    QCOMPARE(caller.call("/v1/dev/commit", {{"state", "all"}, {"devices", devices}}).code, 0);
}

void EmulatorTest::pageSize() {
    EmulatorProcess emulator;
    QVERIFY(emulator.start({"--devices", "2100"}));
    ServiceCaller caller = admin(emulator);
    QCOMPARE(caller.list("/v1/dev/list", 2000).size(), std::size_t{2100});
    QCOMPARE(caller.call("/v1/dev/list", {{"start", 0}, {"count", 5000}}).data.size(), std::size_t{2000});
}

void EmulatorTest::commands() {
    EmulatorProcess emulator;
    QVERIFY(emulator.start());
    ServiceCaller caller = admin(emulator);
    QVERIFY(emulator.command("restore all").startsWith("ok"));
    QCOMPARE(emulator.command("drop 6"), QString("ok 6 devices"));
    QCOMPARE(unreachable(caller).size(), std::size_t{6});
    QCOMPARE(emulator.command("restore all"), QString("ok 6 devices"));
    QCOMPARE(emulator.command("add 4"), QString("ok 4 devices"));
    QCOMPARE(caller.list("/v1/dev/list").size(), std::size_t{24});
    const Json last = caller.list("/v1/dev/list").back();
    const QString id = QString::fromStdString(last.at("id"));
    QCOMPARE(emulator.command("status " + id + " \"Set Password\" Connected deviceRestart"),
             QString("ok 1 device"));
    COMPARE_JSON(caller.list("/v1/dstatus/list").back(), Json({{"id", last.at("id")},
                                                               {"connect_status", "Connected"},
                                                               {"auth_status", "Set Password"},
                                                               {"action_status", "deviceRestart"}}));
    QCOMPARE(emulator.command("remove " + id), QString("ok 1 device"));
    QCOMPARE(caller.list("/v1/dev/list").size(), std::size_t{23});
    QCOMPARE(emulator.command("expire-sessions"), QString("ok"));
    QCOMPARE(caller.call("/v1/config/get").code, 105);

    // A command comes with its own help, and says how it is used when its arguments do not fit.
    QCOMPARE(emulator.command("help"), QString("ok"));
    QVERIFY(emulator.diagnostics().contains("orb orgs N|default "));
    QCOMPARE(emulator.command("task deviceRestart"), QString("error usage: task TYPE COUNT [DELAY_MS]"));
    QCOMPARE(emulator.command("alarm 1 2 3"), QString("error usage: alarm DESPID [COUNT]"));
    QVERIFY(emulator.command("life maybe").startsWith("error"));
    QVERIFY(emulator.command("orb").startsWith("error no such command"));
}

NVLDM_GUILESS_TEST(EmulatorTest)
#include "tst_emulator.moc"
