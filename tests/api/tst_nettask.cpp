#include "api/session/netjob.h"
#include "api/session/requestturn.h"
#include "support/logcapture.h"
#include "support/testmain.h"

#include <QCoreApplication>
#include <QPointer>
#include <QSemaphore>
#include <QTest>

#include <atomic>
#include <functional>
#include <memory>
#include <stdexcept>

Q_DECLARE_METATYPE(std::function<int()>)

class TestNetTask : public QObject {
    Q_OBJECT

private slots:
    void cleanup();

    void oneJobAtATime();
    void readingsLetOthersGoFirst();
    void preparationRunsOutsideTheTurn();
    void resultComesHome();
    void runnerTakesTheNextJob();
    void busyRunnerRefuses();
    void jobThatThrows_data();
    void jobThatThrows();
    void jobThatNeverGotItsTurn();
    void resultNobodyWants();
    void receiverDestroyedWhileTheJobRuns();
    void receiverDestroyedByTheResult();
    void runnerIsLetGo();
    void runAndWaitPassesTheTurn();

private:
    /// Starts a job that holds the turn until it is released.
    void holdTurn(NetTask &runner) {
        runner.setUp(0, [this](quintptr) {
            m_holding.release();
            m_release.acquire();
        });
        runner.start();
        m_holding.acquire();
    }

    QSemaphore m_holding;
    QSemaphore m_release;
};

void TestNetTask::cleanup() {
    QVERIFY(NetTask::waitForAll(10000));
    QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
}

void TestNetTask::oneJobAtATime() {
    constexpr int runners = 6;
    std::atomic<int> inside = 0;
    std::atomic<int> meetings = 0;
    int ended = 0;
    for (int i = 0; i < runners; ++i) {
        const auto work = [&] {
            meetings += inside++ > 0;
            QThread::yieldCurrentThread();
            --inside;
            return 0;
        };
        QVERIFY(NetJob::post(NetJob::createRunner("test"), this, work, {}, [&](JobOutcome) { ++ended; }));
    }
    QTRY_COMPARE(ended, runners);
    QCOMPARE(meetings.load(), 0);
}

/// What a user does goes before readings that waited longer, and in the middle of one that has the turn.
void TestNetTask::readingsLetOthersGoFirst() {
    QStringList steps;
    QSemaphore paused;
    QSemaphore goOn;
    const auto job = [&](const QString &name) { return [&steps, name](quintptr) { steps << name; }; };
    NetTask reading(NetTask::Turn::Reading);
    reading.setUp(0, [&](quintptr) {
        steps << "page 1";
        paused.release();
        goOn.acquire();
        RequestTurn::passOn();
        steps << "page 2";
        RequestTurn::passOn();
        steps << "page 3";
    });
    reading.start();
    QVERIFY(paused.tryAcquire(1, 10000));
    NetTask later(NetTask::Turn::Reading);
    NetTask user;
    later.setUp(0, job("later reading"));
    user.setUp(0, job("user"));
    later.start();
    QTest::qWait(100);
    user.start();
    QTest::qWait(100);
    goOn.release();
    QVERIFY(NetTask::waitForAll(10000));
    QCOMPARE(steps, QStringList({"page 1", "user", "later reading", "page 2", "page 3"}));
}

void TestNetTask::preparationRunsOutsideTheTurn() {
    NetTask first;
    NetTask second;
    holdTurn(first);
    QSemaphore prepared;
    std::atomic<bool> ran = false;
    second.setUp(
        42, [&](quintptr context) { ran = context == 42; }, [&] { prepared.release(); });
    second.start();
    QVERIFY(prepared.tryAcquire(1, 10000));
    QVERIFY(!NetTask::waitForAll(100));
    QVERIFY2(!ran, "the second job waits for the first");
    m_release.release();
    QVERIFY(second.wait(10000));
    QVERIFY(ran);
}

void TestNetTask::resultComesHome() {
    QObject receiver;
    QStringList steps;
    QThread *workThread = nullptr;
    const auto work = [&] {
        workThread = QThread::currentThread();
        return QStringLiteral("result");
    };
    const auto done = [&](const QString &result) {
        steps << result;
        QCOMPARE(QThread::currentThread(), qApp->thread());
    };
    const QPointer<NetTask> runner = NetJob::createRunner("test");
    QVERIFY(NetJob::post(runner.data(), &receiver, work, done, [&](JobOutcome end) {
        steps << (end == JobOutcome::Delivered ? "delivered" : "other");
    }));
    QTRY_COMPARE(steps, QStringList({"result", "delivered"}));
    QVERIFY(workThread != qApp->thread());
    QTRY_VERIFY2(!runner, "a runner of one job deletes itself");
}

void TestNetTask::runnerTakesTheNextJob() {
    NetTask runner;
    int sum = 0;
    for (int i = 1; i <= 3; ++i) {
        bool ended = false;
        QVERIFY(NetJob::post(
            &runner, this, [i] { return i; }, [&](int result) { sum += result; },
            [&](JobOutcome) { ended = true; }));
        QTRY_VERIFY(ended);
        QVERIFY(runner.wait(10000));
    }
    QCOMPARE(sum, 1 + 2 + 3);
}

