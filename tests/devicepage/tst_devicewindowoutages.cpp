#include "api/session/sessionevents.h"
#include "devices/inventory/inventoryupdater.h"
#include "devices/page/reconnectingdialog.h"
#include "devices/page/refreshdevicedialog.h"
#include "support/consolefixture.h"
#include "support/logcapture.h"
#include "support/testmain.h"

#include <QElapsedTimer>
#include <QSignalSpy>
#include <QToolButton>

#include <nlohmann/json.hpp>

class TestDeviceWindowOutages : public QObject, private ConsoleFixture {
    Q_OBJECT

private slots:
    void init() { open(); }
    void cleanup() { close(); }

    void followsStatesAndDevices() {
        workOn(20);
        MainConsoleTable *cameras = table("cameraTable");
        const QString first = cameras->item(0, 0)->data(MainConsoleTable::deviceIdRole).toString();
        const QString second = cameras->item(1, 0)->data(MainConsoleTable::deviceIdRole).toString();
        cameras->selectRow(1);
        tell("status " + first + " Authorized Connected deviceRestart");
        tell("status " + second + " Authorized Unreachable -");
        QTRY_COMPARE_WITH_TIMEOUT(cameras->item(0, 0)->text(), QStringLiteral("  Maintaining..."),
                                  patienceMs);
        QCOMPARE(cameras->item(1, 0)->text(), QStringLiteral("  Unreachable"));
        // What another client adds or removes shows without anything being done here.
        tell("add 3");
        tell("remove " + first);
        QTRY_COMPARE_WITH_TIMEOUT(rowsOfAllTables(), 22, patienceMs);
        QCOMPARE(cameras->item(0, 0)->data(MainConsoleTable::deviceIdRole).toString(), second);
        QCOMPARE(m_window->selectedDevices().size(), std::size_t(1));
        QCOMPARE(m_window->selectedDevices().front()->id, second);
    }

    void garbageIsNoEmptyList() {
        workOn(20);
        auto *tree = m_window->findChild<SiteTree *>();
        const int sites = tree->topLevelItemCount();
        QVERIFY(sites > 3);
        for (const char *path : {"/v1/dev/list", "/v1/dev/status", "/v1/site/list"})
            tell(QStringLiteral("fault wrong-types@%1").arg(QLatin1String(path)));
        const LogCapture log;
        m_window->reload();
        QTRY_COMPARE(log.count("none of 5 site records has an id"), 1);
        QTRY_VERIFY(log.count("update device info") > 0);
        QCOMPARE(rowsOfAllTables(), 20);
        QCOMPARE(tree->topLevelItemCount(), sites);
    }

    void slowFirstListIsReadOnce() {
        m_service.start({"--devices", "20"});
        QSignalSpy readings(m_window->findChild<InventoryUpdater *>(), &InventoryUpdater::read);
        // Beyond the first beat of the polls, to which every device would be unknown.
        tell("fault late=3500@/v1/dev/list,times=1");
        m_window->startWork();
        QTRY_COMPARE_WITH_TIMEOUT(readings.size(), 1, patienceMs);
        QTest::qWait(1000);
        QCOMPARE(readings.size(), 1);
        QCOMPARE(rowsOfAllTables(), 20);
    }

    void sameDifferenceIsReadOnce() {
        m_service.start({"--devices", "5"});
        DeviceInventory inventory;
        InventoryUpdater updater(inventory, [] { return 0; });
        QSignalSpy readings(&updater, &InventoryUpdater::read);
        const DeviceDifference unknown{{"DV1"}, {}};
        const DeviceDifference stateless{{}, {"DV1"}};
        int expected = 0;
        for (const DeviceDifference &each : {unknown, stateless, DeviceDifference(), unknown}) {
            expected += each == DeviceDifference() ? 0 : 1;
            for (int poll = 0; poll < 3; ++poll) {
                updater.reloadFor(each);
                QTRY_COMPARE(readings.size(), expected);
                QVERIFY(NetTask::waitForAll(patienceMs));
                QCoreApplication::processEvents();
            }
        }
        QCOMPARE(readings.size(), 3);
        // What could not be read is tried again.
        tell("fault code=3@/v1/dev/list,times=1");
        updater.reloadFor(stateless);
        QTRY_COMPARE(readings.size(), 4);
        QVERIFY(NetTask::waitForAll(patienceMs));
        QCoreApplication::processEvents();
        updater.reloadFor(stateless);
        QTRY_COMPARE(readings.size(), 5);
    }

