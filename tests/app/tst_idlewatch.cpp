#include "app/frame/idlewatch.h"
#include "support/testmain.h"

#include <QElapsedTimer>
#include <QSignalSpy>
#include <QTest>

#include <chrono>

using namespace std::chrono_literals;

class TestIdleWatch : public QObject {
    Q_OBJECT

private slots:

    void onlyActivityStartsThePeriodAnew() {
        IdleWatch watch;
        watch.setPeriod(2s);
        QSignalSpy idle(&watch, &IdleWatch::idle);
        watch.noteActivity();
        QVERIFY2(!watch.isRunning(), "there is nothing to watch without a session");
        watch.start();
        QElapsedTimer clock;
        clock.start();
        while (clock.elapsed() < 3000) {
            watch.noteActivity();
            QTest::qWait(50);
        }
        QCOMPARE(idle.size(), 0);
        QVERIFY(watch.wasActiveSinceLastTick());
        watch.setPeriod(100ms);
        watch.noteActivity();
        QVERIFY(idle.wait());
        QVERIFY(!watch.wasActiveSinceLastTick());
        watch.noteActivity();
        QVERIFY(watch.wasActiveSinceLastTick());
        QVERIFY(idle.wait());
        watch.stop();
        QVERIFY(!watch.isRunning());
        QVERIFY(!idle.wait(500));
    }
};

NVLDM_GUILESS_TEST(TestIdleWatch)
#include "tst_idlewatch.moc"
