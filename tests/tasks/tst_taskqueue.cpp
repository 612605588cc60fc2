#include "api/session/servicesession.h"
#include "api/session/sessionevents.h"
#include "support/fakelists.h"
#include "support/isolatedroot.h"
#include "support/logcapture.h"
#include "support/testmain.h"
#include "tasks/queue/failedoperations.h"
#include "tasks/queue/taskqueue.h"
#include "tasks/service/retryregistry.h"
#include "tasks/service/taskinfopool.h"
#include "tasks/service/tasktargets.h"

#include <QCoreApplication>
#include <QSemaphore>
#include <QSignalSpy>
#include <QTest>

#include <stdexcept>
#include <thread>

using nlohmann::json;

namespace {

/// What the test's records do when their turn comes.
std::function<unsigned(TaskContext &)> work;

constexpr TaskKind::Lines lines = {"failed (%d)", "worked", "threw: ", "no update: "};
constexpr auto plainIds = [](const JSON &record) { return TaskTargets::ids(record.at("devices")); };
constexpr auto withPass = [](const JSON &record) {
    return TaskTargets::withMembers(record.at("devices"), record, {"pass"});
};
constexpr auto announce = [](const TaskContext &) {};
constexpr auto doWork = [](TaskContext &step) { return work(step); };

constexpr TaskKind families[] = {
    {"plain", "deviceRestart", "plain_", "devices", false, false, nullptr, lines, plainIds, announce, doWork},
    {"secret", "deviceChangePass", "secret_", "devices", false, true, nullptr, lines, withPass, announce,
     doWork},
};

class Queue : public TaskQueue {
public:
    Queue() : TaskQueue(families, "walk: ") {}
    using TaskQueue::insert;

    QString add(const char *type = "plain", const JSON &devices = {"DV1", "DV2"}) {
        QString ctid;
        insert(type, {{"devices", devices}, {"pass", "P1:cipher"}}, &ctid);
        return ctid;
    }
};

} // namespace

Q_DECLARE_METATYPE(FailedSubmission)
Q_DECLARE_METATYPE(ScriptedPeer::Reply)

/// The queue of both task managers, with families of the test's own.
class TestTaskQueue : public QObject {
    Q_OBJECT

private slots:
    void init() {
        m_log = std::make_unique<LogCapture>();
        m_service = std::make_unique<FakeLists>();
        m_queue = std::make_unique<Queue>();
        work = [](TaskContext &) { return unsigned(ApiOk); };
    }
    void cleanup() {
        m_queue.reset();
        m_service.reset();
        CTaskInfoPool::instance().clear();
        RetryRegistry::instance().clear();
        QCoreApplication::processEvents();
        m_log.reset();
    }

    void recordsRunInOrderAndLateOnesInTheSameWalk() {
        QStringList done;
        QSemaphore begun, goOn;
        work = [&](TaskContext &step) {
            begun.release();
            goOn.acquire();
            done += QString::fromStdString(step.text("ctid"));
            return unsigned(ApiOk);
        };
        const QString first = m_queue->add();
        const QString second = m_queue->add();
        std::thread walk([&] { m_queue->handlingTask(); });
        begun.acquire();
        QCOMPARE(m_queue->stateOf(first), QString("applying"));
        QCOMPARE(m_queue->stateOf(second), QString("init"));
        const QString late = m_queue->add();
        goOn.release(3);
        walk.join();
        QCOMPARE(done, QStringList({first, second, late}));
        QCOMPARE(m_queue->stateOf(late), QString("apply_done"));
        QCOMPARE(m_log->count("worked"), 3);
        QCOMPARE(m_log->count("API access info ip: 127.0.0.1, port: "), 3);
    }

    void timerStartsTheWorkAndTellsOfIt() {
        QSignalSpy made(m_queue.get(), &TaskQueue::serviceTaskMade);
        std::atomic<quint32> error = 99;
        std::atomic<quintptr> context = 0;
        m_queue->setCompletionCallback(7, [&](quintptr c, quint32 e) { context = c, error = e; });
        work = [](TaskContext &step) {
            return step.text("ctid").starts_with("plain_") &&
                           CTaskInfoPool::instance().taskList()->find(QString::fromStdString(step.tid))
                       ? unsigned(ApiServerError)
                       : unsigned(ApiOk);
        };
        const QString ctid = m_queue->add();
        // Failed on purpose: by then the list that is shown had the new task.
        QTRY_COMPARE(m_queue->stateOf(ctid), QString("apply_fail"));
        QTRY_COMPARE(made.value(0), QVariantList({ctid, "T1"}));
        QCOMPARE(m_log->count("failed (15)"), 1);
        QTRY_COMPARE(error.load(), quint32(ApiServerError));
        QCOMPARE(context.load(), quintptr(7));
    }

