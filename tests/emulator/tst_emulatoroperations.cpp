#include "fleettest.h"
#include "support/testmain.h"

#include <QTest>

#include <zlib.h>

#include <set>

namespace {

const std::string setPassword = "/cgi-bin/admin/editaccount.cgi?method=edit&username=root&userpass=";
const std::string setParameters = "/cgi-bin/admin/setparam.cgi?";
const QStringList quick = {"--task-pace", "20", "--block-time", "700"};
constexpr auto failedPassword = "pTaskFailedToSetPassword";

quint32 number(const std::string &bytes, std::size_t at, int width) {
    quint32 value = 0;
    for (int i = width - 1; i >= 0; --i)
        value = value << 8 | static_cast<unsigned char>(bytes.at(at + std::size_t(i)));
    return value;
}

/// The texts of an archive as its directory tells them; those that are not whole are left out.
QStringList filesOfZip(const std::string &zip) {
    QStringList files;
    std::size_t entry = number(zip, zip.size() - 6, 4);
    for (quint32 i = 0; i < number(zip, zip.size() - 12, 2); ++i) {
        const std::size_t nameLength = number(zip, entry + 28, 2), head = number(zip, entry + 42, 4);
        const std::string content = zip.substr(head + 30 + nameLength, number(zip, entry + 24, 4));
        const auto crc = crc32(0, reinterpret_cast<const Bytef *>(content.data()), uInt(content.size()));
        const bool heads = zip.compare(head, 4, "PK\3\4") == 0 && zip.compare(entry, 4, "PK\1\2") == 0;
        if (heads && crc == number(zip, entry + 16, 4) && crc == number(zip, head + 14, 4))
            files << QString::fromStdString(content);
        entry += 46 + nameLength;
    }
    return files;
}

} // namespace

/// What devices do for operations: passwords, restores, addresses, settings, and what they report.
class EmulatorOperationsTest : public FleetTest {
    Q_OBJECT

private slots:
    void init() {
        if (!m_emulator)
            fresh(quick);
        QVERIFY(command("admit all").startsWith("ok"));
        m_devices = m_caller.list("/v1/dev/list");
    }

    void passwordCommand_data() {
        QTest::addColumn<QString>("command");
        QTest::addColumn<int>("mask");
        QTest::addColumn<QString>("state");
        QTest::addColumn<QString>("authorization");
        const auto row = [](const char *name, const char *command, int mask, const char *state,
                            const char *authorization = "Authorized") {
            QTest::newRow(name) << QString("/cgi-bin/admin/editaccount.cgi?") + command << mask << state
                                << authorization;
        };
        row("owner", "method=edit&username=root&userpass=Ab3!Ab3!", 31, "pTaskDone", "Invalid Password");
        row("other account", "method=edit&username=admin&userpass=Ab3!Ab3!", 31, "pTaskDone");
        row("unknown account", "method=edit&username=bob&userpass=Ab3!Ab3!", 0, failedPassword);
        row("short", "method=edit&username=root&userpass=Ab3!Ab3", 0, failedPassword);
        row("no letter", "method=edit&username=root&userpass=1234567!", 1, failedPassword);
        row("no special", "method=edit&username=root&userpass=Abcd1234", 2, failedPassword);
        row("no digit", "method=edit&username=root&userpass=Abcdefg!", 4, failedPassword);
        row("no lower", "method=edit&username=root&userpass=ABCD123!", 8, failedPassword);
        row("no upper", "method=edit&username=root&userpass=abcd123!", 16, failedPassword);
        row("foreign character", "method=edit&username=root&userpass=Abcd1234$", 0, failedPassword);
        row("no password", "method=edit&username=root", 0, failedPassword);
        row("other method", "method=add&username=root&userpass=Ab3!Ab3!", 0, "pTaskUnsupportedMethod");
    }

