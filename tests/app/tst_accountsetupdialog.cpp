#include "api/session/nettask.h"
#include "app/login/accountsetupdialog.h"
#include "form.h"
#include "store/clientstore.h"
#include "support/emulatorprocess.h"
#include "support/isolatedroot.h"
#include "support/testmain.h"

#include <QSignalSpy>

namespace {
constexpr int patienceMs = 15000;
} // namespace

class TestAccountSetupDialog : public QObject {
    Q_OBJECT

private slots:
    void initTestCase() { QVERIFY(m_service.start({"--devices", "0"})); }

    void init() {
        QCOMPARE(m_service.command("faults clear"), QStringLiteral("ok"));
        m_dialog = std::make_unique<AccountSetupDialog>();
        m_created = std::make_unique<QSignalSpy>(m_dialog.get(), &AccountSetupDialog::accountCreated);
        m_dialog->show();
        QVERIFY(QTest::qWaitForWindowActive(m_dialog.get()));
    }

    void cleanup() {
        m_created.reset();
        m_dialog.reset();
        QVERIFY(NetTask::waitForAll(patienceMs));
        QCoreApplication::processEvents();
    }

    void tellsWhatIsWrong_data() {
        QTest::addColumn<QStringList>("fields");
        QTest::addColumn<QString>("expected");
        const QString empty = QStringLiteral("The field can't be empty.");
        const QString weak = QStringLiteral("Password does not meet the requirements.");
        QTest::newRow("no email") << QStringList{"", "Passw0rd!", "Passw0rd!"} << empty;
        QTest::newRow("no password") << QStringList{"a@b.example", "", "Passw0rd!"} << empty;
        QTest::newRow("no confirmation") << QStringList{"a@b.example", "Passw0rd!", ""} << empty;
        QTest::newRow("mismatch") << QStringList{"a@b.example", "Passw0rd!", "Passw0rd"}
                                  << "Passwords do not match.";
        QTest::newRow("weak") << QStringList{"a@b.example", "Passw0rd", "Passw0rd"} << weak;
        QTest::newRow("blank password") << QStringList{"a@b.example", "        ", "        "} << weak;
    }
    void tellsWhatIsWrong() {
        QFETCH(QStringList, fields);
        fill(fields[0], fields[1], fields[2]);
        Form::click(m_dialog.get(), "nextButton");
        QTEST(warning(), "expected");
        QVERIFY(Form::part(m_dialog.get(), "nextButton")->isEnabled());
        QCOMPARE(accounts(), 1);
        QCOMPARE(m_created->size(), 0);
    }

    void createsTheFirstAccount() {
        fill(" first@norvell.example ", "Passw0rd!", "Passw0rd!");
        QTest::keyClick(Form::part(m_dialog.get(), "rememberCheckBox"), Qt::Key_Space);
        QTest::keyClick(Form::part(m_dialog.get(), "confirmEdit"), Qt::Key_Return);
        QTRY_COMPARE_WITH_TIMEOUT(m_created->size(), 1, patienceMs);
        QCOMPARE(warning(), QString());
        // It replaces the account that the service came with.
        QCOMPARE(accounts(), 1);
        const CClientStore &store = CClientStore::instance();
        QVERIFY(store.isThisComputer());
        QVERIFY(store.isLoginRememberMe());
        QCOMPARE(store.thisComputerAccount().email, QStringLiteral("first@norvell.example"));
        QCOMPARE(store.thisComputerAccount().password, QStringLiteral("Passw0rd!"));
    }

    void serviceRefuses_data() {
        QTest::addColumn<QString>("fault");
        QTest::addColumn<QString>("expected");
        QTest::newRow("taken") << ""
                               << "This email is already taken.";
        QTest::newRow("not allowed") << "fault code=5@/v1/accm/new"
                                     << "Create account failed.";
        QTest::newRow("broken answer") << "fault not-json@/v1/accm/new,times=1"
                                       << "Create account failed.";
        QTest::newRow("connection lost") << "fault reset@/v1/accm/new,times=1"
                                         << "Create account failed.";
    }
    void serviceRefuses() {
        QFETCH(QString, fault);
        if (!fault.isEmpty())
            QCOMPARE(m_service.command(fault), QStringLiteral("ok"));
        fill("first@norvell.example", "Passw0rd!", "Passw0rd!");
        Form::click(m_dialog.get(), "nextButton");
        QVERIFY(!Form::part(m_dialog.get(), "nextButton")->isEnabled());
        QTRY_VERIFY_WITH_TIMEOUT(Form::part(m_dialog.get(), "nextButton")->isEnabled(), patienceMs);
        QTEST(warning(), "expected");
        QCOMPARE(Form::text(m_dialog.get(), "nextButton"), QStringLiteral("Next"));
        QCOMPARE(m_created->size(), 0);
        QVERIFY(m_dialog->isVisible());
    }

private:
    void fill(const QString &email, const QString &password, const QString &confirmation) {
        Form::type(m_dialog.get(), "emailEdit", email);
        Form::type(m_dialog.get(), "passEdit", password);
        Form::type(m_dialog.get(), "confirmEdit", confirmation);
    }

    QString warning() const { return Form::text(m_dialog.get(), "msgWarningLabel"); }
    int accounts() { return m_service.command("counts").section("accounts=", 1).section(u' ', 0, 0).toInt(); }

    IsolatedRoot m_root;
    EmulatorProcess m_service{m_root.path()};
    std::unique_ptr<AccountSetupDialog> m_dialog;
    std::unique_ptr<QSignalSpy> m_created;
};

NVLDM_TEST(TestAccountSetupDialog)
#include "tst_accountsetupdialog.moc"
