#include "api/session/servicesession.h"
#include "app/frame/framelesswindow.h"
#include "app/frame/idlewatch.h"
#include "app/frame/mainwindow.h"
#include "app/frame/sidepanel.h"
#include "app/frame/titlebar.h"
#include "app/frame/welcomepage.h"
#include "app/help/aboutdialog.h"
#include "app/help/crashdialog.h"
#include "app/login/accountmanagementdialog.h"
#include "app/login/accountsetupdialog.h"
#include "app/login/logindialog.h"
#include "app/login/serverkeydialog.h"
#include "app/remote/servicemanagementaddservicedialog.h"
#include "devices/page/devicewindow.h"
#include "devices/page/mainconsoletable.h"
#include "devices/page/reconnectingdialog.h"
#include "form.h"
#include "platform/files/storetrouble.h"
#include "store/clientstore.h"
#include "store/localstore.h"
#include "store/storewriter.h"
#include "support/emulatorprocess.h"
#include "support/isolatedroot.h"
#include "support/logcapture.h"
#include "support/testmain.h"
#include "tasks/notify/notifier.h"
#include "tasks/service/taskinfopool.h"
#include "widgets/controls/badgebutton.h"
#include "widgets/dialogs/transientmessage.h"

#include <QClipboard>
#include <QComboBox>
#include <QDesktopServices>
#include <QDir>
#include <QElapsedTimer>
#include <QFile>
#include <QFileInfo>
#include <QListView>
#include <QPlainTextEdit>
#include <QPushButton>
#include <QRadioButton>
#include <QSignalSpy>
#include <QTimer>
#include <QToolButton>

#include <nlohmann/json.hpp>

using namespace std::chrono_literals;

namespace {

const QString email = QStringLiteral("admin@norvell.example");
const QString password = QStringLiteral("Passw0rd!");
constexpr int patienceMs = 15000;

/// Takes the place of what the desktop shows files with.
class Viewer : public QObject {
    Q_OBJECT

public:
    Viewer() { QDesktopServices::setUrlHandler("file", this, "open"); }
    ~Viewer() override { QDesktopServices::unsetUrlHandler("file"); }
    QStringList opened;

public slots:
    void open(const QUrl &url) { opened << url.toLocalFile(); }
};

} // namespace

class TestFramelessWindow : public QObject {
    Q_OBJECT

private slots:
    void init() {
        QFile::remove(m_root.filePath("nvldm.state"));
        CClientStore::instance().setThisComputer(true);
        CClientStore::instance().setThisComputerAccount({});
        CClientStore::instance().setRemoteComputerAccount({});
    }

    void cleanup() {
        m_window.reset();
        CLocalStore::instance().clearLoginInfo();
        QVERIFY(NetTask::waitForAll(patienceMs));
        QCoreApplication::processEvents();
        QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
        m_service.kill();
    }

    void withoutALocalService() {
        openWindow();
        QTRY_VERIFY(Form::visible<LoginDialog>());
        const LoginDialog *dialog = Form::visible<LoginDialog>();
        QCOMPARE(
            Form::text(dialog, "tipLabel"),
            QStringLiteral("Norvell Device Manager Service Control is not installed on this computer. Please "
                           "connect to a remote server."));
        QVERIFY(!titleBar()->accountManagementAction()->isEnabled());
        QVERIFY(!Form::part(dialog, "localRadio")->isEnabled());
        QVERIFY(Form::part<QRadioButton>(dialog, "remoteRadio")->isChecked());
        QVERIFY(!titleBar()->accountButton()->isVisible());
        QVERIFY(isCentred(dialog));
    }

    void localServiceDoesNotAnswer() {
        QVERIFY(m_root.write("nvldm.state", "        STATE              : 1  STOPPED\n"));
        openWindow();
        QTRY_VERIFY_WITH_TIMEOUT(Form::visible<LoginDialog>(), patienceMs);
        QCOMPARE(
            Form::text(Form::visible<LoginDialog>(), "tipLabel"),
            QStringLiteral("Norvell Device Manager Service Control is not running on this computer. Please "
                           "check the status of local server or connect to a remote server."));
        QVERIFY(Form::part(Form::visible<LoginDialog>(), "localRadio")->isEnabled());
    }

