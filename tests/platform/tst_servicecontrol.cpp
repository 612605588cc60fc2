#include "platform/system/servicecontrol.h"
#include "support/isolatedroot.h"
#include "support/logcapture.h"
#include "support/testmain.h"

#include <QFile>
#include <QTest>

Q_DECLARE_METATYPE(LocalServiceState)

class TestServiceControl : public QObject {
    Q_OBJECT

private slots:
    void judgesOutput_data();
    void judgesOutput();
    void stateFileStandsForTheService();

private:
    IsolatedRoot m_root;
};

void TestServiceControl::judgesOutput_data() {
    QTest::addColumn<QString>("output");
    QTest::addColumn<LocalServiceState>("state");
    QTest::addColumn<QString>("message");
    using State = LocalServiceState;
    const QString unknown = "Norvell device manager service status unknown!";
    QTest::newRow("query")
        << "\r\nSERVICE_NAME: nvldm\r\n        TYPE               : 10  WIN32_OWN_PROCESS\r\n"
           "        STATE              : 4  RUNNING\r\n"
        << State::Running << "Norvell Device Manager Service is running!";
    QTest::newRow("stopped") << "STATE : 1 STOPPED" << State::Stopped
                             << "Norvell Device Manager Service is stopped!";
    QTest::newRow("starting") << "STATE:2" << State::Starting
                              << "Norvell Device Manager Service is starting!";
    QTest::newRow("stopping") << "STATE\t:\t3" << State::Stopping
                              << "Norvell Device Manager Service is stopping!";
    QTest::newRow("the last one wins") << "STATE : 4 RUNNING\nSTATE : 1 STOPPED\nWIN32_EXIT_CODE : 0\n"
                                       << State::Stopped << "Norvell Device Manager Service is stopped!";
    QTest::newRow("the last one is no known state")
        << "STATE : 4\nSTATE : 7 PAUSED" << State::Unknown << unknown + "STATE : 4\nSTATE : 7 PAUSED";
    QTest::newRow("begins like a known state") << "STATE : 41" << State::Unknown << unknown + "STATE : 41";
    QTest::newRow("a number on the next line") << "STATE :\n4" << State::Unknown << unknown + "STATE :\n4";
    QTest::newRow("lower case") << "state : 4" << State::Unknown << unknown + "state : 4";
    QTest::newRow("nothing") << "" << State::Unknown << unknown;
}

void TestServiceControl::judgesOutput() {
    QFETCH(QString, output);
    QFETCH(LocalServiceState, state);
    QFETCH(QString, message);
    const LogCapture log;
    QCOMPARE(ServiceControl::judgeQueryOutput(output), state);
    QCOMPARE(log.lines(), QStringList{message});
}

void TestServiceControl::stateFileStandsForTheService() {
    QCOMPARE(ServiceControl::queryLocalService(), LocalServiceState::NotInstalled);
    QVERIFY(m_root.write("nvldm.state", "STATE : 4 RUNNING\n"));
    QCOMPARE(ServiceControl::queryLocalService(), LocalServiceState::Running);
    QVERIFY(m_root.write("nvldm.state", "STATE : 1 STOPPED\n"));
    QCOMPARE(ServiceControl::queryLocalService(), LocalServiceState::Stopped);
    QVERIFY(m_root.write("nvldm.state", ""));
    QCOMPARE(ServiceControl::queryLocalService(), LocalServiceState::Unknown);
    QVERIFY(QFile::remove(m_root.filePath("nvldm.state")));
    QCOMPARE(ServiceControl::queryLocalService(), LocalServiceState::NotInstalled);
}

NVLDM_GUILESS_TEST(TestServiceControl)
#include "tst_servicecontrol.moc"