    void passwordCommand() {
        QFETCH(QString, command);
        QFETCH(int, mask);
        const Json policy = newTask("devicePassPolicy", 1);
        const Json body = {{"devices", under(policy)},
                           {"plen", 8},
                           {"type", std::to_string(mask)},
                           {"tid", policy.at("tid")}};
        QCOMPARE(code("/v1/dev/setpolicy", body), 0);
        COMPARE_JSON(outcomes(), Json::array({"pTaskDone"}));
        COMPARE_JSON(record(0).at("d_policy"), Json({{"plen", 8}, {"type", mask}}));
        runUnder(newTask("deviceChangePass", 1), command.toStdString());
        QTEST(QString::fromStdString(outcomes()[0]), "state");
        QTEST(QString::fromStdString(authorization(0)), "authorization");
    }

    void authorizedAgain() {
        runUnder(newTask("deviceChangePass", 1), setPassword + "New%41!pass9");
        COMPARE_JSON(outcomes(), Json::array({"pTaskDone"}));
        QCOMPARE(offer("NewA!pass9"), "Invalid Password");
        m_emulator->kill();
        start(quick);
        QCOMPARE(offer("New%41!pass9"), "Authorized");
        for (int i = 0; i < 4; ++i)
            QCOMPARE(offer("wrongwrong"), "Invalid Password");
        QCOMPARE(offer("wrongwrong"), "Account Blocked");
        QTRY_COMPARE(authorization(0), "Invalid Password");
        QCOMPARE(offer("New%41!pass9"), "Authorized");
    }

    void restore_data() {
        QTest::addColumn<QString>("parameters");
        QTest::addColumn<bool>("keepsNetwork");
        QTest::addColumn<QString>("authorization");
        QTest::newRow("everything") << "system_restore=1" << false << "Set Password";
        QTest::newRow("but the network")
            << "system_restoreexceptnet=1&system_restoreexceptdst=-1" << true << "Authorized";
        QTest::newRow("but the lens")
            << "system_restoreexceptnet=-1&system_restoreexceptlen=1" << false << "Authorized";
    }

    void restore() {
        QFETCH(QString, parameters);
        QFETCH(bool, keepsNetwork);
        fresh(quick);
        runUnder(newTask("deviceRestore", 40), setParameters + parameters.toStdString());
        QCOMPARE(count(ended().at("devices"), "state", "pTaskDone"), std::size_t{40});
        const Json after = m_caller.list("/v1/dev/list");
        QCOMPARE(count(after, "d_audio", "unmute"), std::size_t{40});
        std::size_t kept = 0;
        std::set<std::string> addresses;
        for (std::size_t i = 0; i < after.size(); ++i) {
            kept += after[i].at("d_ip") == m_devices[i].at("d_ip") ? 1 : 0;
            addresses.insert(after[i].at("d_ip"));
        }
        QCOMPARE(kept, std::size_t{keepsNetwork ? 40U : 0U});
        QCOMPARE(addresses.size(), std::size_t{40});
        QTEST(QString::fromStdString(authorization(3)), "authorization");
    }

    void unfitDevices() {
        fresh(quick);
        setStatus(0, "Unauthorized");
        setStatus(1, "-", "Unreachable");
        const Json task = newTask("deviceRestart", 5);
        const QString removed = QString::fromStdString(m_devices[2].at("id"));
        QCOMPARE(command("remove " + removed), QString("ok 1 device"));
        QCOMPARE(runUnder(task, setParameters + "system_reset=0").size(), std::size_t{5});
        const Json expected = {"pTaskMismatchingStatus", "pTaskFailedToConnectToDevice", "pTaskNotInstalled",
                               "pTaskDone", "pTaskDone"};
        COMPARE_JSON(outcomes(), expected);
        // The removed device is known to nobody when the second task is made.
        runUnder(newTask("deviceRestart", 5), setParameters + "system_reset=0");
        COMPARE_JSON(outcomes(), expected);
        QVERIFY(m_caller.call("/v1/task/init", {{"type", "deviceRestart"}, {"devices", {"DV404"}}}).code ==
                4);
    }