    void freshServiceIsSetUpFirst() {
        QVERIFY(m_service.start({"--fresh"}));
        openWindow();
        QTRY_VERIFY_WITH_TIMEOUT(Form::visible<AccountSetupDialog>(), patienceMs);
        QVERIFY(!Form::visible<LoginDialog>());
        const AccountSetupDialog *setup = Form::visible<AccountSetupDialog>();
        Form::type(setup, "emailEdit", email);
        Form::type(setup, "passEdit", password);
        Form::type(setup, "confirmEdit", password);
        Form::click(setup, "nextButton");
        QTRY_VERIFY_WITH_TIMEOUT(Form::visible<LoginDialog>(), patienceMs);
        QVERIFY(!Form::visible<AccountSetupDialog>());
        QCOMPARE(Form::text(Form::visible<LoginDialog>(), "tipLabel"), QString());
        QCOMPARE(Form::text(Form::visible<LoginDialog>(), "localEmailEdit"), email);
        Form::type(Form::visible<LoginDialog>(), "localPassEdit", password);
        QTest::keyClick(Form::visible<LoginDialog>(), Qt::Key_Return);
        QTRY_COMPARE_WITH_TIMEOUT(shownRows(), 20, patienceMs);
        QVERIFY(m_window->isLoggedIn());
        QVERIFY(m_window->findChild<DeviceWindow *>()->isVisible());
    }

    void helpIsAboutThePlace() {
        logIn();
        const Viewer viewer;
        const auto helpOf = [&](const char *name) {
            QTest::keyClick(Form::part(m_window.get(), name), Qt::Key_F1);
            return QFileInfo(viewer.opened.value(viewer.opened.size() - 1)).fileName();
        };
        titleBar()->helpButton()->click();
        QCOMPARE(viewer.opened.size(), 1);
        QCOMPARE(QFileInfo(viewer.opened[0]).fileName(), "device-page.html");
        QCOMPARE(helpOf("siteTree"), "sites.html");
        QCOMPARE(helpOf("deviceSearchEdit"), "searching.html");
        QCOMPARE(helpOf("deviceButton"), "device-page.html");
        Form::click(m_window.get(), "settingsButton");
        QCOMPARE(helpOf("settingsButton"), "settings.html");
        titleBar()->aboutAction()->trigger();
        QTRY_VERIFY(Form::visible<AboutDialog>());
        QTest::keyClick(Form::visible<AboutDialog>(), Qt::Key_F1);
        titleBar()->logOffAction()->trigger();
        QTRY_VERIFY_WITH_TIMEOUT(Form::visible<LoginDialog>(), patienceMs);
        QTest::keyClick(Form::visible<LoginDialog>(), Qt::Key_F1);
        QCOMPARE(viewer.opened.size(), 7);
        QCOMPARE(QFileInfo(viewer.opened[5]).fileName(), "settings.html");
        QCOMPARE(QFileInfo(viewer.opened[6]).fileName(), "first-start.html");
        for (const QString &page : viewer.opened)
            QVERIFY2(QFileInfo(page).isFile(), qUtf8Printable(page));
    }

    void crashIsToldBeforeTheLogin() {
        startService();
        QVERIFY(QDir().mkpath(m_root.filePath("Logs")));
        QVERIFY(m_root.write("Logs/crash-2026-01-02-120000-7.new.txt", "<b>Program</b> ended"));
        openWindow();
        QTRY_VERIFY(Form::visible<CrashDialog>());
        auto *dialog = Form::visible<CrashDialog>();
        QCOMPARE(Form::part<QPlainTextEdit>(dialog, "reportEdit")->toPlainText(), "<b>Program</b> ended");
        const Viewer viewer;
        Form::click(dialog, "showFolderButton");
        QCOMPARE(viewer.opened, QStringList(m_root.filePath("Logs")));
        QVERIFY(!Form::visible<LoginDialog>());
        QTest::keyClick(dialog, Qt::Key_Return);
        QTRY_VERIFY_WITH_TIMEOUT(Form::visible<LoginDialog>(), patienceMs);
        openWindow();
        QTRY_VERIFY_WITH_TIMEOUT(Form::visible<LoginDialog>(), patienceMs);
        QVERIFY(!Form::visible<CrashDialog>());
    }

