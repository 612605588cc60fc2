#include "api/transport/transfer.h"
#include "support/fakelists.h"
#include "support/isolatedroot.h"
#include "support/logcapture.h"
#include "support/testmain.h"
#include "tasks/queue/exetaskmgr.h"
#include "tasks/queue/selfsignedcert.h"
#include "tasks/queue/uploadtaskmgr.h"
#include "tasks/service/taskinfopool.h"

#include <QCoreApplication>
#include <QElapsedTimer>
#include <QTest>

#include <thread>

using nlohmann::json;
using Insert = std::function<bool(QString *)>;

namespace {

/// An insertion, and what comes of it.
struct Type {
    const char *name;
    Insert insert;
    const char *idPrefix;
    const char *serviceType;
    json devices; ///< of the service task
    const char *path;
    json sent; ///< the JSON body, or an array of what a form has to contain
    const char *announced;
    const char *success;
    const char *failure;
};

} // namespace

Q_DECLARE_METATYPE(Type)

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
    void refusals();
    void uploadIsCancelled_data();
    void uploadIsCancelled();
    void taskAbortedInTheListIsNotSentOn();
    void fileThatIsGoneIsToldByItsName();

private:
    std::vector<Type> commandTypes();
    std::vector<Type> uploadTypes();
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

std::vector<Type> TestTaskMgrs::commandTypes() {
    const JSON addressed = {{{"id", "DV1"}, {"ip", "10.0.0.5"}}, {{"id", "DV2"}, {"ip", "10.0.0.6"}}};
    const JSON manual = {{"tid", "T1"},        {"devices", addressed}, {"mask", "255.0.0.0"},
                         {"gate", "10.0.0.1"}, {"dns1", "9.9.9.9"},    {"dns2", ""}};
    const char *devices = "Executing CGI commands with devices: ";
    const char *done = "Executing CGI commands success.";
    const char *failed = "Executing CGI commands failed!";
    return {
        {"auto address",
         [](QString *c) { return commands().insertNewAutoAssignIpTask(ids, c); },
         "assignip_",
         "deviceAssignIPAuto",
         ids,
         "/v1/assip/auto",
         {{"tid", "T1"}, {"devices", ids}},
         devices,
         done,
         failed},
        {"manual address",
         [addressed](QString *c) {
             return commands().insertNewManualAssignIpTask(addressed, "255.0.0.0", "10.0.0.1", "9.9.9.9", "",
                                                           c);
         },
         "assignip_", "deviceAssignIPManual", ids, "/v1/assip/manual", manual, devices, done, failed},
        {"debug info",
         [](QString *c) { return commands().insertNewExportDebugInfoTask(ids, "/r", c); },
         "export_",
         "deviceExportDeviceInfo",
         ids,
         "/v1/export/debif",
         {{"storepath", "/r"}, {"devices", each({{"tid", "T1"}})}},
         "Executing exporting debug info with devices: ",
         "Exporting debug info success.",
         "Exporting debug info failed!"},
        {"quick setup",
         [](QString *c) {
             return commands().insertNewQuickSetupTask(ids, {{"mute", 1}, {"x", 2}}, c);
         },
         "quick_setup",
         "deviceQuickSetup",
         ids,
         "/v1/quicksetup",
         {{"devices", each({{"tid", "T1"}})}, {"mute", 1}},
         "Executing Quick Setup with devices: ",
         "Running Quick Setup done.",
         "HTTP API(runQuickSetup) failed! (15)"},
    };
}