    void readsAgainAsSoonAsTheLastReadingAllows() {
        m_service.start({"--devices", "5"});
        DeviceInventory inventory;
        InventoryUpdater updater(inventory, [] { return 0; });
        QSignalSpy readings(&updater, &InventoryUpdater::read);
        tell("fault late=300@/v1/dev/list,times=1");
        updater.reload();
        QTRY_COMPARE(readings.size(), 1);
        QElapsedTimer rest;
        rest.start();
        QVERIFY(QTest::qWaitFor(
            [&] {
                updater.reloadAfterRest();
                return readings.size() == 2;
            },
            patienceMs));
        QVERIFY2(rest.elapsed() >= 3000, qPrintable(QString::number(rest.elapsed())));
        QVERIFY(NetTask::waitForAll(patienceMs));
        // What another client changes shows with the next check.
        QCoreApplication::processEvents();
        m_window->startWork();
        QTRY_COMPARE_WITH_TIMEOUT(rowsOfAllTables(), 5, patienceMs);
        const JSON renamed{{"id", m_window->devices()->at(0)->id.toStdString()}, {"d_model", "Zebra"}};
        QTRY_VERIFY_WITH_TIMEOUT(visible<RefreshDeviceDialog>(), patienceMs);
        QTRY_VERIFY_WITH_TIMEOUT(!visible<RefreshDeviceDialog>(), patienceMs);
        QVERIFY(NetTask::waitForAll(patienceMs));
        QCoreApplication::processEvents();
        onService([&](CApiClient &client) { return client.commitDevices(JSON::array({renamed}), "all"); });
        QTRY_COMPARE_WITH_TIMEOUT(m_window->devices()->at(0)->text(DeviceColumn::Model),
                                  QStringLiteral("Zebra"), patienceMs);
    }

    void siteChangesThatCannotBeSentSayWhy() {
        workOn(5);
        QSignalSpy message(m_window.get(), &DeviceWindow::onShowAnimatedMsgDlg);
        m_window->findChild<QToolButton *>("addTopSiteButton")->click();
        tell("fault code=5@/v1/site/list");
        const LogCapture log;
        m_window->commitSites();
        QTRY_COMPARE(message.size(), 1);
        QCOMPARE(
            message[0][0].toString(),
            QStringLiteral("The site changes could not be sent: the server refused it. Press Apply to try "
                           "again."));
        QCOMPARE(log.count("HTTP API(commitSites) failed!"), 1);
    }

    void failedReadingRecovers() {
        m_service.start({"--fault", "status=500@/v1/dev/list,times=1"});
        const LogCapture log;
        m_window->startWork();
        QTRY_COMPARE(shownPage(), QStringLiteral("failedPage"));
        QCOMPARE(log.count("HTTP API(listDevices) failed!"), 1);
        QTRY_COMPARE_WITH_TIMEOUT(rowsOfAllTables(), 20, patienceMs);
        QCOMPARE(shownPage(), QStringLiteral("cameraTable"));
        // A reading that fails later takes nothing away.
        tell("fault code=3@/v1/dev/list");
        m_window->reload();
        QTRY_COMPARE(log.count("HTTP API(listDevices) failed!"), 2);
        QVERIFY(NetTask::waitForAll(patienceMs));
        QCoreApplication::processEvents();
        QCOMPARE(shownPage(), QStringLiteral("cameraTable"));
        QCOMPARE(rowsOfAllTables(), 20);
    }

    void lostServerComesBack() {
        workOn(20);
        const QString port = QString::number(m_service.process().port());
        m_service.process().kill();
        QTRY_VERIFY_WITH_TIMEOUT(visible<ReconnectingDialog>(), 8000);
        QVERIFY(visible<ReconnectingDialog>()->findChild<QWidget *>("statusWidget")->isVisible());
        QCOMPARE(rowsOfAllTables(), 20);
        QSignalSpy disconnects(m_window.get(), &DeviceWindow::disconnectRequested);
        QTest::mouseClick(visible<ReconnectingDialog>()->findChild<QPushButton *>("disconnectButton"),
                          Qt::LeftButton);
        QCOMPARE(disconnects.size(), 1);

        m_service.restart({"--port", port});
        tell("add 1");
        QTRY_VERIFY_WITH_TIMEOUT(visible<RefreshDeviceDialog>(), patienceMs);
        QVERIFY(!visible<ReconnectingDialog>());
        QTRY_VERIFY_WITH_TIMEOUT(!visible<RefreshDeviceDialog>(), patienceMs);
        QTRY_COMPARE_WITH_TIMEOUT(rowsOfAllTables(), 21, patienceMs);
    }