    void troubleWithFilesIsToldOnce() {
        openWindow();
        auto *card = m_window->findChild<QWidget *>("noticeCard");
        QVERIFY(card && !card->isVisible());
        const QString file = m_root.filePath("told.sdb");
        for (int i = 0; i < 2; ++i) {
            StoreTrouble::report({StoreTrouble::Kind::Repaired, file, file + ".damaged-1", 3});
            StoreTrouble::report({StoreTrouble::Kind::Unwritable, file, {}, 0});
        }
        QTRY_VERIFY(card->isVisible());
        QVERIFY(Form::text(card, "noticeCardText").contains("told.sdb.damaged-1"));
        QVERIFY(m_window->rect().contains(card->geometry()));
        Form::click(card, "noticeDismissButton");
        QVERIFY(Form::text(card, "noticeCardText").contains("disk may be full"));
        Form::click(card, "noticeDismissButton");
        QVERIFY(!card->isVisible());
    }

    void missingKeyFileIsToldOnce() {
        CLocalStore::instance().setMissingKeyTold(false);
        logIn();
        auto *card = m_window->findChild<QWidget *>("noticeCard");
        QTRY_VERIFY(card->isVisible());
        const Viewer viewer;
        Form::click(card, "noticeGuideButton");
        QCOMPARE(QFileInfo(viewer.opened.value(0)).fileName(), "security.html");
        QVERIFY(QFileInfo(viewer.opened.value(0)).isFile());
        Form::click(card, "noticeDismissButton");
        StoreWriter::flush();
        m_window.reset();
        m_service.kill();
        logIn();
        QVERIFY(!m_window->findChild<QWidget *>("noticeCard")->isVisible());
    }

    void logOffEndsTheSession() {
        logIn();
        titleBar()->aboutAction()->trigger();
        QTRY_VERIFY(Form::visible<AboutDialog>());
        QSignalSpy loggedOff(m_window.get(), &FramelessWindow::didLogOff);
        titleBar()->logOffAction()->trigger();
        QCOMPARE(loggedOff.size(), 1);
        QVERIFY(!m_window->isLoggedIn());
        QVERIFY(showsWelcome());
        QVERIFY(!titleBar()->accountButton()->isVisible());
        QVERIFY(!m_window->idleWatch()->isRunning());
        QVERIFY(!CLocalStore::instance().loginInfo().isComplete());
        QCOMPARE(shownRows(), 0);
        QTRY_VERIFY_WITH_TIMEOUT(Form::visible<LoginDialog>(), patienceMs);
        QVERIFY2(!Form::visible<AboutDialog>(), "a dialog of the session stayed");
        QCOMPARE(Form::text(Form::visible<LoginDialog>(), "tipLabel"), QString());
        QTRY_COMPARE_WITH_TIMEOUT(sessions(), 0, patienceMs);
        // In again, until the user gives a lost server up.
        Form::type(Form::visible<LoginDialog>(), "localPassEdit", password);
        Form::click(Form::visible<LoginDialog>(), "loginButton");
        QTRY_COMPARE_WITH_TIMEOUT(shownRows(), 20, patienceMs);
        QCOMPARE(sessions(), 1);
        emit m_window->findChild<DeviceWindow *>()->disconnectRequested();
        QVERIFY(!m_window->isLoggedIn());
        QCOMPARE(loggedOff.size(), 2);
    }

