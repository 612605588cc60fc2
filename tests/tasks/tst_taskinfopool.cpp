#include "api/session/servicesession.h"
#include "support/fakelists.h"
#include "support/isolatedroot.h"
#include "support/logcapture.h"
#include "support/testmain.h"
#include "tasks/service/taskinfopool.h"

#include <QSignalSpy>
#include <QTest>

using nlohmann::json;

namespace {

json task(int n, const char *state = "pTaskProcessing", json progress = 10) {
    return {{"tid", "t" + std::to_string(n)},  {"status", state}, {"state", state},
            {"progress", std::move(progress)}, {"active", true},  {"devices", json::array()}};
}

std::vector<json> tasks(int count) {
    std::vector<json> list;
    for (int i = 0; i < count; ++i)
        list.push_back(task(i));
    return list;
}

} // namespace

/// The polls of both lists against a service that says what it likes.
class TestTaskInfoPool : public QObject {
    Q_OBJECT

private slots:
    void init() {
        m_log = std::make_unique<LogCapture>();
        m_service = std::make_unique<FakeLists>();
    }
    void cleanup() {
        QVERIFY(NetTask::waitForAll(10000));
        m_service.reset();
        m_pool.clear();
        m_log.reset();
    }

    void pagesAreReadUntilOneIsShort_data() {
        QTest::addColumn<int>("count");
        QTest::addColumn<int>("requests");
        QTest::newRow("299") << 299 << 1;
        QTest::newRow("300") << 300 << 2;
        QTest::newRow("301") << 301 << 2;
    }
    void pagesAreReadUntilOneIsShort() {
        QFETCH(int, count);
        m_service->setTasks(tasks(count));
        fetch();
        QCOMPARE(static_cast<int>(m_pool.taskList()->records().size()), count);
        const auto bodies = m_service->sentTo("/v1/task/list");
        QTEST(static_cast<int>(bodies.size()), "requests");
        QVERIFY(bodies[0]["count"] == 300);
    }

    void changesAreLatched() {
        m_service->setTasks({task(1)});
        fetch();
        QVERIFY(m_pool.isTaskListLoaded());
        QVERIFY2(!m_pool.isTasksChanged(), "the first list is nothing new");
        fetch();
        QVERIFY(!m_pool.isTasksChanged());
        m_service->setTasks({task(1, "pTaskProcessing", "20")});
        fetch();
        QVERIFY2(m_pool.isTasksChanged(), "progress as a text");
        fetch();
        QVERIFY2(m_pool.isTasksChanged(), "until it is cleared");
        m_pool.clearTasksChanged();
        m_service->setTasks({task(2), task(1, "pTaskProcessing", 20)});
        fetch();
        QVERIFY2(m_pool.isTasksChanged(), "a new task");
        m_pool.clearTasksChanged();
        m_service->setTasks({});
        fetch();
        QVERIFY2(!m_pool.isTasksChanged(), "tasks that are gone");
    }

    void failedFetchKeepsTheList() {
        m_service->setTasks(tasks(2));
        fetch();
        QSignalSpy failed(&m_pool, &CTaskInfoPool::taskListFailed);
        m_service->setTaskAnswer("no list");
        load();
        QTRY_COMPARE(failed.count(), 1);
        m_service->setTasks({{{"tid", 7}}, nullptr});
        load();
        QTRY_COMPARE(failed.count(), 2);
        m_service->refuse("/v1/task/list", 3);
        load();
        QTRY_COMPARE(failed.count(), 3);
        QCOMPARE(m_pool.taskList()->records().size(), 2u);
    }

    /// An operation that waits may hold up all other requests: it does not wait for all pages of a poll.
    void pollGivesUpForAFetch() {
        ScriptedPeer::Reply slow = ScriptedPeer::sealed(tasks(300));
        slow.pause = std::chrono::milliseconds(500);
        m_service->reply("/v1/task/list", slow);
        load();
        QTRY_COMPARE(m_service->rawSentTo("/v1/task/list").size(), std::size_t(1));
        QTest::qWait(50);
        m_service->reply("/v1/task/list", ScriptedPeer::sealed(tasks(7)));
        NetTask::runAndWait([&] {
            ServiceSession session(CLocalStore::instance().loginInfo());
            m_pool.fetchTaskStatuses(session);
        });
        QVERIFY(NetTask::waitForAll(5000));
        const auto bodies = m_service->sentTo("/v1/task/list");
        QCOMPARE(bodies.size(), std::size_t(2));
        QVERIFY(bodies[1]["start"] == 0);
        QCOMPARE(m_pool.taskList()->records().size(), std::size_t(7));
    }