    void addressesByHand_data() {
        QTest::addColumn<QString>("change");
        QTest::addColumn<int>("code");
        const auto row = [](const char *name, const char *change, int code) {
            QTest::newRow(name) << change << code;
        };
        row("mask with holes", R"([{"op": "replace", "path": "/mask", "value": "255.0.255.0"}])", 3);
        row("no mask", R"([{"op": "replace", "path": "/mask", "value": ""}])", 3);
        row("gateway text", R"([{"op": "replace", "path": "/gate", "value": "10.8.0"}])", 3);
        row("gateway of a network", R"([{"op": "replace", "path": "/gate", "value": "10.8.0.0"}])", 3);
        row("name server", R"([{"op": "replace", "path": "/dns1", "value": "somewhere"}])", 3);
        row("duplicate", R"([{"op": "replace", "path": "/devices/1/ip", "value": "10.8.0.7"}])", 3);
        row("broadcast", R"([{"op": "replace", "path": "/devices/0/ip", "value": "10.8.0.255"}])", 3);
        row("other task", R"([{"op": "replace", "path": "/tid", "value": "TK404"}])", 4);
        row("sound", R"([])", 0);
    }

    void addressesByHand() {
        QFETCH(QString, change);
        Json body = {{"mask", "255.255.255.0"}, {"gate", "10.8.0.1"}, {"dns1", ""}, {"dns2", ""}};
        body["tid"] = newTask("deviceAssignIPManual", 5).at("tid");
        // The last two addresses are another device's and one beyond the gateway's network.
        const Json ips = {"10.8.0.7", "10.8.0.8", m_devices[0].at("d_ip"), m_devices[9].at("d_ip"),
                          "10.9.0.9"};
        for (std::size_t i = 0; i < 5; ++i)
            body["devices"].push_back({{"id", m_devices[i].at("id")}, {"ip", ips[i]}});
        body = body.patch(Json::parse(change.toStdString()));
        QTEST(code("/v1/assip/manual", body), "code");
        if (QString(QTest::currentDataTag()) == "sound") {
            const auto mismatch = "pTaskMismatchingStatus";
            COMPARE_JSON(outcomes(), Json({"pTaskDone", "pTaskDone", mismatch, mismatch, mismatch}));
            COMPARE_JSON(record(0).at("d_ip"), "10.8.0.7");
            COMPARE_JSON(record(1).at("d_nettype"), "static");
            COMPARE_JSON(record(3).at("d_ip"), m_devices[3].at("d_ip"));
        }
    }

    void addressesAutomatically() {
        const Json task = newTask("deviceAssignIPAuto", 3);
        Json body = {{"tid", task.at("tid")}, {"devices", Json::array()}};
        for (const Json &device : task.at("devices"))
            body["devices"].push_back(device.at("id"));
        QCOMPARE(code("/v1/assip/auto", body), 0);
        COMPARE_JSON(outcomes(), Json({"pTaskDone", "pTaskDone", "pTaskDone"}));
        const std::string leased = record(2).at("d_ip");
        QVERIFY(leased != m_devices[2].at("d_ip") && leased.rfind("10.20.", 0) == 0);
        QCOMPARE(code("/v1/assip/auto", body), 3);
    }

    void quickSetup_data() {
        QTest::addColumn<QString>("settings");
        QTest::addColumn<QString>("member");
        QTest::addColumn<QString>("value");
        const auto row = [](const char *settings, const char *member, const char *value) {
            QTest::newRow(settings) << settings << member << value;
        };
        row(R"({"powerfreq": "60"})", "d_powerfreq", "60");
        row(R"({"powerfreq": 50})", "d_powerfreq", "50");
        row(R"({"powerfreq": 55})", "", "");
        row(R"({"mute": true})", "d_audio", R"("mute")");
        row(R"({"mute": "0"})", "d_audio", R"("unmute")");
        row(R"({"date": "2026-3-1", "time": "7:05"})", "d_dtime", R"("2026/03/01 07:05:00")");
        row(R"({"date": "2026/13/01"})", "", "");
        row(R"({"server1": "a.example", "server2": "", "server3": "b.example", "timesync": "ntp"})",
            "d_timeservers", R"(["a.example","b.example"])");
        row(R"({"posixTz": "CET-1CEST,M3.5.0,M10.5.0/3"})", "d_timezone", R"("CET-1CEST,M3.5.0,M10.5.0/3")");
        row(R"({"posixTz": "nowhere"})", "", "");
        row("{}", "", "");
    }