    void logOffPastAServiceThatHangs() {
        logIn();
        const auto message = [this] {
            const auto *shown = m_window->findChild<TransientMessage *>();
            return shown && shown->isVisible() ? shown->text() : QString();
        };
        QCOMPARE(m_service.command("fault no-answer@/v1/orb"), QStringLiteral("ok"));
        titleBar()->serviceManagementAction()->trigger();
        QCOMPARE(message(), QStringLiteral("connecting to ORB..."));
        QTest::qWait(300);
        QElapsedTimer clock;
        clock.start();
        titleBar()->logOffAction()->trigger();
        QCOMPARE(message(), QString());
        QTRY_VERIFY_WITH_TIMEOUT(Form::visible<LoginDialog>(), patienceMs);
        QCOMPARE(Form::text(Form::visible<LoginDialog>(), "tipLabel"), QString());
        QTRY_COMPARE_WITH_TIMEOUT(sessions(), 0, patienceMs);
        QVERIFY2(clock.elapsed() < 8000, "the request that hangs was waited for");
        QCOMPARE(m_service.command("faults clear"), QStringLiteral("ok"));
        Form::type(Form::visible<LoginDialog>(), "localPassEdit", password);
        Form::click(Form::visible<LoginDialog>(), "loginButton");
        QTRY_COMPARE_WITH_TIMEOUT(shownRows(), 20, patienceMs);
        titleBar()->serviceManagementAction()->trigger();
        QTRY_VERIFY_WITH_TIMEOUT(Form::visible<ServiceManagementAddServiceDialog>(), patienceMs);
    }

    void checkThatHangsIsNotWaitedFor() {
        QVERIFY(m_service.start({"--fresh", "--fault", "no-answer@/v1/accm/list"}));
        openWindow();
        auto *checking = Form::part(m_window.get(), "welcomeCheckLabel");
        QTRY_VERIFY(checking->isVisible());
        QTest::mouseClick(Form::part(m_window.get(), "welcomeLoginButton"), Qt::LeftButton);
        QVERIFY(Form::visible<LoginDialog>());
        QCOMPARE(Form::text(Form::visible<LoginDialog>(), "tipLabel"), QString());
        QVERIFY(!checking->isVisible());
        QVERIFY2(NetTask::waitForAll(2000), "the check goes on");
    }

    void loginBeforeTheContentIsThere() {
        startService();
        m_window = std::make_unique<FramelessWindow>();
        m_window->show();
        QTRY_VERIFY_WITH_TIMEOUT(Form::visible<LoginDialog>(), patienceMs);
        Form::type(Form::visible<LoginDialog>(), "localEmailEdit", email);
        Form::type(Form::visible<LoginDialog>(), "localPassEdit", password);
        Form::click(Form::visible<LoginDialog>(), "loginButton");
        QTRY_VERIFY_WITH_TIMEOUT(m_window->isLoggedIn(), patienceMs);
        m_window->setContent(new MainWindow);
        QVERIFY(!showsWelcome());
        QTRY_COMPARE_WITH_TIMEOUT(shownRows(), 20, patienceMs);
    }

    void accountMenuLeadsToItsDialogs() {
        logIn();
        const LogCapture log;
        titleBar()->accountManagementAction()->trigger();
        QTRY_VERIFY(Form::visible<AccountManagementDialog>());
        QTest::keyClick(Form::visible<AccountManagementDialog>(), Qt::Key_Escape);
        QCOMPARE(log.count("account management failed!"), 1);
        titleBar()->accountManagementAction()->trigger();
        QTRY_VERIFY(Form::visible<AccountManagementDialog>());
        const QWidget *account = Form::visible<AccountManagementDialog>();
        QCOMPARE(Form::text(account, "emailEdit"), email);
        Form::type(account, "oldPassEdit", password);
        Form::type(account, "newPassEdit", "N3w-Passw0rd");
        Form::type(account, "confirmEdit", "N3w-Passw0rd");
        Form::click(account, "applyButton");
        QTRY_COMPARE_WITH_TIMEOUT(log.count("account management successfully!"), 1, patienceMs);

        QSignalSpy asked(m_window.get(), &FramelessWindow::connectToOrbMessage);
        QSignalSpy answered(m_window.get(), &FramelessWindow::connectToOrbFinished);
        titleBar()->serviceManagementAction()->trigger();
        QTRY_VERIFY_WITH_TIMEOUT(Form::visible<ServiceManagementAddServiceDialog>(), patienceMs);
        QCOMPARE(asked.size(), 1);
        QCOMPARE(answered.size(), 1);
        QCOMPARE(m_service.command("expire-sessions"), QStringLiteral("ok"));
        QTRY_VERIFY_WITH_TIMEOUT(Form::visible<LoginDialog>(), patienceMs);
        QVERIFY(!Form::visible<ServiceManagementAddServiceDialog>());
    }

