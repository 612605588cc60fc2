#include "devices/inventory/devicemonitor.h"
#include "support/testmain.h"

#include <QTest>

class TestDeviceMonitor : public QObject {
    Q_OBJECT

private slots:
    void beat_data() {
        QTest::addColumn<QString>(
            "forcedBefore");                   // "f" in front of a tick that a refresh was asked for before
        QTest::addColumn<QString>("expected"); // "." nothing, "p" a poll, "c" a poll and a check
        QTest::newRow("undisturbed") << "............"
                                     << "..p..c..p..c";
        QTest::newRow("before the first tick") << "f....."
                                               << "p.p..c";
        QTest::newRow("counts anew from the forced one") << "...f......"
                                                         << "..pp.p..c.";
        QTest::newRow("in place of a check") << ".....f......"
                                             << "..p..p.p..c.";
        QTest::newRow("again and again") << "ffff...."
                                         << "pppp.p..";
    }
    void beat() {
        QFETCH(QString, forcedBefore);
        MonitorBeat beat;
        QString told;
        for (const QChar mark : forcedBefore) {
            if (mark == u'f')
                beat.forceRefresh();
            const MonitorBeat::Due due = beat.tick();
            told += due.check ? (due.poll ? u'c' : u'?') : due.poll ? u'p' : u'.';
        }
        QTEST(told, "expected");
    }
};

NVLDM_APPLESS_TEST(TestDeviceMonitor)
#include "tst_devicemonitor.moc"
