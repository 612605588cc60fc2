#include "api/client/apiclient.h"
#include "api/session/nettask.h"
#include "app/frame/mainwindow.h"
#include "devices/page/devicewindow.h"
#include "form.h"
#include "pages/log/logwindow.h"
#include "pages/settings/settingwindow.h"
#include "store/localstore.h"
#include "support/emulatorprocess.h"
#include "support/isolatedroot.h"
#include "support/testmain.h"
#include "tasks/queue/exetaskmgr.h"
#include "tasks/service/taskinfopool.h"
#include "widgets/controls/badgebutton.h"
#include "widgets/dialogs/confirmdialog.h"

#include <QLabel>
#include <QSpinBox>
#include <QToolButton>

#include <nlohmann/json.hpp>

namespace {

const char *account = "admin@norvell.example";
const char *password = "Passw0rd!";
constexpr int patienceMs = 15000;

} // namespace

/// The way between the pages, and what stands guard on it.
class TestMainWindow : public QObject {
    Q_OBJECT

private slots:
    void initTestCase() {
        QVERIFY(m_service.start({"--fresh", "--account", QString::fromLatin1(account) + u':' + password}));
    }
    void init() {
        unsigned result = ApiException;
        NetTask::runAndWait(
            [&] { result = CApiClient("127.0.0.1", m_service.port()).loginServer(account, password); });
        QCOMPARE(result, unsigned(ApiOk));
        CLocalStore &store = CLocalStore::instance();
        store.setLoginInfo("127.0.0.1", m_service.port(), account, store.access());
        m_window = std::make_unique<MainWindow>();
        m_window->resize(1200, 680);
        m_window->show();
        QVERIFY(QTest::qWaitForWindowExposed(m_window.get()));
        // Without the device page's work, whose dialogs come when they want.
        m_window->settingWindow()->loadConfig();
        QTRY_VERIFY_WITH_TIMEOUT(Form::part(m_window.get(), "settingsForm")->isEnabled(), patienceMs);
    }
    void cleanup() {
        m_window.reset();
        CLocalStore::instance().clearLoginInfo();
        QVERIFY(NetTask::waitForAll(patienceMs));
    }

    void pagesLoadWhenTheyAreEntered() {
        go("logButton");
        QVERIFY(m_window->logWindow()->isVisible());
        QTRY_VERIFY_WITH_TIMEOUT(Form::text(m_window->logWindow(), "countLabel").contains("Found"),
                                 patienceMs);
        go("settingsButton");
        QVERIFY(m_window->settingWindow()->isVisible());
        QCOMPARE(Form::text(m_window->settingWindow(), "statusLabel"), QStringLiteral("Loading settings..."));
        QTRY_COMPARE(Form::text(m_window->settingWindow(), "statusLabel"), QString());
        go("deviceButton");
        QVERIFY(m_window->deviceWindow()->isVisible());
    }

    void failedOperationIsToldWhileThePanelIsClosed() {
        QVERIFY(m_service.command("fault code=3@/v1/task/init,times=2").startsWith("ok"));
        QVERIFY(ExeTaskMgr::instance().insertNewAutoAssignIpTask({"DV1"}));
        QVERIFY(ExeTaskMgr::instance().insertNewAutoAssignIpTask({"DV2"}));
        auto *button = m_window->findChild<BadgeButton *>("taskButton");
        QTRY_COMPARE_WITH_TIMEOUT(button->badge(), 2, patienceMs);
        QVERIFY(Form::text(m_window.get(), "transientMessage").contains("did not begin"));
        QTest::mouseClick(button, Qt::LeftButton);
        QCOMPARE(button->badge(), 0);
        QVERIFY(m_window->findChild<QWidget *>("failedTaskStrip")->isVisible());
        QTest::mouseClick(button, Qt::LeftButton);
        QCOMPARE(button->badge(), 0);
        CTaskInfoPool::instance().clear();
    }

    void changesAreNotLeftUnasked_data() {
        QTest::addColumn<QString>("from");
        QTest::addColumn<QString>("to");
        QTest::newRow("settings to devices") << "settingsButton"
                                             << "deviceButton";
        QTest::newRow("settings to log") << "settingsButton"
                                         << "logButton";
        QTest::newRow("devices to log") << "deviceButton"
                                        << "logButton";
        QTest::newRow("devices to settings") << "deviceButton"
                                             << "settingsButton";
    }
    void changesAreNotLeftUnasked() {
        QFETCH(QString, from);
        QFETCH(QString, to);
        go(from);
        QTRY_COMPARE(Form::text(m_window->settingWindow(), "statusLabel"), QString());
        change(from);
        QVERIFY(hasChanges());
        go(to);
        QTRY_VERIFY(question());
        QTest::keyClick(question(), Qt::Key_Escape);
        QTRY_VERIFY(!question());
        QVERIFY(isCurrent(from) && hasChanges());
        go(to);
        QTRY_VERIFY(question());
        QTest::keyClick(question(), Qt::Key_Return);
        QTRY_VERIFY(!question());
        QVERIFY(isCurrent(from) && hasChanges());
        go(to);
        QTRY_VERIFY(question());
        QVERIFY(isCurrent(from));
        Form::click(question(), "cancelButton");
        QTRY_VERIFY(isCurrent(to));
        QVERIFY(!hasChanges());
    }

    void logOffForgetsChanges() {
        go("settingsButton");
        change("settingsButton");
        m_window->stopWork();
        QVERIFY(!hasChanges());
        m_window->startWork();
        QVERIFY(isCurrent("deviceButton"));
    }

private:
    void go(const QString &button) {
        QTest::mouseClick(Form::part<QToolButton>(m_window.get(), qPrintable(button)), Qt::LeftButton);
    }
    void change(const QString &button) {
        if (button == "settingsButton")
            Form::part<QSpinBox>(m_window.get(), "logSpinBox")->stepUp();
        else
            Form::part<QToolButton>(m_window.get(), "addTopSiteButton")->click();
    }
    bool hasChanges() const {
        return m_window->settingWindow()->hasUnsavedEdits() || m_window->deviceWindow()->hasPendingEdits();
    }
    bool isCurrent(const QString &button) const {
        const QWidget *page = button == "deviceButton" ? static_cast<QWidget *>(m_window->deviceWindow())
                              : button == "logButton"  ? static_cast<QWidget *>(m_window->logWindow())
                                                       : m_window->settingWindow();
        return page->isVisible() && Form::part<QToolButton>(m_window.get(), qPrintable(button))->isChecked();
    }
    static ConfirmDialog *question() {
        return qobject_cast<ConfirmDialog *>(QApplication::activeModalWidget());
    }

    IsolatedRoot m_root;
    EmulatorProcess m_service{m_root.path()};
    std::unique_ptr<MainWindow> m_window;
};

NVLDM_TEST(TestMainWindow)
#include "tst_mainwindow.moc"
