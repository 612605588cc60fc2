#include "fleettest.h"
#include "support/testmain.h"

#include <QCryptographicHash>
#include <QFile>
#include <QTest>

#include <openssl/pem.h>
#include <openssl/x509.h>

namespace {

using File = ServiceCaller::File;

constexpr auto done = "pTaskDone";
constexpr auto unreadable = "pTaskInvalidFileOrPublicKey";
constexpr auto notInstalled = "pTaskCertificateNotInstalled";

/// A certificate with its key, both as text.
struct Identity {
    std::string certificate;
    std::string der;
    std::string key;
    std::string lockedKey; ///< under the pass phrase "secret"
};

template <typename Write>
std::string written(Write write) {
    BIO *bio = BIO_new(BIO_s_mem());
    write(bio);
    char *text = nullptr;
    const long length = BIO_get_mem_data(bio, &text);
    const std::string copy(text, std::size_t(length));
    BIO_free(bio);
    return copy;
}

Identity makeIdentity() {
    EVP_PKEY *key = EVP_PKEY_Q_keygen(nullptr, nullptr, "EC", "P-256");
    X509 *certificate = X509_new();
    ASN1_TIME_set(X509_getm_notBefore(certificate), 1700000000);
    ASN1_TIME_set(X509_getm_notAfter(certificate), 1900000000);
    X509_set_pubkey(certificate, key);
    const unsigned char name[] = "gate";
    X509_NAME_add_entry_by_txt(X509_get_subject_name(certificate), "CN", MBSTRING_ASC, name, -1, -1, 0);
    X509_sign(certificate, key, EVP_sha256());
    Identity identity;
    identity.certificate = written([&](BIO *bio) { PEM_write_bio_X509(bio, certificate); });
    identity.der = written([&](BIO *bio) { i2d_X509_bio(bio, certificate); });
    const auto keyText = [&](const EVP_CIPHER *cipher, const char *phrase) {
        return written([&](BIO *bio) {
            PEM_write_bio_PKCS8PrivateKey(bio, key, cipher, phrase, phrase ? 6 : 0, nullptr, nullptr);
        });
    };
    identity.key = keyText(nullptr, nullptr);
    identity.lockedKey = keyText(EVP_aes_128_cbc(), "secret");
    X509_free(certificate);
    EVP_PKEY_free(key);
    return identity;
}

} // namespace

/// What becomes of uploaded files, and how uploads go wrong.
class EmulatorUploadsTest : public FleetTest {
    Q_OBJECT

private slots:
    void init() {
        if (!m_emulator)
            fresh({"--task-pace", "20", "--upload-limit", "50000000"});
        QCOMPARE(command("faults clear"), QString("ok"));
    }

    void firmware_data() {
        QTest::addColumn<QString>("name");
        QTest::addColumn<QString>("content");
        QTest::addColumn<QString>("outcome"); ///< a version stands for success
        const auto row = [](const char *name, const char *content, const char *outcome) {
            QTest::addRow("%s: %s", name, content) << name << content << outcome;
        };
        row("image.bin", "anything", "2.4.2");
        row("NC_3.0.7-b.bin", "anything", "3.0.7");
        row("image_9.9.bin", "NVLFW1 NR,NC-42 2.5.0\nanything", "2.5.0");
        row("image.bin", "NVLFW1 NC-42 2.0.0\n", "2.0.0");
        row("image.bin", "NVLFW1 NR,NC-5 2.5.0\n", "pTaskInvalidFileForThisModelGroup");
        row("image.bin", "NVLFW1 NC-4210 1.9.12\n", "pTaskIncompatibleFirmware");
        row("image.bin", "NVLFW1 NC-4210\n", "pTaskBrokenFile_01");
        row("image.bin", "NVLFW1 ,NC 2.5.0\n", "pTaskBrokenFile_01");
        row("image.bin", "", "pTaskBrokenFile_01");
    }