    void taskThatCannotBeMadeStaysAndIsTold_data() {
        QTest::addColumn<int>("code");
        QTest::addColumn<std::string>("made");
        QTest::addColumn<QString>("reason");
        const QString unreadable = "Reason: the server's answer could not be read.";
        QTest::newRow("refused") << 3 << std::string("null") << QString("Reason: the server refused it.");
        QTest::newRow("no tid") << 0 << std::string("{}") << unreadable;
        QTest::newRow("null tid") << 0 << std::string(R"({"tid":null})") << unreadable;
        QTest::newRow("no object") << 0 << std::string("[1]") << unreadable;
    }
    void taskThatCannotBeMadeStaysAndIsTold() {
        QFETCH(int, code);
        QFETCH(std::string, made);
        QFETCH(QString, reason);
        if (code != 0)
            m_service->refuse("/v1/task/init", code);
        m_service->setTaskMade(json::parse(made));
        QSignalSpy failed(m_queue.get(), &TaskQueue::handOverFailed);
        bool worked = false;
        work = [&](TaskContext &) { return worked = true, unsigned(ApiOk); };
        const QString ctid = m_queue->add("secret");
        m_queue->handlingTask();
        m_queue->handlingTask();
        QTRY_COMPARE(failed.count(), 1);
        const auto failure = failed[0][0].value<FailedSubmission>();
        QCOMPARE(failure.ctid, ctid);
        QCOMPARE(failure.serviceType, QString("deviceChangePass"));
        QCOMPARE(failure.devices, 2);
        QCOMPARE(failure.reason, reason);
        QCOMPARE(m_queue->stateOf(ctid), QString("applying"));
        QVERIFY(!worked);

        // Started again it is a new task, with the password that the first one never got rid of.
        m_service->refuse("/v1/task/init", 0);
        m_service->setTaskMade(nullptr);
        m_queue->startAgain(ctid);
        m_queue->handlingTask();
        QVERIFY(worked);
        const std::vector<json> sent = m_service->sentTo("/v1/task/init");
        QCOMPARE(sent.size(), 2u);
        QVERIFY(sent[1]["devices"] == sent[0]["devices"]);
        QVERIFY(sent[1]["devices"][0]["pass"] == "P1:cipher");
    }

    void removedDevicesAreLeftOut() {
        m_service->setDevices({{{"id", "DV1"}, {"d_mac", "AA:00:00:00:00:01"}}, {{"id", "DV3"}, {"d_mac", "AA:00:00:00:00:03"}}});
        QSignalSpy leftOut(m_queue.get(), &TaskQueue::devicesLeftOut);
        QSignalSpy failed(m_queue.get(), &TaskQueue::handOverFailed);
        JSON files;
        work = [&](TaskContext &step) { return files = step.record["pkey"], unsigned(ApiOk); };
        QString ctid;
        m_queue->insert("plain",
                        {{"devices", {"DV1", "DV2", "DV3"}},
                         {"pkey", {{{"d_mac", "aa-00-00-00-00-01"}}, {{"d_mac", "aa-00-00-00-00-02"}}, {{"fname", "all"}}}}},
                        &ctid);
        m_queue->handlingTask();
        QTRY_COMPARE(leftOut.count(), 1);
        QCOMPARE(leftOut[0], QVariantList({ctid, 1}));
        const std::vector<json> sent = m_service->sentTo("/v1/task/init");
        QCOMPARE(sent.size(), 2u);
        QVERIFY(sent[1]["devices"] == (json{"DV1", "DV3"}));
        QVERIFY(files == (json{{{"d_mac", "aa-00-00-00-00-01"}}, {{"fname", "all"}}}));
        // Nobody is left of these, and the refusal is told as it is.
        m_queue->add("plain", {"DV7", "DV8"});
        m_queue->handlingTask();
        QTRY_COMPARE(failed.count(), 1);
        QCOMPARE(m_service->sentTo("/v1/task/init").size(), 3u);
        QCOMPARE(m_log->count("HTTP API(newTaskState) failed! (15)"), 1);
    }