    void taskListOfAnEndedSessionIsNobodys() {
        m_service->setTasks(tasks(2));
        QSignalSpy updated(&m_pool, &CTaskInfoPool::taskListUpdated);
        ServiceSession session(CLocalStore::instance().loginInfo());
        CLocalStore::instance().clearLoginInfo();
        m_pool.clear();
        m_pool.fetchTaskStatuses(session);
        QCoreApplication::processEvents();
        QCOMPARE(updated.count(), 0);
        QVERIFY(m_pool.taskList()->isEmpty());
    }

    void listOfAnEndedSessionIsNotTold() {
        m_service->setTasks(tasks(2));
        ServiceSession session(CLocalStore::instance().loginInfo());
        QSignalSpy tasksTold(&m_pool, &CTaskInfoPool::taskListUpdated);
        QSignalSpy alarmsTold(&m_pool, &CTaskInfoPool::alarmListUpdated);
        m_pool.fetchTaskStatuses(session);
        m_pool.loadAlarmInfo();
        QVERIFY(NetTask::waitForAll(5000));
        QVERIFY(m_pool.isTaskListLoaded() && m_pool.isAlarmListLoaded());
        // Both are read, and the session ends before anybody has heard of it.
        CLocalStore::instance().clearLoginInfo();
        m_pool.clear();
        m_service->logIn();
        QCoreApplication::processEvents();
        QCOMPARE(tasksTold.count() + alarmsTold.count(), 0);
    }

    void totalOfEveryType_data() {
        QTest::addColumn<QByteArray>("total");
        QTest::addColumn<int>("expected");
        QTest::newRow("integer") << QByteArray("7") << 7;
        QTest::newRow("fraction") << QByteArray("7.9") << 7;
        QTest::newRow("huge") << QByteArray("1e300") << 2147483647;
        for (const char *wrong : {"true", "\"7\"", "null", "[]", "{}"})
            QTest::newRow(wrong) << QByteArray(wrong) << -1;
    }
    void totalOfEveryType() {
        QFETCH(QByteArray, total);
        QFETCH(int, expected);
        m_service->setAlarms(
            {{"items", {{{"alid", "a1"}, {"despid", "2"}, {"initm", 5}}, 3, {{"despid", 2}}}},
             {"total_items", json::parse(total.toStdString())}});
        QSignalSpy updated(&m_pool, &CTaskInfoPool::alarmListUpdated);
        QSignalSpy failed(&m_pool, &CTaskInfoPool::alarmListFailed);
        m_pool.loadAlarmInfo();
        if (expected < 0) {
            QTRY_COMPARE(failed.count(), 1);
            QCOMPARE(m_log->count("type must be number, but is " +
                                  QString(json::parse(total.toStdString()).type_name())),
                     1);
            QVERIFY(!m_pool.isAlarmListLoaded());
            return;
        }
        QTRY_COMPARE(updated.count(), 1);
        QCOMPARE(m_pool.alarmTotal(), expected);
        QCOMPARE(m_pool.alarmInfo()->size(), 1u);
    }

    void failedAlarmFetchIsLogged() {
        m_service->refuse("/v1/alarm/list", 3);
        QSignalSpy failed(&m_pool, &CTaskInfoPool::alarmListFailed);
        m_pool.loadAlarmInfo();
        m_pool.loadAlarmInfo(); // not while one is under way
        QTRY_COMPARE(failed.count(), 1);
        QCOMPARE(m_log->count("HTTP API(loadAlarmInfoList) failed! (15)"), 1);
        QVERIFY(NetTask::waitForAll(5000));
        m_pool.loadAlarmInfo();
        QTRY_COMPARE(failed.count(), 2);
    }

    void unfinishedWork() {
        m_service->setTasks({task(1, "pTaskDone"), task(2, "pTaskInitState")});
        fetch();
        QVERIFY(m_pool.hasRequestedTask());
        QVERIFY(!m_pool.hasRunningTask());
        json inactive = task(3, "pTaskProcessing");
        inactive["active"] = false;
        m_service->setTasks({inactive});
        fetch();
        QVERIFY(!m_pool.hasRunningTask());
        m_service->setTasks({task(4, "pTaskScheduled")});
        fetch();
        QVERIFY(m_pool.hasRunningTask());
        QVERIFY(!m_pool.hasRequestedTask());
    }

private:
    void load() {
        NetTask::waitForAll(5000);
        m_pool.loadTaskStatuses();
    }
    void fetch() {
        QSignalSpy updated(&m_pool, &CTaskInfoPool::taskListUpdated);
        load();
        QTRY_COMPARE(updated.count(), 1);
    }

    IsolatedRoot m_root;
    CTaskInfoPool &m_pool = CTaskInfoPool::instance();
    std::unique_ptr<LogCapture> m_log;
    std::unique_ptr<FakeLists> m_service;
};

NVLDM_TEST(TestTaskInfoPool)
#include "tst_taskinfopool.moc"