    void firmware() {
        QFETCH(QString, name);
        QFETCH(QString, content);
        QFETCH(QString, outcome);
        change({{"d_model", "NC-4210"}, {"d_fw", "2.4.1"}});
        for (const bool local : {false, true}) {
            const Json task = newTask("deviceFWUpgrade", 1);
            QFile file(m_emulator->root() + "/image");
            QVERIFY(file.open(QIODevice::WriteOnly));
            file.write(content.toUtf8());
            file.close();
            Json parameters = {{"tid", task.at("tid")}};
            if (local) {
                parameters.update({{"local", file.fileName().toStdString()}, {"localn", name.toStdString()}});
                QCOMPARE(m_caller.sendForm("/v1/fwuplex", parameters, {}).code, 0);
            } else {
                QCOMPARE(
                    send("/v1/fwupl", parameters, {{"fimage", name.toStdString(), content.toStdString()}}),
                    0);
            }
            const QString state = QString::fromStdString(outcomes()[0]);
            QCOMPARE(state == done ? QString::fromStdString(record(0).at("d_fw")) : state, outcome);
            change({{"d_fw", "2.4.1"}});
        }
    }

    void package_data() {
        QTest::addColumn<QString>("facts");
        QTest::addColumn<bool>("onCard");
        QTest::addColumn<QString>("content");
        QTest::addColumn<QString>("state");
        const auto row = [](const char *facts, bool onCard, const char *content, const char *state) {
            QTest::addRow("%s %d", facts, onCard) << facts << onCard << content << state;
        };
        const char *full = R"({"d_packages": ["1", "2", "3", "4"]})";
        row(R"({"d_sdstatus": "ready", "d_sdusage": 10})", true, "x", done);
        row(R"({"d_sdstatus": "Empty"})", false, "x", done);
        row(R"({"d_sdstatus": "Empty"})", true, "x", "pTaskNoSdCardDetected");
        row(R"({"d_sdstatus": "detached"})", true, "x", "pTaskNoSdCardDetected");
        row(R"({"d_sdstatus": "Error"})", true, "x", "pTaskSdCardError_01");
        row(R"({"d_sdstatus": "ready", "d_sdusage": 97})", true, "x", "pTaskInsufficientStorage_01");
        row(R"({"d_packages": ["1", "2"]})", false, "", "pTaskBrokenFile_03");
        row(full, false, "x", "pTaskMaxPackageUploadLimit_04");
        row(R"({"d_packages": ["1", "2", "app", "4"]})", false, "x", done);
    }

    void package() {
        QFETCH(QString, facts);
        QFETCH(bool, onCard);
        QFETCH(QString, content);
        change({{"d_packages", Json::array()}});
        change(Json::parse(facts.toStdString()));
        const Json task = newTask("devicePackageUpload", 2);
        const Json parameters = {
            {"tid", task.at("tid")}, {"device_ids", {m_devices[0].at("id")}}, {"sd_card", onCard}};
        QCOMPARE(send("/v1/upload_package", parameters, {{"fimage", "app", content.toStdString()}}), 0);
        QTRY_VERIFY(isOver(newest().at("devices")[0].at("state")));
        const Json after = newest().at("devices");
        QTEST(QString::fromStdString(after[0].at("state")), "state");
        COMPARE_JSON(after[1].at("progress"), 0);
        QCOMPARE(close(task, "pTaskAborted"), 0);
        if (after[0].at("state") == done) {
            const Json packages = record(0).at("d_packages");
            QVERIFY(std::find(packages.begin(), packages.end(), "app") != packages.end());
        }
    }