    void onlyClicksKeepTheSession() {
        logIn();
        m_window->idleWatch()->setPeriod(2s);
        auto *device = m_window->findChild<QToolButton *>("deviceButton");
        QElapsedTimer clock;
        clock.start();
        while (clock.elapsed() < 3000) {
            QTest::mouseClick(device, Qt::LeftButton);
            QTest::qWait(50);
        }
        QVERIFY(m_window->isLoggedIn());
        clock.start();
        while (m_window->isLoggedIn() && clock.elapsed() < patienceMs) {
            QTest::keyClick(m_window.get(), Qt::Key_Shift);
            QTest::mouseMove(m_window.get(), QPoint(300 + static_cast<int>(clock.elapsed() % 100), 300));
            QTest::qWait(50);
        }
        QVERIFY(!m_window->isLoggedIn());
        QTRY_VERIFY(Form::visible<LoginDialog>());
        QCOMPARE(Form::text(Form::visible<LoginDialog>(), "tipLabel"), QStringLiteral("Session Timeout"));
        QTRY_COMPARE_WITH_TIMEOUT(sessions(), 0, patienceMs);
    }

    void requestedTaskIsNotLeftBehindUnasked() {
        logIn();
        QVERIFY(!requestTask().isEmpty());
        CTaskInfoPool::instance().loadTaskStatuses();
        QTRY_VERIFY_WITH_TIMEOUT(CTaskInfoPool::instance().hasRequestedTask(), patienceMs);
        const std::pair<std::function<void()>, const char *> leavings[] = {
            {[this] { QTest::mouseClick(titleBar()->closeButton(), Qt::LeftButton); }, "cancelButton"},
            {[this] { titleBar()->logOffAction()->trigger(); }, "cancelButton"},
            {[this] { titleBar()->logOffAction()->trigger(); }, "acceptButton"}};
        for (const auto &[leave, answer] : leavings) {
            QVERIFY(m_window->isVisible() && m_window->isLoggedIn());
            leave();
            QTRY_VERIFY(QApplication::activeModalWidget());
            Form::click(QApplication::activeModalWidget(), answer);
            QTRY_VERIFY(!QApplication::activeModalWidget() || Form::visible<LoginDialog>());
        }
        QVERIFY(!m_window->isLoggedIn());
        QVERIFY(CTaskInfoPool::instance().taskList()->isEmpty());
    }

    void runningTaskPutsTheIdleLogOffOff() {
        logIn();
        QVERIFY(m_service.command("task-pace 800").startsWith("ok"));
        QVERIFY(m_service.command("task deviceRestart 3").startsWith("ok"));
        CTaskInfoPool &pool = CTaskInfoPool::instance();
        pool.loadTaskStatuses();
        QTRY_VERIFY_WITH_TIMEOUT(pool.hasRunningTask(), patienceMs);
        m_window->idleWatch()->setPeriod(500ms);
        m_window->idleWatch()->noteActivity();
        QTRY_VERIFY(!m_window->idleWatch()->wasActiveSinceLastTick());
        QVERIFY(m_window->isLoggedIn());
        QVERIFY(pool.hasRunningTask());
        // The end of the last task is what the log-off has waited for.
        QTRY_VERIFY_WITH_TIMEOUT(!m_window->isLoggedIn(), patienceMs);
    }

