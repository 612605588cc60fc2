#include "exetaskmgr.h"
#include "fakelists.h"
#include "isolatedroot.h"
#include "logcapture.h"
#include "selfsignedcert.h"
#include "taskinfopool.h"
#include "transfer.h"
#include "uploadtaskmgr.h"

#include <QCoreApplication>
#include <QElapsedTimer>
#include <QTest>

#include <thread>

using nlohmann::json;
using Insert = std::function<bool(QString *)>;

using Cancel = std::function<void()>;

Q_DECLARE_METATYPE(Insert)
Q_DECLARE_METATYPE(Cancel)

namespace {

UploadTaskMgr &uploads() {
    return UploadTaskMgr::instance();
}
ExeTaskMgr &commands() {
    return ExeTaskMgr::instance();
}

const JSON ids = {"DV1", "DV2"};

/// Passwords in the clear, so that they can be compared.
json opened(json devices) {
    for (json &device : devices) {
        if (device.is_object() && device.contains("pass"))
            device["pass"] = Ciphers::openSecret(device["pass"].get<std::string>()).value_or("nothing");
    }
    return devices;
}

json each(json members) {
    json devices = json::array();
    for (const json &id : ids) {
        members["id"] = id;
        devices.push_back(members);
    }
    return devices;
}

} // namespace

/// What the two managers accept, and what each type of record sends and logs.
class TestTaskMgrs : public QObject {
    Q_OBJECT

private slots:
    void init() {
        m_log = std::make_unique<LogCapture>();
        m_service = std::make_unique<FakeLists>();
    }
    void cleanup() {
        m_service.reset();
        CTaskInfoPool::instance().clear();
        QCoreApplication::processEvents();
        m_log.reset();
    }

    void types_data();
    void types();
    void refusals_data();
    void refusals();
    void uploadIsCancelled_data();
    void uploadIsCancelled();
    void taskAbortedInTheListIsNotSentOn();
    void fileThatIsGoneIsToldByItsName();

private:
    QString file(const char *name) {
        m_root.write(QLatin1String(name), QByteArray("content of ") + name);
        return m_root.filePath(QLatin1String(name));
    }
    JSON files(const char *name) {
        return {{{"fpath", file(name).toStdString()}, {"fname", name}, {"d_mac", "AA-DV1"}}};
    }

    IsolatedRoot m_root;
    std::unique_ptr<LogCapture> m_log;
    std::unique_ptr<FakeLists> m_service;
};