    void certificates_data() {
        QTest::addColumn<QString>("path");
        QTest::addColumn<QString>("files"); ///< of the first device, and "a" for an authority
        QTest::addColumn<bool>("hasKey");
        QTest::addColumn<QString>("state");
        const auto row = [](const char *path, const char *files, bool hasKey, const char *state) {
            QTest::addRow("%s %s %d", path, files, hasKey) << path << files << hasKey << state;
        };
        const char *mismatch = "pTaskMismatchingPrivateKeyAndCertificate";
        row("sslcertinst", "c", true, done);
        row("sslcertinst", "d", true, done);
        row("sslcertinst", "c", false, notInstalled);
        row("sslcertinst", "x", true, unreadable);
        row("sslcertinst", "k", true, notInstalled);
        row("sslcertpkeys", "ck", false, done);
        row("sslcertpkeys", "co", false, mismatch);
        row("sslcertpkeys", "cy", false, unreadable);
        row("sslcertpkeys", "cl", false, unreadable);
        row("sslcertpkeys", "c", false, notInstalled);
        row("ie_peap", "a", false, done);
        row("ie_peap", "A", false, unreadable);
        row("ie_peap", "c", false, "refused");
        row("ie_tls", "ack", false, done);
        row("ie_tls", "acl", false, done);
        row("ie_tls", "aco", false, mismatch);
        row("ie_tls", "Ack", false, unreadable);
        row("ie_tls", "a", false, notInstalled);
    }

    void certificates() {
        QFETCH(QString, path);
        QFETCH(QString, files);
        QFETCH(bool, hasKey);
        QFETCH(QString, state);
        static const Identity own = makeIdentity(), other = makeIdentity();
        static const std::map<QString, const char *> types = {{"sslcertinst", "deviceHttpsCertInstall"},
                                                              {"sslcertpkeys", "deviceHttpsCertsAndPKeys"},
                                                              {"ie_peap", "deviceIEEE_EAP_PEAP"},
                                                              {"ie_tls", "deviceIEEE_EAP_TLS"}};
        // Names of MACs differ in case and separators between systems.
        std::string mac = m_devices[0].at("d_mac");
        mac.erase(std::remove(mac.begin(), mac.end(), ':'), mac.end());
        const std::map<QChar, File> known = {{'c', {"cert_" + mac, "c.pem", own.certificate}},
                                             {'d', {"cert_" + mac, "c.der", own.der}},
                                             {'x', {"cert_" + mac, "c.pem", own.key}},
                                             {'k', {"pkey_" + mac, "k.pem", own.key}},
                                             {'o', {"pkey_" + mac, "k.pem", other.key}},
                                             {'y', {"pkey_" + mac, "k.pem", "no key"}},
                                             {'l', {"pkey_" + mac, "k.pem", own.lockedKey}},
                                             {'a', {"ca_", "ca.pem", other.certificate}},
                                             {'A', {"ca_", "ca.pem", ""}}};
        std::vector<File> form;
        for (const QChar letter : files)
            form.push_back(known.at(letter));
        change({{"d_has_matching_private_key", hasKey},
                {"d_has_matching_cert_request", false},
                {"https_enable", false},
                {"ieee8021x_enable", false}});
        const Json task = newTask(types.at(path), 1,
                                  {{"https_port", 8444},
                                   {"identity", "gate"},
                                   {"pass", ServiceCaller::cipheredPassword("secret")}});
        const int code = send("/v1/" + path.toStdString(), {{"tid", task.at("tid")}}, form);
        QCOMPARE(code, state == "refused" ? 3 : 0);
        if (code != 0)
            return;
        QCOMPARE(QString::fromStdString(outcomes()[0]), state);
        const Json after = record(0);
        const bool https = path.startsWith("ssl");
        COMPARE_JSON(after.at(https ? "https_enable" : "ieee8021x_enable"), state == done);
        if (state == done)
            COMPARE_JSON(after.at(https ? "d_cert_expires" : "d_8021x_expires"), 1900000000000);
        if (state == done && https) {
            COMPARE_JSON(after.at("d_https"), 8444);
            COMPARE_JSON(after.at("d_cert_subject"), "CN=gate");
        }
    }

