#include "fleettest.h"
#include "support/testmain.h"

#include <QTest>

/// Tasks, and the alarms and log entries that the service writes beside them.
class EmulatorTasksTest : public FleetTest {
    Q_OBJECT

private slots:
    void lifecycle() {
        fresh();
        const Json task = newTask("deviceRestart", 30), tids = Json::array({task.at("tid")});
        COMPARE_JSON(task.at("state"), "pTaskInitState");
        COMPARE_JSON(task.at("devices")[7].at("d_mac"), m_devices[7].at("d_mac"));
        COMPARE_JSON(runUnder(task)[0], Json({{"id", m_devices[0].at("id")}, {"status", 0}, {"body", ""}}));
        COMPARE_JSON(newest().at("status"), "pTaskQueueState");
        QCOMPARE(code("/v1/task/rm", {{"tids", tids}}), 3);
        std::size_t maxUnreachable = 0, maxRunning = 0;
        for (Json last = newest(), now = last; now.at("active"); last = now, now = newest()) {
            maxUnreachable = std::max(maxUnreachable, withStatus("connect_status", "Unreachable"));
            maxRunning = std::max(maxRunning, withStatus("action_status", "deviceRestart"));
            QVERIFY(now.at("progress") >= last.at("progress"));
        }
        QVERIFY(maxUnreachable > 0 && maxUnreachable <= 20);
        QCOMPARE(maxRunning, std::size_t{20});
        COMPARE_JSON(newest().at("state"), "pTaskDone");
        QCOMPARE(count(newest().at("devices"), "progress", 100), std::size_t{30});
        QCOMPARE(withStatus("connect_status", "Connected") + withStatus("action_status", "Standby"), 80UL);
        QCOMPARE(close(task, "pTaskAborted"), 3);
        QCOMPARE(code("/v1/task/rm", {{"tids", {tids[0], "TK404"}}}), 4);
        QCOMPARE(code("/v1/task/rm", {{"tids", tids}}), 0);
        QVERIFY(m_caller.list("/v1/task/list", 300).empty());
        QVERIFY(newTask("deviceDance", 1).is_null() && newTask("deviceRestart", 0).is_null());
    }

    void failuresAndAbort() {
        Json outcomes = Json::array();
        for (int run = 0; run < 2; ++run) {
            fresh({"--task-failures", "0.5"});
            m_emulator->command("drop " + QString::fromStdString(m_devices[3].at("id")));
            runUnder(newTask("deviceCustomCommand", 30));
            outcomes.push_back(ended());
        }
        COMPARE_JSON(outcomes[0].at("state"), "pTaskFailed");
        COMPARE_JSON(outcomes[0].at("devices")[3].at("state"), "pTaskFailedToConnectToDevice");
        QVERIFY(count(outcomes[0].at("devices"), "state", "pTaskDone") > 3);
        COMPARE_JSON(outcomes[0].at("devices"), outcomes[1].at("devices"));
        QCOMPARE(m_emulator->command("task-pace 300"), "ok");
        const Json task = newTask("deviceFWUpgrade", 30);
        runUnder(task);
        QTRY_VERIFY(newest().at("devices")[3].at("state") == "pTaskFailedToConnectToDevice");
        QCOMPARE(close(task, "pTaskProcessing"), 3);
        QCOMPARE(close(task, "pTaskAborted"), 0);
        QVERIFY(count(newest().at("devices"), "state", "pTaskAborted") > 10);
        QCOMPARE(withStatus("action_status", "Standby"), std::size_t{40});
    }

    void waiting() {
        fresh({"--task-work-timeout", "300"});
        COMPARE_JSON(newTask("devicePackageUpload", 2).at("active"), true);
        COMPARE_JSON(ended().at("state"), "pTaskFailed");
        QVERIFY(m_emulator->command("task deviceFWUpgrade 5 500").startsWith("ok TK"));
        COMPARE_JSON(newest().at("state"), "pTaskScheduled");
        COMPARE_JSON(ended().at("state"), "pTaskDone");
    }

