#include "api/session/sessionevents.h"
#include "devices/operations/assignip/assignipdialog.h"
#include "devices/operations/authorizedevicedialog.h"
#include "devices/operations/deviceoperations.h"
#include "devices/operations/passwordpolicydialog.h"
#include "devices/operations/restoredevicedialog.h"
#include "devices/operations/setpassworddialog.h"
#include "devices/operations/targetlistdialog.h"
#include "devices/page/devicewindow.h"
#include "devices/page/mainconsoletable.h"
#include "support/logcapture.h"
#include "support/signedinservice.h"
#include "support/testmain.h"
#include "tasks/queue/failedoperations.h"
#include "tasks/service/retryregistry.h"
#include "tasks/service/taskinfopool.h"
#include "widgets/dialogs/confirmdialog.h"
#include "widgets/style/icons.h"

#include <QAction>
#include <QCheckBox>
#include <QComboBox>
#include <QLabel>
#include <QLineEdit>
#include <QPushButton>
#include <QSignalSpy>
#include <QSpinBox>
#include <QTableView>
#include <QTest>
#include <QToolButton>

#include <nlohmann/json.hpp>

#include <algorithm>

namespace {
constexpr int patienceMs = 15000;
} // namespace

/// The operations of the console, from the button to what the devices are after them.
class TestOperations : public QObject {
    Q_OBJECT

private slots:
    void init() {
        m_service.start({"--devices", "12", "--task-pace", "60"});
        m_service.tell("admit all");
        m_window = std::make_unique<DeviceWindow>();
        m_window->resize(1280, 720);
        m_window->show();
        QVERIFY(QTest::qWaitForWindowExposed(m_window.get()));
        m_window->startWork();
        QTRY_VERIFY(table()->rowCount() > 2);
        QTest::keyClick(table(), Qt::Key_A, Qt::ControlModifier);
    }

    void cleanup() {
        m_window->stopWork();
        CLocalStore::instance().clearLoginInfo();
        m_window.reset();
        QVERIFY(NetTask::waitForAll(patienceMs));
        CTaskInfoPool::instance().clear();
        QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
        m_service.process().kill();
    }

    void commandsKeepTheirForm() {
        using namespace DeviceOperations;
        QCOMPARE(restoreCommand({}), QByteArray("/cgi-bin/admin/setparam.cgi?system_restore=1"));
        QCOMPARE(restoreCommand({1}), QByteArray("/cgi-bin/admin/setparam.cgi?system_restoreexceptnet=1"
                                                 "&system_restoreexceptdst=-1&system_restoreexceptlang=-1"
                                                 "&system_restoreexceptnadp=-1"
                                                 "&system_restoreexceptfocusvalue=-1"
                                                 "&system_restoreexceptlen=-1"));
        QCOMPARE(passwordCommand("root", "a%b"),
                 QByteArray("/cgi-bin/admin/editaccount.cgi?method=edit&username=root&userpass=a%b"));
        const QString longest(roomInPasswordCommand() - 4, 'x');
        QVERIFY(passwordCommand("root", longest).endsWith('&' + QByteArray("userpass=") + longest.toUtf8()));
        QCOMPARE(passwordCommand("root", longest).size(), 255);
        QCOMPARE(passwordCommand(QString(300, 'x'), "y").size(), 255);
    }