    void selfSigned() {
        Json body = {{"mode", "https"}, {"https_port", "8445"}, {"country", "DE"},     {"state", ""},
                     {"locality", ""},  {"org", "Yard"},        {"org_unit", "Gates"}, {"validity", 2}};
        body["devices"] = under(newTask("deviceGenSelfSignedCert", 1));
        const qint64 before = QDateTime::currentMSecsSinceEpoch();
        QCOMPARE(code("/v1/gencert", body), 0);
        COMPARE_JSON(outcomes(), Json::array({done}));
        const std::string ip = record(0).at("d_ip");
        COMPARE_JSON(record(0).at("d_cert_subject"), "CN=" + ip + ",OU=Gates,O=Yard,C=DE");
        QVERIFY(record(0).at("d_cert_expires") >= before + 2 * 86400000LL && record(0).at("d_https") == 8445);
        for (const Json &bad :
             {Json{{"validity", 0}}, Json{{"https_port", 70000}}, Json{{"country", "Deu"}}}) {
            Json changed = body;
            changed.update(bad);
            QCOMPARE(code("/v1/gencert", changed), 3);
        }
    }

    /// A file that looks like its frame, longer than anything that is kept of it.
    void streamed() {
        std::string content;
        while (content.size() < 40000000)
            content += "\r\n--a-line-that-no-file-hold\r\n\r" + std::to_string(content.size()) + "\r";
        const Json task = newTask("deviceConfigFileUpload", 1);
        const Json parameters = {{"tid", task.at("tid")}, {"device_ids", {m_devices[0].at("id")}}};
        QCOMPARE(send("/v1/config_file_upload", parameters, {{"fimage", "\xc3\xa4.cfg", content}}), 0);
        const auto hash =
            QCryptographicHash::hash({content.data(), qsizetype(content.size())}, QCryptographicHash::Sha256);
        const Json entries =
            m_caller.call("/v1/logs/list", {{"start_time", "0"}, {"end_time", "99999999999999"}})
                .data.at("items");
        const auto isLogged = [&](const Json &entry) {
            const QString text = QString::fromStdString(entry.at("description"));
            return text.contains("\"ä.cfg\"") && text.contains(QString::number(content.size()) + " bytes") &&
                   text.endsWith(hash.toHex());
        };
        QVERIFY(std::any_of(entries.begin(), entries.end(), isLogged));
#if !defined(__SANITIZE_ADDRESS__) && !defined(__SANITIZE_THREAD__) // these keep what is freed
        QFile status(QString("/proc/%1/status").arg(m_emulator->processId()));
        QVERIFY(status.open(QIODevice::ReadOnly));
        const QByteArray all = status.readAll();
        const int peak = all.mid(all.indexOf("VmHWM:") + 6, 12).trimmed().split(' ')[0].toInt();
        QVERIFY2(peak > 0 && peak < 35000, QByteArray::number(peak));
#endif
    }

    /// The files may take longer than a task waits for work of which nothing comes.
    void slowArrival() {
        fresh({"--task-work-timeout", "500", "--fault", "slow-body=50@/v1/config_file_upload"});
        const Json task = newTask("deviceConfigFileUpload", 2);
        Json ids = Json::array({m_devices[0].at("id")});
        ids.push_back({{"id", m_devices[1].at("id")}});
        const std::string content(75000, 'x');
        QCOMPARE(send("/v1/config_file_upload", {{"tid", task.at("tid")}, {"device_ids", ids}},
                      {{"fimage", "a.cfg", content}}),
                 0);
        COMPARE_JSON(outcomes(), Json::array({done, done}));
        m_emulator.reset();
    }