    void nothingIsToldOfAnEndedSession() {
        QSignalSpy made(m_queue.get(), &TaskQueue::serviceTaskMade);
        QSignalSpy failed(m_queue.get(), &TaskQueue::handOverFailed);
        work = [](TaskContext &) { return unsigned(ApiServerError); };
        m_queue->add();
        m_queue->handlingTask();
        // The worker is done, and the session ends before anybody has heard of it.
        m_service->logIn();
        QCoreApplication::processEvents();
        QCOMPARE(made.count() + failed.count(), 0);
        QVERIFY(!RetryRegistry::instance().find("T1"));
    }

    void repeatOutlivesAListThatSkipsItsTask() {
        RetryRegistry &repeats = RetryRegistry::instance();
        const auto task = std::make_shared<TaskRecord>();
        task->tid = "T1";
        const TaskList with({task}), without;
        repeats.remember("T1", {[](const QStringList &) {}});
        for (int round = 0; round < 2; ++round) {
            repeats.follow(without);
            repeats.follow(without);
            QVERIFY(repeats.find("T1"));
            repeats.follow(with);
        }
        for (int list = 0; list < 3; ++list)
            repeats.follow(without);
        QVERIFY(!repeats.find("T1"));
    }

    void failedHandOverIsTold_data() {
        QTest::addColumn<bool>("throws");
        QTest::newRow("refused") << false;
        QTest::newRow("exception") << true;
    }
    void failedHandOverIsTold() {
        QFETCH(bool, throws);
        work = [throws](TaskContext &) -> unsigned {
            if (throws)
                throw std::runtime_error("no luck");
            return ApiTransportError;
        };
        QSignalSpy failed(m_queue.get(), &TaskQueue::handOverFailed);
        QSignalSpy dialog(m_queue.get(), &TaskQueue::dialogNeeded);
        const QString plain = m_queue->add();
        const QString secret = m_queue->add("secret");
        m_queue->handlingTask();
        QTRY_COMPARE(failed.count(), 2);
        QCOMPARE(m_queue->stateOf(plain), QString("apply_fail"));
        QCOMPARE(m_log->count(throws ? "threw: no luck" : "failed (12)"), 2);
        QCOMPARE(m_log->count("failed (12)"), throws ? 0 : 2);
        work = [](TaskContext &) { return unsigned(ApiOk); };
        m_queue->startAgain(plain);
        m_queue->startAgain(secret);
        m_queue->handlingTask();
        QCOMPARE(m_service->sentTo("/v1/task/init").size(), 3u);
        QCOMPARE(dialog.count(), 1);
        QCOMPARE(dialog[0], QVariantList({"deviceChangePass", QStringList({"DV1", "DV2"})}));
    }

    void logOffDropsWhatIsQueued_data() {
        QTest::addColumn<bool>("again");
        QTest::newRow("log-off") << false;
        QTest::newRow("another session at once") << true;
    }
    void logOffDropsWhatIsQueued() {
        QFETCH(bool, again);
        QSemaphore begun, goOn;
        work = [&](TaskContext &step) {
            begun.release();
            goOn.acquire();
            return step.session.call([](CApiClient &client) { return client.runCustomCgis({}, {}); });
        };
        QSignalSpy failed(m_queue.get(), &TaskQueue::handOverFailed);
        const QString running = m_queue->add();
        const QString queued = m_queue->add();
        std::thread walk([&] { m_queue->handlingTask(); });
        begun.acquire();
        if (again) {
            m_service->logIn();
        } else {
            CLocalStore::instance().clearLoginInfo();
            CTaskInfoPool::instance().clear();
            QCOMPARE(m_queue->stateOf(queued), QString("apply_fail"));
        }
        goOn.release(2);
        walk.join();
        QCoreApplication::processEvents();
        QCOMPARE(m_queue->stateOf(running), QString("apply_fail"));
        QCOMPARE(m_queue->stateOf(queued), QString("apply_fail"));
        QCOMPARE(m_service->sentTo("/v1/task/init").size(), 1u);
        QCOMPARE(m_service->sentTo("/v1/cgi/custom").size(), 0u);
        QCOMPARE(failed.count(), 0);
    }