    void quickSetup() {
        QFETCH(QString, settings);
        QFETCH(QString, member);
        QFETCH(QString, value);
        Json body = Json::parse(settings.toStdString());
        body["devices"] = under(newTask("deviceQuickSetup", 2));
        QCOMPARE(code("/v1/quicksetup", body), member.isEmpty() ? 3 : 0);
        if (!member.isEmpty()) {
            COMPARE_JSON(outcomes(), Json({"pTaskDone", "pTaskDone"}));
            QCOMPARE(record(1).at(member.toStdString()).dump(), value.toStdString());
        }
    }

    void configuration() {
        const Json device = {{"deviceid", m_devices[0].at("id")}};
        COMPARE_JSON(m_caller.call("/v1/config/query", device).data.at("Network").at("mac"),
                     m_devices[0].at("d_mac"));
        const auto apply = [&](const char *yaml) {
            const Json targets = under(newTask("deviceSetTemplate", 1));
            return code("/v1/config/config", {{"devices", targets}, {"template", yaml}});
        };
        QCOMPARE(apply("System:\n  hostname: gate-7\n  firmware: 9.9\nMedia: {audio: mute}\nElse: 1\n"), 0);
        COMPARE_JSON(outcomes(), Json::array({"pTaskDone"}));
        COMPARE_JSON(record(0).at("d_hostname"), "gate-7");
        COMPARE_JSON(record(0).at("d_audio"), "mute");
        COMPARE_JSON(record(0).at("d_fw"), m_devices[0].at("d_fw"));
        QVERIFY(apply("System: [") == 3 && apply("just a text") == 3 && apply("Network: {http: 70000}") == 3);
        QCOMPARE(apply(std::string(100000, '[').c_str()), 3);
        setStatus(0, "-", "Unreachable");
        QCOMPARE(code("/v1/config/query", device), 111);
        QCOMPARE(code("/v1/config/query", {{"deviceid", "DV404"}}), 4);
    }

    void debugExport() {
        fresh(quick);
        setStatus(1, "Unauthorized");
        const Json task = newTask("deviceExportDeviceInfo", 3);
        const Json tid = {{"tid", task.at("tid")}};
        QCOMPARE(code("/v1/export/debif", {{"storepath", "/tmp/x"}, {"devices", under(task)}}), 0);
        QCOMPARE(code("/v1/export/file", tid), 3);
        QCOMPARE(code("/v1/export/file", {{"tid", "TK404"}}), 4);
        ended();
        const Reply reply = m_caller.call("/v1/export/file", tid);
        QCOMPARE(reply.contentType, "application/octet-stream");
        const QStringList files = filesOfZip(reply.bytes);
        QCOMPARE(files.size(), 2);
        QVERIFY(files[1].contains("d_mac: " + QString::fromStdString(m_devices[2].at("d_mac"))));
    }

private:
    /// The status that comes of the offer of a password to the first device.
    std::string offer(const std::string &password) {
        const Json body = {{"devices", {m_devices[0].at("id")}},
                           {"acc", "root"},
                           {"pass", ServiceCaller::cipheredPassword(password)}};
        code("/v1/dev/auth", body);
        QTest::qWait(950);
        return authorization(0);
    }
};

NVLDM_GUILESS_TEST(EmulatorOperationsTest)
#include "tst_emulatoroperations.moc"