void TestTaskMgrs::types_data() {
    QTest::addColumn<Insert>("insert");
    QTest::addColumn<QString>("ctid");
    QTest::addColumn<std::string>("type");
    QTest::addColumn<std::string>("devices"); // of the service task
    QTest::addColumn<std::string>("path");
    QTest::addColumn<std::string>("sent"); // a JSON body, or what a form has to contain
    QTest::addColumn<QString>("announced");
    QTest::addColumn<QString>("success");
    QTest::addColumn<QString>("failure");
    const auto row = [](const char *name, Insert insert, const char *ctid, const char *type,
                        const json &devices, const char *path, const json &sent, const char *announced,
                        const char *success, const char *failure) {
        QTest::newRow(name) << std::move(insert) << QString(ctid) << std::string(type) << devices.dump()
                            << std::string(path) << sent.dump() << QString(announced) << QString(success)
                            << QString(failure);
    };
    const json withTid = each({{"tid", "T1"}});
    const char *commandsWith = "Executing CGI commands with devices: ";
    const char *commandsDone = "Executing CGI commands success.";
    const char *commandsFailed = "Executing CGI commands failed!";
    row(
        "auto address", [](QString *c) { return commands().insertNewAutoAssignIpTask(ids, c); }, "assignip_",
        "deviceAssignIPAuto", ids, "/v1/assip/auto", {{"tid", "T1"}, {"devices", ids}}, commandsWith,
        commandsDone, commandsFailed);
    const JSON addressed = {{{"id", "DV1"}, {"ip", "10.0.0.5"}}, {{"id", "DV2"}, {"ip", "10.0.0.6"}}};
    row(
        "manual address",
        [addressed](QString *c) {
            return commands().insertNewManualAssignIpTask(addressed, "255.0.0.0", "10.0.0.1", "9.9.9.9", "",
                                                          c);
        },
        "assignip_", "deviceAssignIPManual", ids, "/v1/assip/manual",
        {{"tid", "T1"},
         {"devices", addressed},
         {"mask", "255.0.0.0"},
         {"gate", "10.0.0.1"},
         {"dns1", "9.9.9.9"},
         {"dns2", ""}},
        commandsWith, commandsDone, commandsFailed);
    row(
        "debug info", [](QString *c) { return commands().insertNewExportDebugInfoTask(ids, "/reports", c); },
        "export_", "deviceExportDeviceInfo", ids, "/v1/export/debif",
        {{"storepath", "/reports"}, {"devices", withTid}},
        "Executing exporting debug info with devices: ", "Exporting debug info success.",
        "Exporting debug info failed!");
    row(
        "quick setup",
        [](QString *c) {
            return commands().insertNewQuickSetupTask(ids, {{"mute", 1}, {"x", 2}}, c);
        },
        "quick_setup", "deviceQuickSetup", ids, "/v1/quicksetup", {{"devices", withTid}, {"mute", 1}},
        "Executing Quick Setup with devices: ", "Running Quick Setup done.",
        "HTTP API(runQuickSetup) failed! (15)");

    row(
        "configuration file",
        [this](QString *c) {
            return uploads().insertNewConfigFileUploadTask("all", "c.txt", file("c.txt"), ids, c);
        },
        "config_file_id_", "deviceConfigFileUpload", each({{"mode", "all"}}), "/v1/config_file_upload",
        {"\"device_ids\":[\"DV1\",\"DV2\"]", "fimage", "content of c.txt"}, "", "",
        "ERROR: Configuration File Uploading has failed. (15)");
    row(
        "firmware",
        [this](QString *c) {
            return uploads().insertNewFWUploadTask("auto", file("f.bin"), "f.bin", ids, "FW7", "1700", c);
        },
        "FWi_", "deviceFWUpgrade", each({{"fwid", "FW7"}, {"mode", "auto"}, {"actm", "1700"}}), "/v1/fwupl",
        {"\"tid\":\"T1\"", "fimage", "content of f.bin"}, "", "", "ERROR: FW Uploading has failed. (15)");
    row(
        "package",
        [this](QString *c) {
            return uploads().insertNewPackageUploadTask("new", "p.zip", file("p.zip"), true, ids, c);
        },
        "package_id_", "devicePackageUpload", each({{"mode", "new"}}), "/v1/upload_package",
        {"\"sd_card\":true", "\"device_ids\":[\"DV1\",\"DV2\"]", "content of p.zip"}, "",
        "Uploading the package is successful.", "ERROR: Package Uploading has failed. (15)");
    row(
        "self-signed",
        [](QString *c) {
            const SelfSignedCert cert{"https", 8443, "CH", "ZH", "Zug", "Org", "Unit", "365"};
            return uploads().insertNewHttpsSelfSignedCertTask(cert, ids, c);
        },
        "https_", "deviceGenSelfSignedCert", ids, "/v1/gencert",
        {"\"devices\":" + withTid.dump(), "\"https_port\":8443", "\"state\":\"ZH\"", "\"org_unit\":\"Unit\"",
         "\"validity\":\"365\""},
        "Mode: https, HTTPS Port: 8443, Country: CH, State&Province: ZH, Organization: Org, Validity: 365, "
        "Devices Info: [\"DV1\",\"DV2\"]",
        "Generating HTTPs Self-Signed Certificate success.",
        "Generating HTTPs Self-Signed Certificate failed!");
    const json https = each({{"mode", "https"}, {"https_port", 443}});
    row(
        "install",
        [this](QString *c) {
            return uploads().insertNewHttpsCertInstallTask("https", 443, files("a.pem"), ids, c);
        },
        "https_", "deviceHttpsCertInstall", https, "/v1/sslcertinst",
        {"\"tid\":\"T1\"", "cert_AA-DV1", "content of a.pem"},
        "Mode: https, HTTPS Port: 443, Certificate files: [{",
        "Uploading the created HTTPs Certificate for installing is successful.",
        "Uploading the created HTTPs Certificate for installing has failed!");
    const char *keyDone = "Uploading the HTTPs Certificate and Private Key is successful.";
    const char *keyFailed = "Uploading the HTTPs Certificate and Private Key has failed!";
    row(
        "certificate and key",
        [this](QString *c) {
            return uploads().insertNewHttpsCertPKeysTask("https", 443, files("a.pem"), files("a.key"), ids,
                                                         c);
        },
        "https_", "deviceHttpsCertsAndPKeys", https, "/v1/sslcertpkeys",
        {"\"tid\":\"T1\"", "cert_AA-DV1", "pkey_AA-DV1", "content of a.pem", "content of a.key"},
        "Mode: https, HTTPS Port: 443, Certificate files: [{", keyDone, keyFailed);
    const json login = each({{"mode", "on"}, {"identity", "me"}, {"pass", "Passw0rd!"}});
    row(
        "EAP-PEAP",
        [this](QString *c) {
            return uploads().insertNewPeapTask("on", "ca.pem", file("ca.pem"), "me", "Passw0rd!", ids, c);
        },
        "ieee_", "deviceIEEE_EAP_PEAP", login, "/v1/ie_peap", {"\"tid\":\"T1\"", "ca_", "content of ca.pem"},
        "", "", "ERROR: FW Uploading has failed. (15)");
    row(
        "EAP-TLS",
        [this](QString *c) {
            return uploads().insertNewTlsTask("on", "ca.pem", file("ca.pem"), "me", "Passw0rd!",
                                              files("a.pem"), files("a.key"), ids, c);
        },
        "ieee_", "deviceIEEE_EAP_TLS", login, "/v1/ie_tls",
        {"\"tid\":\"T1\"", "ca_", "cert_AA-DV1", "pkey_AA-DV1", "content of a.key"}, "Certificate files: [{",
        keyDone, keyFailed);
}