    void unansweredWorkIsNotOfferedAgain_data() {
        QTest::addColumn<ScriptedPeer::Reply>("reply");
        QTest::addColumn<bool>("mayHaveBegun");
        QTest::newRow("refused") << ScriptedPeer::json({{"code", 3}}) << false;
        QTest::newRow("too large") << ScriptedPeer::Reply{ScriptedPeer::http(413, "")} << false;
        QTest::newRow("answer lost") << ScriptedPeer::Reply{} << true;
        QTest::newRow("answer cut") << ScriptedPeer::Reply{"HTTP/1.1 200 OK\r\nContent-Le",
                                                           ScriptedPeer::End::Reset}
                                    << true;
        QTest::newRow("a page") << ScriptedPeer::Reply{ScriptedPeer::http(200, "<html>")} << true;
    }
    void unansweredWorkIsNotOfferedAgain() {
        QFETCH(ScriptedPeer::Reply, reply);
        QFETCH(bool, mayHaveBegun);
        m_service->reply("/v1/cgi/custom", reply);
        json task = taskFor("T1", "pTaskInitState");
        m_service->setTaskMade(task);
        m_service->setTasks({task});
        work = [](TaskContext &step) {
            return step.session.call([](CApiClient &client) {
                return client.runCustomCgis(json::array({"/cgi-bin/x"}), json::array({"DV1"}));
            });
        };
        m_queue->add();
        m_queue->handlingTask();
        FailedOperations &failures = FailedOperations::instance();
        QTRY_COMPARE(failures.count(), 1);
        QCOMPARE(failures.first()->failure.mayHaveBegun, mayHaveBegun);
        QCOMPARE(failures.first()->failure.tid, "T1");
        QCOMPARE(static_cast<bool>(failures.first()->startAgain), !mayHaveBegun);
        QVERIFY(failures.first()->failure.text().contains(mayHaveBegun ? "may have begun" : "did not begin"));
        QVERIFY(RetryRegistry::instance().find("T1"));
        // The list tells by itself that it has begun.
        task["status"] = "pTaskProcessing";
        m_service->setTasks({task});
        CTaskInfoPool::instance().loadTaskStatuses();
        QTRY_COMPARE(CTaskInfoPool::instance().taskList()->find("T1")->status, "pTaskProcessing");
        QCoreApplication::processEvents();
        QCOMPARE(failures.count(), mayHaveBegun ? 0 : 1);
        failures.startFirstAgain();
        QVERIFY2(mayHaveBegun || !RetryRegistry::instance().find("T1"), "offered in one place only");
    }

    void taskOfALostAnswerIsLookedUp_data() {
        QTest::addColumn<QString>("user");
        QTest::addColumn<int>("works");
        QTest::newRow("made") << "admin" << 1;
        QTest::newRow("somebody else's") << "other" << 0;
    }
    void taskOfALostAnswerIsLookedUp() {
        QFETCH(QString, user);
        QFETCH(int, works);
        CTaskInfoPool::instance().loadTaskStatuses();
        QTRY_VERIFY(CTaskInfoPool::instance().isTaskListLoaded());
        json task = taskFor("T7", "pTaskInitState");
        task["user"] = user.toStdString();
        m_service->setTasks({task});
        m_service->reply("/v1/task/init", ScriptedPeer::Reply{});
        std::vector<std::string> tids;
        work = [&](TaskContext &step) { return tids.push_back(step.tid), unsigned(ApiOk); };
        m_queue->add();
        m_queue->handlingTask();
        QCOMPARE(tids, std::vector<std::string>(works, "T7"));
        QCOMPARE(m_service->sentTo("/v1/task/init").size(), 1u);
        QTRY_COMPARE(FailedOperations::instance().count(), 1 - works);
    }