    void outageDuringARefreshIsFollowedByAnother() {
        workOn(20);
        const QString port = QString::number(m_service.process().port());
        auto *refresh = m_window->findChild<QToolButton *>("refreshButton");
        // There is a refresh at nearly every moment, so that the outage finds one.
        const auto lost = [&] {
            if (!visible<RefreshDeviceDialog>())
                refresh->click();
            return visible<ReconnectingDialog>() != nullptr;
        };
        refresh->click();
        QTRY_VERIFY(visible<RefreshDeviceDialog>());
        m_service.process().kill();
        QVERIFY(QTest::qWaitFor(lost, patienceMs));
        QTRY_VERIFY_WITH_TIMEOUT(!m_window->findChild<RefreshDeviceDialog *>(), patienceMs);
        m_service.restart({"--port", port});
        QTRY_VERIFY_WITH_TIMEOUT(visible<RefreshDeviceDialog>(), patienceMs);
        QTRY_VERIFY_WITH_TIMEOUT(!visible<RefreshDeviceDialog>(), patienceMs);
    }

    void endedSessionIsToldOnce() {
        workOn(20);
        QSignalSpy lost(&SessionEvents::instance(), &SessionEvents::sessionLost);
        tell("expire-sessions");
        QTRY_COMPARE_WITH_TIMEOUT(lost.size(), 1, patienceMs);
        const LogCapture log;
        m_window->reload();
        QTRY_COMPARE(log.count("HTTP API(listDevices) failed!"), 1);
        QVERIFY(NetTask::waitForAll(patienceMs));
        QCoreApplication::processEvents();
        QCOMPARE(lost.size(), 1);
        // A new session has an end of its own.
        m_service.logIn();
        tell("expire-sessions");
        m_window->reload();
        QTRY_COMPARE(lost.size(), 2);
    }

    void refreshMayBeCancelledAndAskedAgain() {
        workOn(20);
        auto *refresh = m_window->findChild<QToolButton *>("refreshButton");
        QTest::mouseClick(refresh, Qt::LeftButton);
        QTRY_VERIFY(visible<RefreshDeviceDialog>());
        QVERIFY(visible<RefreshDeviceDialog>()->isModal());
        QTest::mouseClick(visible<RefreshDeviceDialog>()->findChild<QPushButton *>("cancelButton"),
                          Qt::LeftButton);
        QTRY_VERIFY(!m_window->findChild<RefreshDeviceDialog *>());
        // The job of the first one still waits for the devices to settle, and the second waits as long again.
        QTest::mouseClick(refresh, Qt::LeftButton);
        QTest::qWait(1500);
        QVERIFY(visible<RefreshDeviceDialog>());
        QTRY_VERIFY_WITH_TIMEOUT(!m_window->findChild<RefreshDeviceDialog *>(), patienceMs);
        QVERIFY(!QApplication::activeModalWidget());
        QTest::mouseClick(table("cameraTable")->viewport(), Qt::LeftButton, {}, QPoint(30, 18));
        QCOMPARE(m_window->selectedDevices().size(), std::size_t(1));
    }

    void stopForgetsTheSession() {
        workOn(20);
        tell("fault late=1000@/v1/dev/list,times=1");
        m_window->reload();
        m_window->stopWork();
        CLocalStore::instance().clearLoginInfo();
        QCOMPARE(rowsOfAllTables(), 0);
        QCOMPARE(shownPage(), QStringLiteral("loadingPage"));
        QCOMPARE(m_window->findChild<SiteTree *>()->topLevelItemCount(), 3);
        QCOMPARE(m_window->selectedDevices().size(), std::size_t(0));
        QVERIFY(NetTask::waitForAll(patienceMs));
        QCoreApplication::processEvents();
        QCOMPARE(rowsOfAllTables(), 0);
        // The next session begins while the last answer to the old one is still on its way.
        m_service.logIn();
        tell("fault late=1000@/v1/dev/list,times=1");
        m_window->startWork();
        m_window->stopWork();
        CLocalStore::instance().clearLoginInfo();
        tell("add 2");
        m_service.logIn();
        m_window->startWork();
        QTRY_COMPARE(rowsOfAllTables(), 22);
        QCOMPARE(shownPage(), QStringLiteral("cameraTable"));
    }

    void mayBeDestroyedWhileJobsRun() {
        m_service.start({"--fault", "late=1000@/v1/site/list,times=1"});
        const LogCapture log;
        m_window->startWork();
        QTest::mouseClick(m_window->findChild<QToolButton *>("refreshButton"), Qt::LeftButton);
        QTRY_VERIFY(visible<RefreshDeviceDialog>());
        QTRY_VERIFY(log.count("login info ip:") > 0);
        m_window.reset();
        QVERIFY(NetTask::waitForAll(patienceMs));
        QCoreApplication::processEvents();
        QCOMPARE(log.count("Encountered unexpected error"), 0);
        // The turn of the jobs was given back: another window gets its own.
        open();
        m_window->startWork();
        QTRY_COMPARE(rowsOfAllTables(), 20);
    }
};

NVLDM_TEST(TestDeviceWindowOutages)
#include "tst_devicewindowoutages.moc"
