#include "api/session/nettask.h"
#include "app/login/accountmanagementdialog.h"
#include "form.h"
#include "store/clientstore.h"
#include "support/emulatorprocess.h"
#include "support/isolatedroot.h"
#include "support/logcapture.h"
#include "support/testmain.h"

#include <QCheckBox>
#include <QSignalSpy>

namespace {

constexpr int patienceMs = 15000;
const QString email = QStringLiteral("admin@norvell.example");
const QString firstPassword = QStringLiteral("Passw0rd!");
const QString secondPassword = QStringLiteral("N3w-Passw0rd");

} // namespace

class TestAccountManagementDialog : public QObject {
    Q_OBJECT

private slots:
    void initTestCase() {
        QVERIFY(m_service.start({"--devices", "0", "--account", email + u':' + firstPassword}));
    }

    void init() {
        QCOMPARE(m_service.command("faults clear"), QStringLiteral("ok"));
        open(true);
    }

    void cleanup() {
        m_dialog.reset();
        QVERIFY(NetTask::waitForAll(patienceMs));
        QCoreApplication::processEvents();
    }

    void offersTheAccountOfTheLastLogin() {
        QCOMPARE(Form::text(m_dialog.get(), "emailEdit"), email);
        QCOMPARE(Form::text(m_dialog.get(), "oldPassEdit"), firstPassword);
        QVERIFY(Form::part<QCheckBox>(m_dialog.get(), "rememberCheckBox")->isChecked());
        QCOMPARE(m_dialog->focusWidget(), Form::part(m_dialog.get(), "newPassEdit"));
        open(false);
        QCOMPARE(Form::text(m_dialog.get(), "emailEdit"), email);
        QCOMPARE(Form::text(m_dialog.get(), "oldPassEdit"), QString());
        QVERIFY(!Form::part<QCheckBox>(m_dialog.get(), "rememberCheckBox")->isChecked());
    }

    void keysLeadThroughEverything() {
        QStringList way;
        for (int i = 0; i < 7; ++i) {
            way << m_dialog->focusWidget()->objectName();
            QTest::keyClick(m_dialog->focusWidget(), Qt::Key_Tab);
        }
        QCOMPARE(way, QStringList({"newPassEdit", "confirmEdit", "rememberCheckBox", "cancelButton",
                                   "applyButton", "emailEdit", "oldPassEdit"}));
        QTest::keyClick(m_dialog.get(), Qt::Key_Escape);
        QCOMPARE(m_dialog->result(), int(QDialog::Rejected));
        QVERIFY(!m_dialog->isVisible());
    }

    void tellsWhatIsWrong_data() {
        QTest::addColumn<QStringList>("fields");
        QTest::addColumn<QString>("expected");
        const QString empty = QStringLiteral("The field can't be empty.");
        const QString weak = QStringLiteral("Password does not meet the requirements.");
        QTest::newRow("no email") << QStringList{" ", "a", secondPassword, secondPassword} << empty;
        QTest::newRow("no old password") << QStringList{email, "", secondPassword, secondPassword} << empty;
        QTest::newRow("no new password") << QStringList{email, "a", "", secondPassword} << empty;
        QTest::newRow("no confirmation") << QStringList{email, "a", secondPassword, ""} << empty;
        QTest::newRow("mismatch") << QStringList{email, "a", "weak", "Weak"} << "Passwords do not match.";
        QTest::newRow("weak") << QStringList{email, "a", "Passw0rd", "Passw0rd"} << weak;
    }
    void tellsWhatIsWrong() {
        QFETCH(QStringList, fields);
        const LogCapture log;
        fill(fields[0], fields[1], fields[2], fields[3]);
        Form::click(m_dialog.get(), "applyButton");
        QTEST(Form::text(m_dialog.get(), "msgWarningLabel"), "expected");
        QVERIFY(Form::part(m_dialog.get(), "applyButton")->isEnabled());
        QCOMPARE(log.count("get local server port"), 0);
    }