    void passwordsAreChangedAndAuthorized() {
        click("setPasswordButton");
        auto *dialog = visible<SetPasswordDialog>();
        QVERIFY(dialog);
        const int devices = table()->rowCount();
        QCOMPARE(label(dialog, "targetCountLabel"), QStringLiteral("%1 device(s) selected").arg(devices));
        const auto type = [&](const char *edit, const QString &text) {
            dialog->findChild<QLineEdit *>(edit)->clear();
            QTest::keyClicks(dialog->findChild<QLineEdit *>(edit), text);
        };
        const auto apply = [&] { dialog->findChild<QPushButton *>("applyButton")->click(); };
        apply();
        QCOMPARE(label(dialog, "passWarningLabel"), QStringLiteral("The field can't be empty."));
        type("passEdit", "New Passw0rd");
        apply();
        QVERIFY(label(dialog, "passWarningLabel").startsWith("Only alphanumeric characters and the"));
        type("passEdit", "Fresh-Passw0rd");
        type("confirmEdit", "Fresh-Passw0re");
        apply();
        QCOMPARE(label(dialog, "msgWarningLabel"),
                 QStringLiteral("New Password and Confirm Password don't match."));
        const auto *icon = dialog->findChild<QLabel *>("msgWarningIcon");
        const QPixmap hint =
            Icons::pixmap(":/images/icon_general_hint_solid_black.svg", {12, 12}, icon->devicePixelRatioF());
        QCOMPARE(icon->pixmap().toImage(), hint.toImage());
        QVERIFY(dialog->isVisible());
        for (const char *edit : {"passEdit", "confirmEdit"})
            dialog->findChild<QLineEdit *>(edit)->setText(QString(200, 'x'));
        QCOMPARE(dialog->findChild<QLineEdit *>("passEdit")->text().size(), 200);
        apply();
        QVERIFY(label(dialog, "msgWarningLabel").startsWith("Username and password are too long"));
        QVERIFY(dialog->isVisible());
        type("passEdit", "Fresh-Passw0rd");
        type("confirmEdit", "Fresh-Passw0rd");
        const LogCapture log;
        apply();
        QTRY_VERIFY(!visible<SetPasswordDialog>());
        QTRY_VERIFY_WITH_TIMEOUT(ended("deviceChangePass"), patienceMs);
        QVERIFY(log.count("onSetPassword: name: root, password: Fresh-Passw0rd") == 1);
        QTRY_COMPARE_WITH_TIMEOUT(countWith("Invalid Password"), devices, patienceMs);
        // What is done again asks for the password again.
        const RetryRegistry::Repeat *repeat = RetryRegistry::instance().find(ended("deviceChangePass")->tid);
        QVERIFY(repeat && repeat->needsInput);
        repeat->again({m_window->selectedDevices().front()->id});
        QTRY_VERIFY(visible<SetPasswordDialog>());
        QCOMPARE(label(visible<SetPasswordDialog>(), "targetCountLabel"),
                 QStringLiteral("1 device(s) selected"));
        visible<SetPasswordDialog>()->reject();

        click("authorizeButton");
        auto *authorize = visible<AuthorizeDeviceDialog>();
        QVERIFY(authorize);
        // The dialog that refreshes all states may stand before this one and take the keys.
        authorize->findChild<QLineEdit *>("passEdit")->setText("Fresh-Passw0rd");
        authorize->findChild<QPushButton *>("applyButton")->click();
        QTRY_VERIFY(messageHas(QStringLiteral("%1 of %1 devices are authorized.").arg(devices)));
        QTRY_COMPARE_WITH_TIMEOUT(countWith("Authorized"), devices, patienceMs);
    }

    void namesAreSentAsTyped() {
        for (const char *name : {"Admin", "ro", "ROOT", "root"}) {
            click("authorizeButton");
            auto *dialog = visible<AuthorizeDeviceDialog>();
            QVERIFY(dialog);
            QSignalSpy sent(dialog, &AuthorizeDeviceDialog::authDevices);
            auto *field = dialog->findChild<QComboBox *>("nameComboBox");
            field->setFocus();
            field->lineEdit()->selectAll();
            QTest::keyClicks(field->focusWidget() ? field->focusWidget() : field, name);
            QTest::keyClick(field, Qt::Key_Tab);
            QTest::keyClicks(dialog->findChild<QLineEdit *>("passEdit"), "Passw0rd");
            dialog->findChild<QPushButton *>("applyButton")->click();
            QCOMPARE(sent.size(), 1);
            QCOMPARE(sent[0][0].toString(), QString(name));
            QTRY_VERIFY(!visible<AuthorizeDeviceDialog>());
        }
    }