    void alarmsAndLog() {
        fresh({"--log-entries", "300"});
        const std::size_t before = alarms().at("total_items");
        QCOMPARE(m_emulator->command("drop 25"), "ok 25 devices");
        const Json alarm = alarms().at("items")[0];
        COMPARE_JSON(alarms().at("total_items"), before + 25);
        QCOMPARE(count(alarms().at("items"), "despid", 2), std::size_t{25});
        QCOMPARE(count(m_devices, "id", alarm.at("deviceid")), std::size_t{1});
        QCOMPARE(code("/v1/alarm/rm", {{"alids", {alarm.at("alid"), "AL0"}}}), 4);
        QCOMPARE(code("/v1/alarm/rm", {{"alids", Json::array({alarm.at("alid")})}}), 0);
        COMPARE_JSON(alarms().at("total_items"), before + 24);
        const auto read = [&](const Json &from, const Json &to) {
            return m_caller.call("/v1/logs/list", {{"start_time", from}, {"end_time", to}});
        };
        const Json all = read("0", "99999999999999").data.at("items");
        QVERIFY(count(all, "type", "Alarm") >= 25 && count(all, "user", "admin") > 0);
        const std::string from = all[200].at("created_at").dump(), to = all[100].at("created_at").dump();
        COMPARE_JSON(read(from, to).data.at("items"), Json(all.begin() + 100, all.begin() + 201));
        QVERIFY(read("soon", "9").code == 3 && read("-1", "9").code == 3 && read(5, "9").code == 3);
    }

    void settingsActAndAreJudged() {
        fresh({"--log-entries", "800"});
        const auto log = [&] {
            return m_caller.call("/v1/logs/list", {{"start_time", "0"}, {"end_time", "99999999999999"}})
                .data.at("items");
        };
        const std::size_t all = log().size();
        for (const Json &bad : Json::array({{{"log_keepdays", 0}},
                                            {{"log_keepdays", 1096}},
                                            {{"days", "3"}},
                                            {{"svr_fw_upload_limit", 51}},
                                            {{"rp_keepnum", 2.5}},
                                            {{"nf_alarms", 1}},
                                            {{"ui_lang", nullptr}},
                                            {{"nf_tasks", false}, {"rp_auto", "no"}}}))
            QVERIFY2(code("/v1/config/set", bad) == 3, bad.dump().c_str());
        COMPARE_JSON(m_caller.call("/v1/config/get").data.at("nf_tasks"), true);
        QCOMPARE(log().size(), all);
        QCOMPARE(code("/v1/config/set", {{"days", 4}, {"color", 7}, {"nf_tasks", true}}), 0);
        const Json left = log();
        // Half of the eight days, and the entry about the change.
        QVERIFY(left.size() > all / 3 && left.size() < all * 2 / 3);
        COMPARE_JSON(left[0].at("description"), "Settings changed: log_keepdays 30 -> 4");
        COMPARE_JSON(left[0].at("user"), "admin");
        QCOMPARE(code("/v1/config/set", {{"log_keepdays", 4}}), 0);
        QCOMPARE(code("/v1/site/new", {{"sitename", "Hall"}, {"parentid", ""}}), 0);
        COMPARE_JSON(log()[0].at("description"), "Site added: Hall");
        QCOMPARE(log().size(), left.size() + 1);
    }

    void survivesCrash() {
        fresh();
        runUnder(newTask("deviceCustomCommand", 3));
        const Json finished = ended(), removed = newTask("deviceRestore", 1);
        QCOMPARE(close(removed, "pTaskFailed"), 0);
        QCOMPARE(code("/v1/task/rm", {{"tids", Json::array({removed.at("tid")})}}), 0);
        QCOMPARE(m_emulator->command("task-pace 60000"), "ok");
        const Json unfinished = newTask("deviceSetTemplate", 4), alarm = alarms().at("items")[0];
        runUnder(unfinished);
        m_emulator->kill();
        start({"--task-pace", "40"});
        COMPARE_JSON(ended().at("tid"), unfinished.at("tid"));
        COMPARE_JSON(newest().at("state"), "pTaskDone");
        QCOMPARE(m_caller.list("/v1/task/list", 300).size(), std::size_t{2});
        COMPARE_JSON(m_caller.list("/v1/task/list", 300)[1], finished);
        COMPARE_JSON(alarms().at("items")[1], alarm);
    }

private:
    Json alarms() { return m_caller.call("/v1/alarm/list", {{"start", 0}, {"count", 1000}}).data; }
};

NVLDM_GUILESS_TEST(EmulatorTasksTest)
#include "tst_emulatortasks.moc"