    void notificationLeadsToItsPanel() {
        logIn();
        auto *side = m_window->findChild<SidePanel *>();
        QVERIFY(!side->isVisible());
        emit Notifier::instance().notificationClicked(Notifier::Task);
        QVERIFY(side->isVisible());
        QCOMPARE(side->current(), SidePanel::Panel::Tasks);
        QVERIFY(m_window->findChild<QToolButton *>("taskButton")->isChecked());
        QTest::mouseClick(m_window->findChild<QToolButton *>("alarmButton"), Qt::LeftButton);
        QCOMPARE(side->current(), SidePanel::Panel::Alarms);
        QVERIFY(m_service.command("drop 5").startsWith("ok"));
        auto *list = side->findChild<QListView *>("alarmList");
        QTRY_VERIFY_WITH_TIMEOUT(list->model()->rowCount() >= 5, patienceMs);
        QCOMPARE(m_window->findChild<BadgeButton *>("alarmButton")->badge(), 0);
        QTest::mouseClick(list->viewport(), Qt::LeftButton, {},
                          list->visualRect(list->model()->index(0, 0)).center());
        QCOMPARE(m_window->findChild<DeviceWindow *>()->selectedDevices().size(), 0u);
        QTest::keyClick(list, Qt::Key_Return);
        const auto &selected = m_window->findChild<DeviceWindow *>()->selectedDevices();
        QCOMPARE(selected.size(), 1u);
        QVERIFY(list->model()->index(0, 0).data().toString().startsWith("Lost connection to "));
        QTest::mouseClick(m_window->findChild<QToolButton *>("closeSidePanelButton"), Qt::LeftButton);
        QVERIFY(!m_window->findChild<QToolButton *>("alarmButton")->isChecked());
    }

    void sessionThatTheServiceEndedIsOver() {
        logIn();
        QCOMPARE(m_service.command("expire-sessions"), QStringLiteral("ok"));
        QTRY_VERIFY_WITH_TIMEOUT(Form::visible<LoginDialog>(), patienceMs);
        QCOMPARE(Form::text(Form::visible<LoginDialog>(), "tipLabel"), QStringLiteral("Session Timeout"));
        QVERIFY(!m_window->isLoggedIn());
        QVERIFY(showsWelcome());
        QCOMPARE(shownRows(), 0);
    }

    void changedServerKeyStopsTheSession_data() {
        QTest::addColumn<bool>("trusted");
        QTest::newRow("trusted") << true;
        QTest::newRow("refused") << false;
    }
    void changedServerKeyStopsTheSession() {
        QFETCH(bool, trusted);
        logIn();
        const std::string first = CLocalStore::instance().loginInfo().serverKey;
        QCOMPARE(ServerKeys::instance().fingerprint(ServerKeys::thisComputer), first);
        titleBar()->aboutAction()->trigger();
        QTRY_VERIFY(Form::visible<AboutDialog>());
        Form::click(Form::visible<AboutDialog>(), "copyKeyButton");
        QCOMPARE(QGuiApplication::clipboard()->text(), ServerKeys::readable(first));

        m_service.kill();
        QVERIFY(m_service.start({"--new-key"}));
        QTRY_VERIFY_WITH_TIMEOUT(Form::visible<ServerKeyDialog>(), patienceMs);
        QVERIFY(Form::visible<AboutDialog>());
        QTest::qWait(4000);
        QCOMPARE(m_window->findChildren<ServerKeyDialog *>().size(), 1);
        QCOMPARE(QApplication::activeModalWidget(), Form::visible<ServerKeyDialog>());
        QCOMPARE(CLocalStore::instance().loginInfo().serverKey, first);
        Form::click(Form::visible<ServerKeyDialog>(), trusted ? "trustButton" : "cancelButton");
        QTRY_VERIFY(!Form::visible<ServerKeyDialog>());
        Form::click(Form::visible<AboutDialog>(), "okButton");
        if (trusted) {
            QVERIFY(CLocalStore::instance().loginInfo().serverKey != first);
            unsigned result = ApiException;
            NetTask::runAndWait([&] {
                ServiceSession session(CLocalStore::instance().loginInfo());
                result = session.call([](CApiClient &client) { return client.removeSite("none"); });
            });
            QVERIFY2(result != ApiKeyChanged, "requests reach the service again");
            return;
        }
        QTRY_VERIFY_WITH_TIMEOUT(Form::visible<ReconnectingDialog>(), patienceMs);
        Form::click(Form::visible<ReconnectingDialog>(), "disconnectButton");
        QTRY_VERIFY_WITH_TIMEOUT(Form::visible<ServerKeyDialog>(), patienceMs);
        QVERIFY2(!m_window->isLoggedIn(), "it is the check before the login that asks now");
        QTest::keyClick(Form::visible<ServerKeyDialog>(), Qt::Key_Escape);
        QTRY_VERIFY(Form::visible<LoginDialog>());
        QVERIFY(Form::text(Form::visible<LoginDialog>(), "tipLabel").contains("another key than before"));
        QCOMPARE(ServerKeys::instance().fingerprint(ServerKeys::thisComputer), first);
        ServerKeys::instance().forget(ServerKeys::thisComputer);
    }