    void policyIsSetForTheTickedDevices() {
        click("setPasswordButton");
        auto *dialog = visible<SetPasswordDialog>();
        QTest::mouseClick(dialog->findChild<QToolButton *>("showTargetsButton"), Qt::LeftButton);
        auto *list = visible<TargetListDialog>();
        QVERIFY(list);
        auto *targets = list->findChild<QTableView *>("targetTable");
        const auto *edit = dialog->findChild<QLabel *>("policyEditLabel");
        for (const bool ticked : {false, true}) {
            list->findChild<QCheckBox *>("targetAllCheckBox")->click();
            QCOMPARE(edit->isEnabled(), ticked);
        }
        targets->setCurrentIndex(targets->model()->index(0, 0));
        QTest::keyClick(targets, Qt::Key_Space);
        list->accept();
        const int devices = table()->rowCount();
        QCOMPARE(label(dialog, "targetCountLabel"),
                 QStringLiteral("%1 of %2 devices selected").arg(devices - 1).arg(devices));
        emit dialog->findChild<QLabel *>("policyEditLabel")->linkActivated({});
        auto *policy = visible<PasswordPolicyDialog>();
        QVERIFY(policy);
        auto *length = policy->findChild<QSpinBox *>("lengthSpinBox");
        length->setValue(100);
        QCOMPARE(length->value(), 64);
        length->setValue(1);
        QCOMPARE(length->value(), 8);
        length->setValue(12);
        policy->findChild<QCheckBox *>("lengthCheckBox")->setChecked(false);
        for (const auto *name : {"alphabeticCheckBox", "numericCheckBox", "specialCheckBox",
                                 "uppercaseCheckBox", "lowercaseCheckBox", "usernameCheckBox"})
            policy->findChild<QCheckBox *>(name)->setChecked(true);
        const LogCapture log;
        policy->findChild<QPushButton *>("applyButton")->click();
        QTRY_VERIFY_WITH_TIMEOUT(ended("devicePassPolicy"), patienceMs);
        QCOMPARE(log.count("apply password policy: length[12], type[63]"), 1);
        QCOMPARE(int(ended("devicePassPolicy")->devices.size()), devices - 1);
        QCOMPARE(countOfPolicies(12, 63), devices - 1);
        // The dialog holds what is typed against the new policy at once.
        QTest::keyClicks(dialog->findChild<QLineEdit *>("passEdit"), "Short-1x");
        QVERIFY(label(dialog, "targetWarningLabel").contains("refuse this password"));
        dialog->findChild<QToolButton *>("generateButton")->click();
        QTRY_COMPARE(dialog->findChild<QLabel *>("targetWarningLabel"), nullptr);
    }

    void restoreAsksForTheNumber() {
        entry("factoryDefaultAction")->trigger();
        auto *dialog = visible<RestoreDeviceDialog>();
        QVERIFY(dialog);
        auto *restore = dialog->findChild<QPushButton *>("restoreButton");
        QVERIFY(!restore->isEnabled());
        QTest::keyClicks(dialog->findChild<QLineEdit *>("countEdit"), "1");
        QVERIFY(!restore->isEnabled());
        dialog->findChild<QLineEdit *>("countEdit")->setText(QString::number(table()->rowCount()));
        QVERIFY(restore->isEnabled());
        for (const auto *name : {"daylightCheckBox", "lensCheckBox"})
            dialog->findChild<QCheckBox *>(name)->setChecked(true);
        const LogCapture log;
        restore->click();
        QTRY_VERIFY_WITH_TIMEOUT(ended("deviceRestore"), patienceMs);
        QCOMPARE(log.count("onRestoreDevice: network: 1, daylight: -1, lan: 1, nadp: 1, focus: 1, lens: -1"),
                 1);
    }

    void restartLeavesOutWhatWillFail() {
        const QString id = m_window->selectedDevices().front()->id;
        m_service.tell("drop " + id);
        QTRY_COMPARE_WITH_TIMEOUT(countWith("Unreachable"), 1, patienceMs);
        click("restartButton");
        auto *dialog = visible<ConfirmDialog>();
        QVERIFY(dialog);
        QCOMPARE(label(dialog, "targetWarningLabel"),
                 QStringLiteral("1 device(s) will fail: not reachable."));
        dialog->findChild<QToolButton *>("leaveOutButton")->click();
        dialog->findChild<QPushButton *>("acceptButton")->click();
        QTRY_VERIFY_WITH_TIMEOUT(ended("deviceRestart"), patienceMs);
        QCOMPARE(int(ended("deviceRestart")->devices.size()), table()->rowCount() - 1);
        QCOMPARE(ended("deviceRestart")->failedDevices, 0);
    }