    void refusedChangeLeavesTheStoredAccount_data() {
        QTest::addColumn<QString>("fault");
        QTest::addColumn<QStringList>("fields");
        const QStringList right = {email, firstPassword, secondPassword, secondPassword};
        QTest::newRow("wrong old password")
            << QString() << QStringList{email, "wrong", secondPassword, secondPassword};
        QTest::newRow("unknown account")
            << QString() << QStringList{"a@b", firstPassword, secondPassword, secondPassword};
        QTest::newRow("connection lost") << "fault reset@/v1/accm/revpas" << right;
        QTest::newRow("broken answer") << "fault not-json@/v1/accm/revpas" << right;
    }
    void refusedChangeLeavesTheStoredAccount() {
        QFETCH(QString, fault);
        QFETCH(QStringList, fields);
        const LogCapture log;
        if (!fault.isEmpty())
            QCOMPARE(m_service.command(fault), QStringLiteral("ok"));
        fill(fields[0], fields[1], fields[2], fields[3]);
        for (int clicks = 0; clicks < 2; ++clicks)
            Form::click(m_dialog.get(), "applyButton");
        QTRY_VERIFY_WITH_TIMEOUT(Form::part(m_dialog.get(), "applyButton")->isEnabled(), patienceMs);
        QCOMPARE(Form::text(m_dialog.get(), "msgWarningLabel"), QStringLiteral("Change password failed."));
        QCOMPARE(log.count("account management change password failed!"), 1);
        QVERIFY(m_dialog->isVisible());
        QCOMPARE(CClientStore::instance().thisComputerAccount().password, firstPassword);
        if (!fault.isEmpty())
            restorePassword();
    }

    void changesThePassword_data() {
        QTest::addColumn<bool>("remember");
        QTest::addColumn<bool>("closeEarly");
        QTest::newRow("remembered") << true << false;
        QTest::newRow("not remembered") << false << false;
        QTest::newRow("dialog closed meanwhile") << true << true;
    }
    void changesThePassword() {
        QFETCH(bool, remember);
        QFETCH(bool, closeEarly);
        const LogCapture log;
        if (closeEarly)
            QCOMPARE(m_service.command("fault late=500@/v1/accm/revpas,times=1"), QStringLiteral("ok"));
        QSignalSpy accepted(m_dialog.get(), &QDialog::accepted);
        fill(email, firstPassword, secondPassword, secondPassword);
        if (!remember)
            QTest::keyClick(Form::part(m_dialog.get(), "rememberCheckBox"), Qt::Key_Space);
        QTest::keyClick(Form::part(m_dialog.get(), "confirmEdit"), Qt::Key_Return);
        QVERIFY(!Form::part(m_dialog.get(), "applyButton")->isEnabled());
        if (closeEarly)
            m_dialog.reset();
        else
            QTRY_COMPARE_WITH_TIMEOUT(accepted.size(), 1, patienceMs);
        QTRY_COMPARE_WITH_TIMEOUT(log.count("account management change password successfully!"), 1,
                                  patienceMs);
        QVERIFY(NetTask::waitForAll(patienceMs));
        const CClientStore &store = CClientStore::instance();
        QCOMPARE(store.isLoginRememberMe(), remember);
        QCOMPARE(store.thisComputerAccount().email, email);
        QCOMPARE(store.thisComputerAccount().password, remember ? secondPassword : QString());
        restorePassword();
    }

private:
    void open(bool remember) {
        CClientStore::instance().setLoginRememberMe(remember);
        CClientStore::instance().setThisComputerAccount({{}, email, firstPassword});
        m_dialog = std::make_unique<AccountManagementDialog>();
        m_dialog->show();
        QVERIFY(QTest::qWaitForWindowActive(m_dialog.get()));
    }

    void fill(const QString &account, const QString &old, const QString &fresh, const QString &confirmation) {
        Form::type(m_dialog.get(), "emailEdit", account);
        Form::type(m_dialog.get(), "oldPassEdit", old);
        Form::type(m_dialog.get(), "newPassEdit", fresh);
        Form::type(m_dialog.get(), "confirmEdit", confirmation);
    }

    /// Changes back what a test may have changed, which is a test of its own for equal passwords.
    void restorePassword() {
        m_service.command("faults clear");
        for (const QString &old : {secondPassword, firstPassword}) {
            open(true);
            fill(email, old, firstPassword, firstPassword);
            Form::click(m_dialog.get(), "applyButton");
            QTRY_VERIFY_WITH_TIMEOUT(Form::part(m_dialog.get(), "applyButton")->isEnabled(), patienceMs);
        }
        QVERIFY2(!m_dialog->isVisible(), "the same password again is taken");
    }

    IsolatedRoot m_root;
    EmulatorProcess m_service{m_root.path()};
    std::unique_ptr<AccountManagementDialog> m_dialog;
};

NVLDM_TEST(TestAccountManagementDialog)
#include "tst_accountmanagementdialog.moc"