    void closedLoginDialogIsComeBackTo() {
        startService();
        openWindow();
        QTRY_VERIFY_WITH_TIMEOUT(Form::visible<LoginDialog>(), patienceMs);
        QTest::keyClick(Form::visible<LoginDialog>(), Qt::Key_Escape);
        QTRY_VERIFY(!m_window->findChild<LoginDialog *>());
        QVERIFY(showsWelcome());
        auto *again = m_window->findChild<QWidget *>("welcomeLoginButton");
        QTest::mouseClick(again, Qt::LeftButton);
        QTest::mouseClick(again, Qt::LeftButton);
        QTRY_VERIFY_WITH_TIMEOUT(Form::visible<LoginDialog>(), patienceMs);
        QTest::mouseClick(again, Qt::LeftButton);
        QVERIFY(NetTask::waitForAll(patienceMs));
        QCoreApplication::processEvents();
        QCOMPARE(m_window->findChildren<LoginDialog *>().size(), 1);
    }

    void anotherServerIsChosen() {
        QVERIFY(CClientStore::instance().saveServerList(
            {{{"id", "SVR1"}, {"info", "10.0.0.1:443"}, {"pass", "NorthPass1!"}, {"remember", "YES"}}}));
        logIn();
        auto *combo = m_window->findChild<QComboBox *>("remoteConnectionComboBox");
        QCOMPARE(combo->currentIndex(), -1);
        // The last two leave a change of the sites behind.
        for (const char *answer : {"cancelButton", "cancelButton", "acceptButton"}) {
            combo->setFocus();
            QTest::keyClick(combo, Qt::Key_Down);
            QTRY_VERIFY(QApplication::activeModalWidget());
            QVERIFY(m_window->isLoggedIn());
            QCOMPARE(QApplication::activeModalWidget()->objectName(), QStringLiteral("ConfirmDialog"));
            const auto *device = m_window->findChild<DeviceWindow *>();
            QCOMPARE(QApplication::activeModalWidget()->windowTitle(),
                     device->hasPendingEdits() ? QStringLiteral("Site Changes")
                                               : QStringLiteral("Remote Connection"));
            Form::click(QApplication::activeModalWidget(), answer);
            QTRY_VERIFY(!QApplication::activeModalWidget() || Form::visible<LoginDialog>());
            if (m_window->isLoggedIn() && !device->hasPendingEdits())
                Form::part<QToolButton>(device, "addTopSiteButton")->click();
        }
        QVERIFY(!m_window->isLoggedIn());
        QTRY_VERIFY(Form::visible<LoginDialog>());
        const LoginDialog *dialog = Form::visible<LoginDialog>();
        QVERIFY(Form::part<QRadioButton>(dialog, "remoteRadio")->isChecked());
        QCOMPARE(Form::part<QComboBox>(dialog, "remoteComboBox")->currentText(),
                 QStringLiteral("10.0.0.1:443"));
        QCOMPARE(Form::text(dialog, "remotePassEdit"), QStringLiteral("NorthPass1!"));
        QTRY_COMPARE_WITH_TIMEOUT(sessions(), 0, patienceMs);
    }