    void lostAnswerIsNoFailureToStart() {
        m_service.tell("fault reset@/v1/cgi/customx,times=1");
        click("restartButton");
        visible<ConfirmDialog>()->findChild<QPushButton *>("acceptButton")->click();
        QTRY_VERIFY_WITH_TIMEOUT(messageHas("Restart Device may have begun: "), patienceMs);
        // One that is refused has not, and one whose task was made without an answer goes on under it.
        m_service.tell("fault code=4@/v1/cgi/customx,times=1");
        click("restartButton");
        visible<ConfirmDialog>()->findChild<QPushButton *>("acceptButton")->click();
        QTRY_VERIFY_WITH_TIMEOUT(messageHas("Restart Device failed: "), patienceMs);
        m_service.tell("fault reset@/v1/task/init,times=1");
        const int before = tasksOf("deviceRestart");
        click("restartButton");
        visible<ConfirmDialog>()->findChild<QPushButton *>("acceptButton")->click();
        QTRY_VERIFY_WITH_TIMEOUT(ended("deviceRestart"), patienceMs);
        QCOMPARE(tasksOf("deviceRestart"), before + 1);
    }

    void endOfTheSessionIsToldLater() {
        m_service.tell("fault expire@/v1/task/init,times=1");
        click("restartButton");
        visible<ConfirmDialog>()->findChild<QPushButton *>("acceptButton")->click();
        const LoginInfo login = CLocalStore::instance().loginInfo();
        QTRY_VERIFY_WITH_TIMEOUT(SessionEvents::instance().wasLost(login.generation), patienceMs);
        FailedOperations &failures = FailedOperations::instance();
        QCOMPARE(failures.count(), 0);
        CTaskInfoPool::instance().clear();
        m_service.logIn();
        CTaskInfoPool::instance().loadTaskStatuses();
        QTRY_COMPARE_WITH_TIMEOUT(failures.count(), 1, patienceMs);
        QVERIFY(failures.first()->failure.text().startsWith("Restart Device on "));
        failures.startFirstAgain();
        QTRY_VERIFY_WITH_TIMEOUT(ended("deviceRestart"), patienceMs);
    }

    void goesOnWithoutVanishedDevices() {
        const QString id = m_window->selectedDevices().front()->id;
        click("restartButton");
        m_service.tell("remove " + id);
        m_service.tell("fault code=4@/v1/task/init,times=1");
        visible<ConfirmDialog>()->findChild<QPushButton *>("acceptButton")->click();
        QTRY_VERIFY(messageHas("Left out: 1 device(s) that the server does not manage any more."));
        QTRY_VERIFY_WITH_TIMEOUT(ended("deviceRestart"), patienceMs);
    }

    void addressesAreShownAndAssigned() {
        click("ipButton");
        auto *dialog = visible<AssignIpDialogII>();
        QVERIFY(dialog);
        const auto apply = [&] { dialog->findChild<QPushButton *>("applyButton")->click(); };
        const auto set = [&](const char *edit, const QString &text) {
            dialog->findChild<QLineEdit *>(edit)->setText(text);
        };
        const int devices = table()->rowCount();
        QCOMPARE(label(dialog, "totalLabel"), QStringLiteral("Total Quantity: %1").arg(devices));
        dialog->findChild<QComboBox *>("methodComboBox")->setCurrentText("Manual");
        apply();
        QCOMPARE(label(dialog, "msgWarningLabel"), QStringLiteral("The field can’t be empty."));
        set("addressEdit", "10.77.0.1-2");
        set("gatewayEdit", "10.77.0.1");
        apply();
        QVERIFY(label(dialog, "msgWarningLabel").startsWith("IP conflicts or not enough available IP"));
        set("addressEdit", "10.77.0.*");
        auto *list = dialog->findChild<QTableView *>("deviceTable");
        QCOMPARE(list->model()->index(0, 3).data().toString(), QStringLiteral("10.77.0.2"));
        QVERIFY(!list->model()->setData(list->model()->index(0, 3), "10.77.0.300"));
        QVERIFY(list->model()->setData(list->model()->index(0, 3), "10.77.0.3"));
        QCOMPARE(list->model()->index(1, 3).data().toString(), QStringLiteral("10.77.0.2"));
        // Another client gives one of the addresses away at this moment.
        const JSON taken = JSON::array({{{"id", ""},
                                         {"d_mac", "00:11:22:33:44:55"},
                                         {"d_ip", "10.77.0.2"},
                                         {"d_model", "N"},
                                         {"d_svrtype", "NVR"},
                                         {"siteid", {"DO000000000000"}}}});
        SignedInService::call([&](CApiClient &client) { return client.commitDevices(taken, "all"); });
        apply();
        QTRY_VERIFY(
            label(dialog, "msgWarningLabel").startsWith("Some of the addresses were taken meanwhile"));
        QCOMPARE(list->model()->index(1, 3).data().toString(), QStringLiteral("10.77.0.4"));
        // The device with an address of its own needs none of these.
        set("addressEdit", QStringLiteral("10.77.0.4-%1").arg(devices + 2));
        apply();
        QTRY_VERIFY(!visible<AssignIpDialogII>());
        QTRY_VERIFY_WITH_TIMEOUT(ended("deviceAssignIPManual"), patienceMs);
        const auto assigned = [this] {
            int count = 0;
            for (int row = 0; row < table()->rowCount(); ++row)
                count += table()->item(row, 3)->text().startsWith("10.77.0.") ? 1 : 0;
            return count;
        };
        QTRY_COMPARE_WITH_TIMEOUT(assigned(), devices, patienceMs);
    }