    void refused_data() {
        QTest::addColumn<QString>("fault");
        QTest::addColumn<int>("size");
        QTest::addColumn<QString>("parameters");
        QTest::addColumn<int>("status");
        QTest::addColumn<int>("code");
        const auto row = [](const char *name, const char *fault, int size, const char *parameters, int status,
                            int code) {
            QTest::newRow(name) << fault << size << parameters << status << code;
        };
        row("over the limit", "", 50000001, "{}", 413, -1);
        row("early", "early=413", 100, "{}", 413, 0);
        row("reset in the body", "cut-body=5000000", 9000000, "{}", 0, -1);
        row("slow", "slow-body=1000000", 100, "{}", 200, 0);
        row("unknown task", "", 100, R"({"tid": "TK404"})", 200, 4);
        row("no task", "", 100, R"({"tid": ""})", 200, 3);
    }

    void refused() {
        QFETCH(QString, fault);
        QFETCH(int, size);
        QFETCH(QString, parameters);
        if (!fault.isEmpty())
            QCOMPARE(command("fault " + fault + "@/v1/fwupl"), QString("ok"));
        Json members = {{"tid", newTask("deviceFWUpgrade", 1).at("tid")}};
        members.update(Json::parse(parameters.toStdString()));
        const Reply reply =
            m_caller.sendForm("/v1/fwupl", members, {{"fimage", "i", std::string(std::size_t(size), 'x')}});
        QTEST(reply.status, "status");
        QTEST(reply.code, "code");
    }

    void badForms() {
        const Json task = newTask("deviceRestart", 1), firmware = newTask("deviceFWUpgrade", 1);
        const Json tid = {{"tid", firmware.at("tid")}};
        QCOMPARE(send("/v1/fwupl", {{"tid", task.at("tid")}}, {{"fimage", "i", "x"}}), 3);
        QCOMPARE(send("/v1/fwupl", tid, {}), 3);
        QCOMPARE(send("/v1/fwupl", tid, {{"other", "i", "x"}}), 3);
        QCOMPARE(code("/v1/fwupl", tid), 3);
        for (const QString &path : {m_emulator->root(), m_emulator->root() + "/none", QString("/dev/zero")}) {
            const Json local = {{"tid", firmware.at("tid")}, {"local", path.toStdString()}, {"localn", "i"}};
            QCOMPARE(m_caller.sendForm("/v1/fwuplex", local, {}).code, 3);
        }
        QCOMPARE(send("/v1/fwupl", tid, {{"fimage", "i", "x"}}), 0);
        QCOMPARE(send("/v1/fwupl", tid, {{"fimage", "i", "x"}}), 3);
    }

    void firmwareLimit() {
        QCOMPARE(code("/v1/config/set", {{"svr_fw_upload_limit_enabled", true}, {"svr_fw_upload_limit", 3}}),
                 0);
        for (int i = 0; i < 2; ++i) {
            const Json task = newTask("deviceFWUpgrade", 5);
            QCOMPARE(send("/v1/fwupl", {{"tid", task.at("tid")}}, {{"fimage", "i", "x"}}), 0);
        }
        std::size_t max = 0;
        QTRY_VERIFY_WITH_TIMEOUT((max = std::max(max, running()), inState("pTaskDone") >= 2), 10000);
        QCOMPARE(max, std::size_t{3});
    }

private:
    int send(const std::string &path, const Json &parameters, const std::vector<File> &files) {
        return m_caller.sendForm(path, parameters, files).code;
    }
    /// Changes the record of the first device.
    void change(Json members) {
        members["id"] = m_devices[0].at("id");
        QCOMPARE(code("/v1/dev/commit", {{"state", "all"}, {"devices", Json::array({members})}}), 0);
    }
    static bool isOver(const std::string &state) {
        return state != "pTaskQueueState" && state != "pTaskProcessing" && state != "pTaskInitState";
    }
    std::size_t running() {
        return withStatus("action_status", "deviceFWUpgrade");
    }
    std::size_t inState(const char *state) {
        const Json tasks = m_caller.call("/v1/task/list", {{"start", 0}, {"count", 2}}).data;
        return count(tasks, "state", state);
    }
};

NVLDM_GUILESS_TEST(EmulatorUploadsTest)
#include "tst_emulatoruploads.moc"