void TestTaskMgrs::types() {
    QFETCH(Insert, insert);
    QFETCH(QString, ctid);
    QFETCH(std::string, type);
    QFETCH(std::string, devices);
    QFETCH(std::string, path);
    QFETCH(std::string, sent);
    QFETCH(QString, announced);
    QFETCH(QString, success);
    QFETCH(QString, failure);
    QString inserted;
    QVERIFY(insert(&inserted));
    QVERIFY(inserted.startsWith(ctid));
    TaskQueue &queue =
        commands().stateOf(inserted).isEmpty() ? static_cast<TaskQueue &>(uploads()) : commands();
    queue.handlingTask();

    const json asked = m_service->sentTo("/v1/task/init").at(0);
    QCOMPARE(asked["type"].get<std::string>(), type);
    QCOMPARE(opened(asked["devices"]).dump(), devices);
    const std::string body = m_service->rawSentTo(path).at(0);
    if (json expected = json::parse(sent); expected.is_object()) {
        expected["id"] = "admin";
        QCOMPARE(json::parse(body).dump(), expected.dump());
    } else {
        for (const json &part : expected)
            QVERIFY2(body.find(part.get<std::string>()) != std::string::npos, part.dump().c_str());
    }
    QVERIFY(queue.stateOf(inserted).endsWith("_done"));
    QVERIFY(announced.isEmpty() || m_log->count(announced) == 1);
    QVERIFY(success.isEmpty() || m_log->count(success) == 1);
    QCOMPARE(m_log->count("failed"), 0);

    m_service->refuse(path, 3);
    QVERIFY(insert(&inserted));
    queue.handlingTask();
    QVERIFY(queue.stateOf(inserted).endsWith("_fail"));
    QCOMPARE(m_log->count(failure), 1);
    QCOMPARE(m_log->count("Passw0rd!"), 0);
}

void TestTaskMgrs::refusals_data() {
    QTest::addColumn<Insert>("insert");
    QTest::addColumn<QString>("message");
    const auto row = [](const char *name, Insert insert, const char *message) {
        QTest::newRow(name) << std::move(insert) << QString(message);
    };
    static const JSON none = JSON::array();
    static const JSON certs = {{{"fname", "a"}}};
    row(
        "no device", [](QString *) { return commands().insertNewAutoAssignIpTask(none); },
        "Inserting new task requires the device information.");
    row(
        "no list", [](QString *) { return commands().insertNewAutoAssignIpTask("DV1"); },
        "Inserting new task with the devices requires the JSON array format.");
    row(
        "no mask",
        [](QString *) { return commands().insertNewManualAssignIpTask(ids, "", "1.1.1.1", "", ""); },
        "Inserting new task with the invalid parameter.");
    row(
        "nowhere to store", [](QString *) { return commands().insertNewExportDebugInfoTask(ids, ""); },
        "Inserting new task with the invalid parameter.");
    row(
        "nothing to set up", [](QString *) { return commands().insertNewQuickSetupTask(ids, none); },
        "Inserting new task with the invalid parameter.");
    row(
        "configuration without mode",
        [](QString *) { return uploads().insertNewConfigFileUploadTask("", "a", "/a", ids); },
        "Inserting new task with the invalid parameter when UploadTaskMgr#insertNewConfigFileUploadTask");
    row(
        "configuration without devices",
        [](QString *) { return uploads().insertNewConfigFileUploadTask("m", "a", "/a", none); },
        "Inserting new task requires the device information when "
        "UploadTaskMgr#insertNewConfigFileUploadTask");
    row(
        "package without devices",
        [](QString *) { return uploads().insertNewPackageUploadTask("m", "a", "/a", false, none); },
        "Inserting new task requires the device ids when UploadTaskMgr::insertNewPackageUploadTask");
    row(
        "blank name", [](QString *) { return uploads().insertNewFWUploadTask("m", "/a", " ", ids, "", ""); },
        "Inserting new task with the blank file name.");
    row(
        "PEAP without devices",
        [](QString *) { return uploads().insertNewPeapTask("m", "a", "/a", "i", "p", none); },
        "Inserting new task requires the related information.");
    row(
        "TLS without certificates",
        [](QString *) { return uploads().insertNewTlsTask("m", "a", "/a", "i", "p", none, certs, ids); },
        "Inserting new task requires the certificate information.");
    row(
        "TLS without keys",
        [](QString *) { return uploads().insertNewTlsTask("m", "a", "/a", "i", "p", certs, JSON(), ids); },
        "Inserting new task requires the certificate information.");
}