    void windowsMayCloseWhileTheirJobsRun() {
        m_service.tell("fault late=700@/v1/task/init,times=9");
        click("setPasswordButton");
        auto *dialog = visible<SetPasswordDialog>();
        emit dialog->findChild<QLabel *>("policyEditLabel")->linkActivated({});
        visible<PasswordPolicyDialog>()->findChild<QPushButton *>("applyButton")->click();
        dialog->reject();
        QTRY_VERIFY(!visible<SetPasswordDialog>());
        QTRY_VERIFY_WITH_TIMEOUT(ended("devicePassPolicy"), patienceMs);
        // And the session may end under an operation.
        click("restartButton");
        visible<ConfirmDialog>()->findChild<QPushButton *>("acceptButton")->click();
        m_window->stopWork();
        CLocalStore::instance().clearLoginInfo();
        QVERIFY(NetTask::waitForAll(patienceMs));
        QCoreApplication::processEvents();
        QVERIFY(!ended("deviceRestart"));
    }

private:
    MainConsoleTable *table() const { return m_window->findChild<MainConsoleTable *>("cameraTable"); }
    QAction *entry(const char *name) const { return m_window->findChild<QAction *>(name); }
    void click(const char *name) { m_window->findChild<QToolButton *>(name)->click(); }

    template <typename Dialog>
    Dialog *visible() const {
        for (auto *dialog : m_window->findChildren<Dialog *>()) {
            if (dialog->isVisible())
                return dialog;
        }
        return nullptr;
    }
    static QString label(const QWidget *dialog, const char *name) {
        const auto *found = dialog->findChild<QLabel *>(name);
        return found ? found->text() : QString();
    }
    bool messageHas(const QString &text) const {
        const auto messages = m_window->findChildren<QLabel *>("transientMessage");
        return std::any_of(messages.begin(), messages.end(),
                           [&](const QLabel *each) { return each->text().contains(text); });
    }
    int countWith(const QString &status) const {
        int count = 0;
        for (int row = 0; row < table()->rowCount(); ++row)
            count += table()->item(row, 0)->text().trimmed() == status ? 1 : 0;
        return count;
    }
    /// The latest task of a type, null until it has ended.
    static TaskRecordPtr ended(const QString &type) {
        for (const TaskRecordPtr &task : CTaskInfoPool::instance().taskList()->records()) {
            if (task->type == type)
                return task->isFinal() ? task : nullptr;
        }
        return nullptr;
    }
    static int tasksOf(const QString &type) {
        const auto &tasks = CTaskInfoPool::instance().taskList()->records();
        return static_cast<int>(std::count_if(tasks.begin(), tasks.end(),
                                              [&](const TaskRecordPtr &task) { return task->type == type; }));
    }
    static int countOfPolicies(int length, int rules) {
        JSON devices;
        SignedInService::call([&](CApiClient &client) { return client.listDevices(0, 500, devices); });
        return static_cast<int>(std::count_if(devices.begin(), devices.end(), [&](const JSON &device) {
            return DeviceRecords::parse(device)->policy == PasswordPolicy{length, rules};
        }));
    }

    SignedInService m_service;
    std::unique_ptr<DeviceWindow> m_window;
};

NVLDM_TEST(TestOperations)
#include "tst_operations.moc"