    void closeButtonEndsTheProgramAndTheSession() {
        logIn();
        QCOMPARE(sessions(), 1);
        QTimer::singleShot(0, this, [this] { QTest::mouseClick(titleBar()->closeButton(), Qt::LeftButton); });
        QTimer guard;
        connect(&guard, &QTimer::timeout, [] { QCoreApplication::exit(1); });
        guard.start(patienceMs);
        QCOMPARE(QCoreApplication::exec(), 0);
        m_window.reset();
        QCOMPARE(sessions(), 0);
    }

    void titleBarSwapsItsButtons() {
        openWindow();
        QTRY_VERIFY(Form::visible<LoginDialog>());
        QTest::mouseClick(titleBar()->maximizeButton(), Qt::LeftButton);
        QTRY_VERIFY(titleBar()->restoreButton()->isVisible() && m_window->isMaximized());
        QVERIFY(!titleBar()->maximizeButton()->isVisible());
        QTRY_VERIFY(isCentred(Form::visible<LoginDialog>()));
        QTest::mouseDClick(titleBar(), Qt::LeftButton, {}, QPoint(titleBar()->width() / 2, 20));
        QTRY_VERIFY(titleBar()->maximizeButton()->isVisible() && !m_window->isMaximized());
    }

private:
    /// A task whose work never comes.
    QString requestTask() {
        JSON task;
        NetTask::runAndWait([&] {
            ServiceSession(CLocalStore::instance().loginInfo()).call([&](CApiClient &client) {
                JSON devices;
                client.listDevices(0, 1, devices);
                return client.newTaskState("deviceRestart", JSON::array({devices.at(0).at("id")}), task);
            });
        });
        return stringMember(task, "tid");
    }

    void openWindow() {
        m_window = std::make_unique<FramelessWindow>();
        m_window->setContent(new MainWindow);
        m_window->show();
        QVERIFY(QTest::qWaitForWindowExposed(m_window.get()));
    }

    void startService() { QVERIFY(m_service.start({"--fresh", "--account", email + u':' + password})); }

    void logIn() {
        startService();
        openWindow();
        QTRY_VERIFY_WITH_TIMEOUT(Form::visible<LoginDialog>(), patienceMs);
        Form::type(Form::visible<LoginDialog>(), "localEmailEdit", email);
        Form::type(Form::visible<LoginDialog>(), "localPassEdit", password);
        Form::click(Form::visible<LoginDialog>(), "loginButton");
        QTRY_VERIFY_WITH_TIMEOUT(m_window->isLoggedIn(), patienceMs);
        QTRY_COMPARE_WITH_TIMEOUT(shownRows(), 20, patienceMs);
        QVERIFY(!Form::visible<LoginDialog>());
        QVERIFY(!showsWelcome());
        QVERIFY(titleBar()->accountButton()->isVisible());
        QVERIFY(m_window->idleWatch()->isRunning());
    }

    int sessions() { return m_service.command("counts").section("sessions=", 1).toInt(); }
    int shownRows() const {
        int rows = 0;
        for (const MainConsoleTable *table : m_window->findChildren<MainConsoleTable *>())
            rows += table->rowCount();
        return rows;
    }

    bool isCentred(const QWidget *dialog) const {
        return (dialog->geometry().center() - m_window->geometry().center()).manhattanLength() <= 2;
    }
    TitleBar *titleBar() const { return m_window->findChild<TitleBar *>(); }
    bool showsWelcome() const { return m_window->findChild<WelcomePage *>()->isVisible(); }

    IsolatedRoot m_root;
    EmulatorProcess m_service{m_root.path()};
    std::unique_ptr<FramelessWindow> m_window;
};

NVLDM_TEST(TestFramelessWindow)
#include "tst_framelesswindow.moc"