std::vector<Type> TestTaskMgrs::uploadTypes() {
    const QString ca = file("ca.pem");
    const JSON certs = files("a.pem");
    const JSON keys = files("a.key");
    const json https = each({{"mode", "m"}, {"https_port", 443}});
    const json login = each({{"mode", "m"}, {"identity", "me"}, {"pass", "Passw0rd!"}});
    const char *files = "Mode: m, HTTPS Port: 443, Certificate files: [{";
    const char *keyDone = "Uploading the HTTPs Certificate and Private Key is successful.";
    const char *keyFailed = "Uploading the HTTPs Certificate and Private Key has failed!";
    return {
        {"configuration file",
         [ca](QString *c) { return uploads().insertNewConfigFileUploadTask("m", "ca.pem", ca, ids, c); },
         "config_file_id_",
         "deviceConfigFileUpload",
         each({{"mode", "m"}}),
         "/v1/config_file_upload",
         {R"("device_ids":["DV1","DV2"])", "fimage", "content of ca.pem"},
         "",
         "",
         "ERROR: Configuration File Uploading has failed. (15)"},
        {"firmware",
         [ca](QString *c) {
             return uploads().insertNewFWUploadTask("m", ca, "f.bin", ids, "FW7", "1700", c);
         },
         "FWi_",
         "deviceFWUpgrade",
         each({{"fwid", "FW7"}, {"mode", "m"}, {"actm", "1700"}}),
         "/v1/fwupl",
         {R"("tid":"T1")", "fimage", "f.bin", "content of ca.pem"},
         "",
         "",
         "ERROR: FW Uploading has failed. (15)"},
        {"package",
         [ca](QString *c) { return uploads().insertNewPackageUploadTask("m", "p.zip", ca, true, ids, c); },
         "package_id_",
         "devicePackageUpload",
         each({{"mode", "m"}}),
         "/v1/upload_package",
         {R"("sd_card":true)", R"("device_ids":["DV1","DV2"])", "p.zip", "content of ca.pem"},
         "",
         "Uploading the package is successful.",
         "ERROR: Package Uploading has failed. (15)"},
        {"self-signed",
         [](QString *c) {
             const SelfSignedCert cert{"m", 8443, "CH", "ZH", "Zug", "Org", "Unit", "365"};
             return uploads().insertNewHttpsSelfSignedCertTask(cert, ids, c);
         },
         "https_",
         "deviceGenSelfSignedCert",
         ids,
         "/v1/gencert",
         {each({{"tid", "T1"}}).dump(), R"("state":"ZH")", R"("https_port":8443)", R"("validity":"365")"},
         "Mode: m, HTTPS Port: 8443, Country: CH, State&Province: ZH, Organization: Org, Validity: 365, "
         "Devices Info: [\"DV1\",\"DV2\"]",
         "Generating HTTPs Self-Signed Certificate success.",
         "Generating HTTPs Self-Signed Certificate failed!"},
        {"install",
         [certs](QString *c) { return uploads().insertNewHttpsCertInstallTask("m", 443, certs, ids, c); },
         "https_",
         "deviceHttpsCertInstall",
         https,
         "/v1/sslcertinst",
         {R"("tid":"T1")", "cert_AA-DV1", "content of a.pem"},
         files,
         "Uploading the created HTTPs Certificate for installing is successful.",
         "Uploading the created HTTPs Certificate for installing has failed!"},
        {"certificate and key",
         [certs, keys](QString *c) {
             return uploads().insertNewHttpsCertPKeysTask("m", 443, certs, keys, ids, c);
         },
         "https_",
         "deviceHttpsCertsAndPKeys",
         https,
         "/v1/sslcertpkeys",
         {R"("tid":"T1")", "cert_AA-DV1", "pkey_AA-DV1", "content of a.key"},
         files,
         keyDone,
         keyFailed},
        {"EAP-PEAP",
         [ca](QString *c) {
             return uploads().insertNewPeapTask("m", "ca.pem", ca, "me", "Passw0rd!", ids, c);
         },
         "ieee_",
         "deviceIEEE_EAP_PEAP",
         login,
         "/v1/ie_peap",
         {R"("tid":"T1")", "ca_", "content of ca.pem"},
         "",
         "",
         "ERROR: FW Uploading has failed. (15)"},
        {"EAP-TLS",
         [ca, certs, keys](QString *c) {
             return uploads().insertNewTlsTask("m", "ca.pem", ca, "me", "Passw0rd!", certs, keys, ids, c);
         },
         "ieee_",
         "deviceIEEE_EAP_TLS",
         login,
         "/v1/ie_tls",
         {R"("tid":"T1")", "content of ca.pem", "cert_AA-DV1", "content of a.key"},
         "PKey files: [{",
         keyDone,
         keyFailed},
    };
}

void TestTaskMgrs::types_data() {
    QTest::addColumn<Type>("type");
    for (const Type &type : commandTypes())
        QTest::newRow(type.name) << type;
    for (const Type &type : uploadTypes())
        QTest::newRow(type.name) << type;
}

void TestTaskMgrs::types() {
    QFETCH(Type, type);
    QString ctid;
    QVERIFY(type.insert(&ctid));
    QVERIFY(ctid.startsWith(type.idPrefix));
    TaskQueue &queue = commands().stateOf(ctid).isEmpty() ? static_cast<TaskQueue &>(uploads()) : commands();
    queue.handlingTask();

    const json asked = m_service->sentTo("/v1/task/init").at(0);
    QCOMPARE(asked["type"].get<std::string>(), type.serviceType);
    QCOMPARE(opened(asked["devices"]).dump(), type.devices.dump());
    const std::string body = m_service->rawSentTo(type.path).at(0);
    if (type.sent.is_object()) {
        type.sent["id"] = "admin";
        QCOMPARE(json::parse(body).dump(), type.sent.dump());
    } else {
        for (const json &part : type.sent)
            QVERIFY2(body.find(part.get<std::string>()) != std::string::npos, part.dump().c_str());
    }
    QVERIFY(queue.stateOf(ctid).endsWith("_done"));
    QVERIFY(m_log->count(type.announced) >= 1);
    QVERIFY(m_log->count(type.success) >= 1);
    QCOMPARE(m_log->count("failed"), 0);

    m_service->refuse(type.path, 3);
    QVERIFY(type.insert(&ctid));
    queue.handlingTask();
    QVERIFY(queue.stateOf(ctid).endsWith("_fail"));
    QCOMPARE(m_log->count(type.failure), 1);
    QCOMPARE(m_log->count("Passw0rd!"), 0);
}