void TestNetTask::busyRunnerRefuses() {
    NetTask runner;
    holdTurn(runner);
    bool touched = false;
    const auto touch = [&] { return touched = true; };
    QVERIFY(!NetJob::post(&runner, this, touch, {}, [&](JobOutcome) { touched = true; }));
    QVERIFY(
        !NetJob::post(static_cast<NetTask *>(nullptr), this, touch, {}, [&](JobOutcome) { touched = true; }));
    m_release.release();
    QVERIFY(runner.wait(10000));
    QCoreApplication::processEvents();
    QVERIFY(!touched);
}

void TestNetTask::jobThatThrows_data() {
    QTest::addColumn<std::function<int()>>("work");
    QTest::addColumn<QString>("message");
    QTest::newRow("exception") << std::function<int()>([]() -> int { throw std::runtime_error("no luck"); })
                               << "no luck";
    QTest::newRow("anything") << std::function<int()>([]() -> int { throw 7; }) << "Unknown exception";
}

void TestNetTask::jobThatThrows() {
    QFETCH(std::function<int()>, work);
    QFETCH(QString, message);
    const LogCapture log;
    NetTask runner;
    QList<JobOutcome> ends;
    bool delivered = false;
    const auto done = [&](int) { delivered = true; };
    QVERIFY(NetJob::post(&runner, this, work, done, [&](JobOutcome end) { ends << end; }));
    QTRY_COMPARE(ends, QList<JobOutcome>{JobOutcome::Failed});
    QVERIFY(!delivered);
    QCOMPARE(log.count("Encountered unexpected error in NetTask: " + message), 1);
    QVERIFY(runner.wait(10000));
    QVERIFY(NetJob::post(
        &runner, this, [] { return 1; }, done));
    QTRY_VERIFY2(delivered, "the turn was given back");
}

void TestNetTask::jobThatNeverGotItsTurn() {
    const LogCapture log;
    QList<JobOutcome> ends;
    bool touched = false;
    const auto touch = [&] { return touched = true; };
    QVERIFY(NetJob::post(
        NetJob::createRunner("test"), this, touch, [&](bool) { touched = true; },
        [&](JobOutcome end) { ends << end; }, [] { throw std::runtime_error("no such host"); }));
    QTRY_COMPARE(ends, QList<JobOutcome>{JobOutcome::NotRun});
    QVERIFY(!touched);
}

void TestNetTask::resultNobodyWants() {
    QList<JobOutcome> ends;
    bool delivered = false;
    QVERIFY(NetJob::post(
        NetJob::createRunner("test"), this, [] { return 1; }, [&](int) { delivered = true; },
        [&](JobOutcome end) { ends << end; }, {}, [] { return false; }));
    QTRY_COMPARE(ends, QList<JobOutcome>{JobOutcome::SessionGone});
    QVERIFY(!delivered);
}

void TestNetTask::receiverDestroyedWhileTheJobRuns() {
    NetTask holder;
    holdTurn(holder);
    auto receiver = std::make_unique<QObject>();
    std::atomic<bool> ran = false;
    bool told = false;
    const QPointer<NetTask> runner = NetJob::createRunner("test");
    QVERIFY(NetJob::post(
        runner.data(), receiver.get(), [&] { return ran = true; }, [&](bool) { told = true; },
        [&](JobOutcome) { told = true; }));
    receiver.reset();
    m_release.release();
    QTRY_VERIFY(!runner);
    QVERIFY(ran);
    QVERIFY(!told);
}

void TestNetTask::receiverDestroyedByTheResult() {
    auto receiver = std::make_unique<QObject>();
    int ended = 0;
    QVERIFY(NetJob::post(
        NetJob::createRunner("test"), receiver.get(), [] { return 1; }, [&](int) { receiver.reset(); },
        [&](JobOutcome) { ++ended; }));
    QTRY_COMPARE(ended, 1);
    QVERIFY(!receiver);
}

void TestNetTask::runnerIsLetGo() {
    NetTask::Owner idle(new NetTask);
    const QPointer<NetTask> idleRunner = idle.get();
    idle.reset();
    QVERIFY(!idleRunner);

    NetTask::Owner busy(new NetTask);
    const QPointer<NetTask> busyRunner = busy.get();
    holdTurn(*busy);
    busy.reset();
    QVERIFY2(busyRunner && busyRunner->isRunning(), "nobody waits for it");
    QVERIFY2(!NetTask::waitForAll(50), "it still counts at the end of the program");
    m_release.release();
    QTRY_VERIFY(!busyRunner);
}

void TestNetTask::runAndWaitPassesTheTurn() {
    NetTask holder;
    holdTurn(holder);
    QThread *thread = nullptr;
    NetTask::runAndWait([&] { thread = QThread::currentThread(); });
    QVERIFY(thread && thread != QThread::currentThread());
    m_release.release();
}

NVLDM_GUILESS_TEST(TestNetTask)
#include "tst_nettask.moc"