void TestTaskMgrs::refusals() {
    QFETCH(Insert, insert);
    QFETCH(QString, message);
    QVERIFY(!insert(nullptr));
    QCOMPARE(m_log->count(message), 1);
    QCOMPARE(m_log->count("Inserting new task"), 1);
    uploads().handlingTask();
    commands().handlingTask();
    QVERIFY(m_service->sentTo("/v1/task/init").empty());
}

void TestTaskMgrs::uploadIsCancelled_data() {
    QTest::addColumn<Cancel>("cancel");
    QTest::addColumn<bool>("told"); // to the service, which has to be there
    QTest::newRow("by the user") << Cancel([] { uploads().sending().transfer->cancel(); }) << true;
    QTest::newRow("by a log-off") << Cancel([] {
        CLocalStore::instance().clearLoginInfo();
        CTaskInfoPool::instance().clear();
    }) << false;
}

void TestTaskMgrs::uploadIsCancelled() {
    QFETCH(Cancel, cancel);
    QFETCH(bool, told);
    m_service->hold("/v1/fwupl");
    QString ctid;
    QVERIFY(uploads().insertNewFWUploadTask("auto", file("f.bin"), "f.bin", ids, "FW7", "", &ctid));
    std::thread walk([] { uploads().handlingTask(); });
    QTRY_VERIFY(uploads().sending().transfer && uploads().sending().transfer->bytesDone() > 0);
    QCOMPARE(uploads().sending().name, QString("f.bin"));
    QElapsedTimer clock;
    clock.start();
    cancel();
    walk.join();
    QVERIFY2(clock.elapsed() < 1000, "ended within a second");
    QCOMPARE(uploads().stateOf(ctid), QString("upload_fail"));
    QVERIFY(!uploads().sending().transfer);
    const std::vector<json> ended = m_service->sentTo("/v1/task/updateState");
    QCOMPARE(ended.size(), told ? 1u : 0u);
    QVERIFY(!told || ended[0]["task_state"] == "pTaskAborted");
}

void TestTaskMgrs::taskAbortedInTheListIsNotSentOn() {
    m_service->hold("/v1/fwupl");
    m_service->setTaskMade({{"tid", "T1"}});
    m_service->setTasks({{{"tid", "T1"}, {"status", "pTaskAborted"}}});
    QString ctid;
    QVERIFY(uploads().insertNewFWUploadTask("auto", file("f.bin"), "f.bin", ids, "FW7", "", &ctid));
    std::thread walk([] { uploads().handlingTask(); });
    QTRY_COMPARE(uploads().stateOf(ctid), QString("upload_fail"));
    walk.join();
}

void TestTaskMgrs::fileThatIsGoneIsToldByItsName() {
    QString reason;
    const auto connection = connect(&uploads(), &TaskQueue::handOverFailed, this,
                                    [&](const FailedHandOver &failure) { reason = failure.reason; });
    QVERIFY(uploads().insertNewFWUploadTask("auto", "/nowhere/f.bin", "f.bin", ids, "FW7", ""));
    uploads().handlingTask();
    QTRY_VERIFY(reason.contains("f.bin"));
    disconnect(connection);
}

QTEST_GUILESS_MAIN(TestTaskMgrs)
#include "tst_taskmgrs.moc"