void TestTaskMgrs::refusals() {
    const JSON none = JSON::array();
    const JSON certs = {{{"fname", "a"}}};
    const QString invalid = "Inserting new task with the invalid parameter";
    const QString noCertificate = "Inserting new task requires the certificate information.";
    const QString config = " when UploadTaskMgr#insertNewConfigFileUploadTask";
    const QString package = " when UploadTaskMgr::insertNewPackageUploadTask";
    const auto refused = [this](bool inserted, const QString &message) {
        const QStringList lines = std::exchange(m_log, nullptr)->lines();
        m_log = std::make_unique<LogCapture>();
        QVERIFY2(!inserted, qUtf8Printable(message));
        QCOMPARE(lines.filter("Inserting new task"), QStringList{message});
    };
    refused(commands().insertNewAutoAssignIpTask(none),
            "Inserting new task requires the device information.");
    refused(commands().insertNewAutoAssignIpTask("DV1"),
            "Inserting new task with the devices requires the JSON array format.");
    refused(commands().insertNewManualAssignIpTask(ids, "", "1.1.1.1", "", ""), invalid + '.');
    refused(commands().insertNewExportDebugInfoTask(ids, ""), invalid + '.');
    refused(commands().insertNewQuickSetupTask(ids, none), invalid + '.');
    refused(uploads().insertNewConfigFileUploadTask("", "a", "/a", ids), invalid + config);
    refused(uploads().insertNewConfigFileUploadTask("m", "a", "/a", none),
            "Inserting new task requires the device information" + config);
    refused(uploads().insertNewPackageUploadTask("m", "a", "/a", false, none),
            "Inserting new task requires the device ids" + package);
    refused(uploads().insertNewFWUploadTask("m", "/a", " ", ids, "", ""),
            "Inserting new task with the blank file name.");
    refused(uploads().insertNewPeapTask("m", "a", "/a", "i", "p", none),
            "Inserting new task requires the related information.");
    refused(uploads().insertNewTlsTask("m", "a", "/a", "i", "p", none, certs, ids), noCertificate);
    refused(uploads().insertNewTlsTask("m", "a", "/a", "i", "p", certs, JSON(), ids), noCertificate);
    uploads().handlingTask();
    commands().handlingTask();
    QVERIFY(m_service->sentTo("/v1/task/init").empty());
}

void TestTaskMgrs::uploadIsCancelled_data() {
    QTest::addColumn<bool>("byLogOff");
    QTest::newRow("by the user") << false;
    QTest::newRow("by a log-off") << true;
}

void TestTaskMgrs::uploadIsCancelled() {
    QFETCH(bool, byLogOff);
    m_service->hold("/v1/fwupl");
    QString ctid;
    QVERIFY(uploads().insertNewFWUploadTask("auto", file("f.bin"), "f.bin", ids, "FW7", "", &ctid));
    std::thread walk([] { uploads().handlingTask(); });
    QTRY_VERIFY(uploads().sending().transfer && uploads().sending().transfer->bytesDone() > 0);
    QCOMPARE(uploads().sending().name, QString("f.bin"));
    QElapsedTimer clock;
    clock.start();
    if (byLogOff) {
        CLocalStore::instance().clearLoginInfo();
        CTaskInfoPool::instance().clear();
    } else {
        uploads().sending().transfer->cancel();
    }
    walk.join();
    QVERIFY2(clock.elapsed() < 1000, "ended within a second");
    QCOMPARE(uploads().stateOf(ctid), QString("upload_fail"));
    QVERIFY(!uploads().sending().transfer);
    const std::vector<json> ended = m_service->sentTo("/v1/task/updateState");
    QCOMPARE(ended.size(), byLogOff ? 0u : 1u);
    QVERIFY(byLogOff || ended[0]["task_state"] == "pTaskAborted");
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
                                    [&](const FailedSubmission &failure) { reason = failure.reason; });
    QVERIFY(uploads().insertNewFWUploadTask("auto", "/nowhere/f.bin", "f.bin", ids, "FW7", ""));
    uploads().handlingTask();
    QTRY_VERIFY(reason.contains("f.bin"));
    disconnect(connection);
}

NVLDM_GUILESS_TEST(TestTaskMgrs)
#include "tst_taskmgrs.moc"