    void endOfTheSessionIsToldAtTheNextLogIn() {
        m_service->refuse("/v1/task/init", 105);
        FailedOperations &failures = FailedOperations::instance();
        m_queue->add();
        m_queue->add();
        const QString followed = m_queue->add();
        m_queue->setFollowed(followed, true);
        m_queue->handlingTask();
        const quint64 generation = CLocalStore::instance().loginInfo().generation;
        QTRY_VERIFY(SessionEvents::instance().wasLost(generation));
        const auto logInAs = [&](const char *account) {
            CLocalStore::instance().clearLoginInfo();
            CTaskInfoPool::instance().clear();
            m_service->logIn();
            const LoginInfo login = CLocalStore::instance().loginInfo();
            CLocalStore::instance().setLoginInfo(login.address, login.port, account, login.token);
            QSignalSpy listed(&CTaskInfoPool::instance(), &CTaskInfoPool::taskListUpdated);
            CTaskInfoPool::instance().loadTaskStatuses();
            return listed.wait();
        };
        m_service->refuse("/v1/task/init", 0);
        QVERIFY(logInAs("somebody"));
        QCOMPARE(failures.count(), 0);
        QVERIFY(logInAs("admin"));
        QCOMPARE(failures.count(), 2);
        QVERIFY(
            failures.first()->failure.text().contains("did not begin. The server has ended the session."));
        int worked = 0;
        work = [&](TaskContext &) { return ++worked, unsigned(ApiOk); };
        failures.startFirstAgain();
        failures.dismissFirst();
        m_queue->handlingTask();
        QCOMPARE(worked, 1);
        QVERIFY(logInAs("admin"));
        QCOMPARE(failures.count(), 0);
    }

    void lostSessionIsReported() {
        m_service->refuse("/v1/task/init", 105);
        QSignalSpy lost(&SessionEvents::instance(), &SessionEvents::sessionLost);
        QSignalSpy failed(m_queue.get(), &TaskQueue::handOverFailed);
        const QString ctid = m_queue->add();
        m_queue->handlingTask();
        QTRY_COMPARE(lost.count(), 1);
        QCOMPARE(failed.count(), 0);
        QCOMPARE(m_queue->stateOf(ctid), QString("apply_fail"));
    }

    void failedDevicesAreRepeated() {
        QSignalSpy made(m_queue.get(), &TaskQueue::serviceTaskMade);
        QSignalSpy dialog(m_queue.get(), &TaskQueue::dialogNeeded);
        JSON record = {{"devices", {"DV1", "DV2"}},
                       {"cert", {{{"d_mac", "aa:00:00:00:00:d1"}}, {{"d_mac", "AA00000000D2"}}, {{"fname", "all"}}}}};
        QVERIFY(m_queue->insert("plain", record));
        m_queue->add("secret");
        JSON files;
        work = [&](TaskContext &step) { return files = step.record.value("cert", files), unsigned(ApiOk); };
        m_queue->handlingTask();
        QTRY_COMPARE(made.count(), 2);
        const RetryRegistry::Repeat *repeat = RetryRegistry::instance().find("T1");
        QVERIFY(repeat && !repeat->needsInput);
        repeat->again({"DV2"});
        const RetryRegistry::Repeat *asking = RetryRegistry::instance().find("T2");
        QVERIFY(asking && asking->needsInput);
        asking->again({"DV1"});
        m_queue->handlingTask();
        const std::vector<json> sent = m_service->sentTo("/v1/task/init");
        QCOMPARE(sent.size(), 3u);
        QVERIFY(sent[2]["devices"] == json::array({"DV2"}));
        QVERIFY(files == (json{{{"d_mac", "AA00000000D2"}}, {{"fname", "all"}}}));
        QCOMPARE(dialog.value(0), QVariantList({"deviceChangePass", QStringList{"DV1"}}));
    }

    void recordThatWouldStopTheWalkIsRefused() {
        QVERIFY(!m_queue->insert("plain", {{"state", 7}, {"devices", {"DV1"}}}));
        QVERIFY(!m_queue->insert("plain", {{"state", nullptr}, {"devices", {"DV1"}}}));
        QVERIFY(!m_queue->insert("other", {{"devices", {"DV1"}}}));
        QVERIFY(!m_queue->insert("plain", JSON()));
        QCOMPARE(m_log->count("Inserting new task with the invalid parameter."), 4);
        m_queue->handlingTask();
        QCOMPARE(m_log->count("walk: "), 0);
    }

private:
    static json taskFor(const char *tid, const char *status) {
        return {{"tid", tid},      {"type", "deviceRestart"},
                {"user", "admin"}, {"status", status},
                {"active", true},  {"devices", {{{"id", "DV1"}}, {{"id", "DV2"}}}}};
    }

    IsolatedRoot m_root;
    std::unique_ptr<LogCapture> m_log;
    std::unique_ptr<FakeLists> m_service;
    std::unique_ptr<Queue> m_queue;
};

NVLDM_GUILESS_TEST(TestTaskQueue)
#include "tst_taskqueue.moc"
