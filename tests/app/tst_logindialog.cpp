#include "api/session/nettask.h"
#include "app/login/logindialog.h"
#include "app/login/remoteconnectiondialog.h"
#include "app/login/serverkeydialog.h"
#include "form.h"
#include "store/clientstore.h"
#include "store/localstore.h"
#include "support/emulatorprocess.h"
#include "support/isolatedroot.h"
#include "support/logcapture.h"
#include "support/scriptedpeer.h"
#include "support/testmain.h"

#include <QAbstractItemView>
#include <QComboBox>
#include <QFile>
#include <QPushButton>
#include <QRadioButton>
#include <QSemaphore>
#include <QSignalSpy>

#include <nlohmann/json.hpp>

#include <csignal>
#include <sys/resource.h>

namespace {

const QString email = QStringLiteral("admin@norvell.example");
const QString password = QStringLiteral("Passw0rd!");
const QString wrongLogin = QStringLiteral("Incorrect email or password. Try again.");
constexpr int patienceMs = 15000;

JSON savedServer(const std::string &name, const char *remember) {
    return {{"id", "SVR" + name},  {"svrname", name},         {"info", name + ".example:443"},
            {"acc", "me@" + name}, {"pass", "Pass1!" + name}, {"remember", remember}};
}

const JSON savedServers = {savedServer("north", "YES"), savedServer("south", "NO")};

} // namespace

class TestLoginDialog : public QObject {
    Q_OBJECT

private slots:
    void initTestCase() {
        QVERIFY(m_service.start({"--devices", "0", "--account", email + u':' + password}));
        CLocalStore::instance().setLocalServiceInstalled(true);
    }

    void init() {
        QVERIFY(CClientStore::instance().saveServerList(JSON::array()));
        CClientStore::instance().setThisComputer(true);
        CClientStore::instance().setThisComputerAccount({});
        CClientStore::instance().setRemoteComputerAccount({});
        CLocalStore::instance().clearLoginInfo();
        QCOMPARE(m_service.command("faults clear"), QStringLiteral("ok"));
        QCOMPARE(m_service.command("expire-sessions"), QStringLiteral("ok"));
        open();
    }

    void cleanup() {
        m_success.reset();
        m_dialog.reset();
        QVERIFY(NetTask::waitForAll(patienceMs));
        QCoreApplication::processEvents();
    }

    void fieldsMustBeFilled_data() {
        QTest::addColumn<QStringList>("fields"); // server, email, password; without a server: this computer
        QTest::addColumn<QString>("expected");
        const QString empty = QStringLiteral("The field can't be empty.");
        const QString noServer = QStringLiteral("Enter the server as an address or a name");
        QTest::newRow("no email") << QStringList{"", password} << empty;
        QTest::newRow("blank email") << QStringList{"   ", password} << empty;
        QTest::newRow("no password") << QStringList{email, ""} << empty;
        QTest::newRow("no email, remote") << QStringList{"10.0.0.1", "", password} << empty;
        QTest::newRow("no password, remote") << QStringList{"10.0.0.1", email, ""} << empty;
        QTest::newRow("no server") << QStringList{"", email, password} << empty;
        QTest::newRow("port too high") << QStringList{"10.0.0.1:65536", email, password} << noServer;
    }
    void fieldsMustBeFilled() {
        QFETCH(QStringList, fields);
        QFETCH(QString, expected);
        if (fields.size() == 3)
            fillRemote(fields[0], fields[1], fields[2]);
        else
            fillLocal(fields[0], fields[1]);
        Form::click(m_dialog.get(), "loginButton");
        QVERIFY2(tip().startsWith(expected), qPrintable(tip()));
        QVERIFY(!isBusy());
    }

    void returnLogsInHere() {
        QVERIFY(Form::part<QRadioButton>(m_dialog.get(), "localRadio")->isChecked());
        QVERIFY(Form::part(m_dialog.get(), "localEmailEdit")->hasFocus());
        QTest::keyClicks(QApplication::focusWidget(), email);
        QTest::keyClick(QApplication::focusWidget(), Qt::Key_Tab);
        QVERIFY(Form::part(m_dialog.get(), "localPassEdit")->hasFocus());
        QTest::keyClicks(QApplication::focusWidget(), password);
        QTest::keyClick(QApplication::focusWidget(), Qt::Key_Return);
        QTRY_COMPARE_WITH_TIMEOUT(m_success->size(), 1, patienceMs);
        const LoginInfo login = CLocalStore::instance().loginInfo();
        QVERIFY(login.isComplete());
        QCOMPARE(login.address, QStringLiteral("127.0.0.1"));
        QCOMPARE(login.port, m_service.port());
        QCOMPARE(login.account, email);
        QCOMPARE(tip(), QString());
        QVERIFY(CClientStore::instance().isThisComputer());
        QCOMPARE(CClientStore::instance().thisComputerAccount().email, email);
        QCOMPARE(sessions(), 1);
    }

    void logsInToARemoteServer() {
        const QString server = "127.0.0.1:" + QString::number(m_service.port());
        fillRemote(server);
        Form::click(m_dialog.get(), "loginButton");
        QTRY_COMPARE_WITH_TIMEOUT(m_success->size(), 1, patienceMs);
        QCOMPARE(CLocalStore::instance().loginInfo().address, QStringLiteral("127.0.0.1"));
        QCOMPARE(CLocalStore::instance().loginInfo().port, m_service.port());
        QVERIFY(!CClientStore::instance().isThisComputer());
        QCOMPARE(CClientStore::instance().remoteComputerAccount().server, server);
        QCOMPARE(CClientStore::instance().remoteComputerAccount().email, email);
    }

    void oneLoginAtATime() {
        QCOMPARE(m_service.command("fault late=1000@/v1/login"), QStringLiteral("ok"));
        fillLocal(email, password);
        auto *button = Form::part<QPushButton>(m_dialog.get(), "loginButton");
        QTest::mouseDClick(button, Qt::LeftButton);
        QTest::mouseClick(button, Qt::LeftButton);
        QTest::keyClick(Form::part(m_dialog.get(), "localPassEdit"), Qt::Key_Return);
        m_dialog->on_loginButton_clicked();
        QVERIFY(isBusy());
        QCOMPARE(button->text(), QStringLiteral("Logging in..."));
        QTRY_COMPARE_WITH_TIMEOUT(m_success->size(), 1, patienceMs);
        QTRY_VERIFY(!isBusy());
        QCOMPARE(button->text(), QStringLiteral("Log in"));
        QVERIFY(NetTask::waitForAll(patienceMs));
        QCoreApplication::processEvents();
        QCOMPARE(m_success->size(), 1);
        QCOMPARE(sessions(), 1);
    }

    void serverTells_data() {
        QTest::addColumn<QByteArray>("answer");
        QTest::addColumn<QString>("expected");
        QTest::newRow("no more sessions") << QByteArray(R"({"code":108,"msg":""})") << "Server full.";
        QTest::newRow("not accepted") << QByteArray(R"({"code":105,"msg":""})") << wrongLogin;
        QTest::newRow("refused") << QByteArray(R"({"code":5,"msg":""})") << wrongLogin;
        QTest::newRow("no JSON") << QByteArray("<html>") << wrongLogin;
        QTest::newRow("no token") << QByteArray(R"({"code":0,"msg":"","data":{}})")
                                  << "The server did not open a session. Try again.";
    }
    void serverTells() {
        QFETCH(QByteArray, answer);
        QFETCH(QString, expected);
        ScriptedPeer peer;
        peer.answer({ScriptedPeer::http(200, answer.toStdString())});
        fillRemote("127.0.0.1:" + QString::number(peer.port()));
        Form::click(m_dialog.get(), "loginButton");
        QTRY_COMPARE_WITH_TIMEOUT(tip(), expected, patienceMs);
        QCOMPARE(m_success->size(), 0);
        QVERIFY(!CLocalStore::instance().loginInfo().isComplete());
        QVERIFY(!isBusy() && m_dialog->isVisible());
        QCOMPARE(Form::text(m_dialog.get(), "remoteEmailEdit"), email);
        QCOMPARE(Form::text(m_dialog.get(), "remotePassEdit"), password);
    }

    void savedServerFillsTheFields() {
        QVERIFY(CClientStore::instance().saveServerList(savedServers));
        open();
        Form::click(m_dialog.get(), "remoteRadio");
        auto *combo = Form::part<QComboBox>(m_dialog.get(), "remoteComboBox");
        QCOMPARE(combo->currentText(), QString());
        QTest::keyClick(combo, Qt::Key_Down);
        QCOMPARE(combo->currentText(), QStringLiteral("north.example:443"));
        QCOMPARE(Form::text(m_dialog.get(), "remoteEmailEdit"), QStringLiteral("me@north"));
        QCOMPARE(Form::text(m_dialog.get(), "remotePassEdit"), QStringLiteral("Pass1!north"));
        QTest::keyClick(combo, Qt::Key_Down);
        QCOMPARE(combo->currentText(), QStringLiteral("south.example:443"));
        QCOMPARE(Form::text(m_dialog.get(), "remoteEmailEdit"), QStringLiteral("me@south"));
        QCOMPARE(Form::text(m_dialog.get(), "remotePassEdit"), QString());
        m_dialog->chooseServer("SVRnorth");
        QCOMPARE(combo->currentText(), QStringLiteral("north.example:443"));
        // Chosen from the list again, it is filled in again.
        Form::type(m_dialog.get(), "remoteEmailEdit", "you@north");
        combo->showPopup();
        QTest::keyClick(combo->view(), Qt::Key_Return);
        QCOMPARE(Form::text(m_dialog.get(), "remoteEmailEdit"), QStringLiteral("me@north"));
    }

    void editedServerIsFilledInAgain_data() {
        QTest::addColumn<QString>("typed");
        QTest::addColumn<QStringList>("expected"); // server, email, password
        const QString moved = QStringLiteral("north.example:444");
        QTest::newRow("nothing typed") << "" << QStringList{moved, "new@north", "New1!"};
        QTest::newRow("email typed") << "remoteEmailEdit" << QStringList{moved, "typed", "New1!"};
        QTest::newRow("password typed") << "remotePassEdit" << QStringList{moved, "new@north", "typed"};
    }
    void editedServerIsFilledInAgain() {
        QFETCH(QString, typed);
        JSON servers = savedServers;
        QVERIFY(CClientStore::instance().saveServerList(servers));
        open();
        m_dialog->chooseServer("SVRnorth");
        if (!typed.isEmpty())
            Form::type(m_dialog.get(), qPrintable(typed), "typed");
        servers[0].update({{"info", "north.example:444"}, {"acc", "new@north"}, {"pass", "New1!"}});
        QVERIFY(CClientStore::instance().saveServerList(servers));
        m_dialog->onUpdateSvr();
        const QStringList shown = {Form::part<QComboBox>(m_dialog.get(), "remoteComboBox")->currentText(),
                                   Form::text(m_dialog.get(), "remoteEmailEdit"),
                                   Form::text(m_dialog.get(), "remotePassEdit")};
        QTEST(shown, "expected");
    }

    void loginWaitsForNoOtherRequest() {
        QSemaphore hanging;
        QSemaphore released;
        NetTask other;
        other.setUp(0, [&](quintptr) {
            hanging.release();
            released.acquire();
        });
        other.start();
        QVERIFY(hanging.tryAcquire(1, patienceMs));
        fillLocal(email, password);
        Form::click(m_dialog.get(), "loginButton");
        const bool loggedIn = QTest::qWaitFor([this] { return m_success->size() == 1; }, patienceMs);
        released.release();
        QVERIFY(loggedIn);
        QVERIFY(CLocalStore::instance().loginInfo().thisComputer);
    }

    void closedDialogCutsItsLogin() {
        ScriptedPeer peer;
        peer.answer({"", ScriptedPeer::End::Hold});
        fillRemote("127.0.0.1:" + QString::number(peer.port()));
        Form::click(m_dialog.get(), "loginButton");
        QTRY_COMPARE(peer.connections(), 1);
        m_success.reset();
        m_dialog.reset();
        QVERIFY(NetTask::waitForAll(1000));
    }

    void loginThatCannotBeKeptIsTold() {
        QSignalSpy told(m_dialog.get(), &LoginDialog::notRemembered);
        QVERIFY(CClientStore::instance().setThisComputer(true));
        fillRemote("127.0.0.1:" + QString::number(m_service.port()));
        // No file grows any more, as on a full disk.
        std::signal(SIGXFSZ, SIG_IGN);
        rlimit usual{};
        QCOMPARE(::getrlimit(RLIMIT_FSIZE, &usual), 0);
        const rlimit none{0, usual.rlim_max};
        QCOMPARE(::setrlimit(RLIMIT_FSIZE, &none), 0);
        Form::click(m_dialog.get(), "loginButton");
        const bool loggedIn = QTest::qWaitFor([this] { return m_success->size() == 1; }, patienceMs);
        QCOMPARE(::setrlimit(RLIMIT_FSIZE, &usual), 0);
        QVERIFY(loggedIn);
        QCOMPARE(told.size(), 1);
        QVERIFY(CClientStore::instance().isThisComputer());
        QVERIFY2(!CLocalStore::instance().loginInfo().thisComputer, "a file here would be named to a server");
    }

    void savedListIsReadAgain() {
        Form::click(m_dialog.get(), "remoteRadio");
        auto *combo = Form::part<QComboBox>(m_dialog.get(), "remoteComboBox");
        QTest::keyClicks(combo->lineEdit(), "half.typ");
        Form::type(m_dialog.get(), "remoteEmailEdit", "me@norvell.example");
        QVERIFY(CClientStore::instance().saveServerList(savedServers));
        Form::click(m_dialog.get(), "manageServersButton");
        QTRY_VERIFY(Form::visible<RemoteConnectionDialog>());
        Form::click(Form::visible<RemoteConnectionDialog>(), "saveButton");
        QTRY_VERIFY(!Form::visible<RemoteConnectionDialog>());
        QCOMPARE(combo->count(), 2);
        QCOMPARE(combo->currentText(), QStringLiteral("half.typ"));
        QCOMPARE(Form::text(m_dialog.get(), "remoteEmailEdit"), QStringLiteral("me@norvell.example"));
    }

    /// The combo box chooses an entry of the very text that it shows as soon as it is left.
    void offeredAccountIsKept_data() {
        QTest::addColumn<bool>("again");
        QTest::newRow("at the start") << false;
        QTest::newRow("when the list was read again") << true;
    }
    void offeredAccountIsKept() {
        QFETCH(bool, again);
        const auto store = [](const JSON &servers) {
            QVERIFY(CClientStore::instance().saveServerList(servers));
        };
        store(again ? JSON::array() : savedServers);
        CClientStore::instance().setThisComputer(false);
        CClientStore::instance().setRemoteComputerAccount({"south.example:443", "you@south", "Mine1!"});
        open();
        if (again) {
            store(savedServers);
            m_dialog->onUpdateSvr();
        }
        auto *combo = Form::part<QComboBox>(m_dialog.get(), "remoteComboBox");
        QTest::mouseClick(combo->lineEdit(), Qt::LeftButton);
        QVERIFY(combo->hasFocus() || combo->lineEdit()->hasFocus());
        QTest::keyClick(QApplication::focusWidget(), Qt::Key_Tab);
        QTest::mouseClick(Form::part(m_dialog.get(), "remoteEmailEdit"), Qt::LeftButton);
        QCOMPARE(combo->currentText(), QStringLiteral("south.example:443"));
        QCOMPARE(Form::text(m_dialog.get(), "remoteEmailEdit"), QStringLiteral("you@south"));
        QCOMPARE(Form::text(m_dialog.get(), "remotePassEdit"), QStringLiteral("Mine1!"));
        // Somebody who asks for the server gets what was saved with it.
        m_dialog->chooseServer("SVRsouth");
        QCOMPARE(Form::text(m_dialog.get(), "remoteEmailEdit"), QStringLiteral("me@south"));
        QCOMPARE(Form::text(m_dialog.get(), "remotePassEdit"), QString());
    }

    void brokenKeyFileIsTold() {
        const LogCapture log;
        const QString told =
            QStringLiteral("The key file %1 cannot be used.").arg(m_root.filePath("nvlcrypto.key"));
        QVERIFY(m_root.write("nvlcrypto.key", "no key"));
        fillLocal(email, password);
        Form::click(m_dialog.get(), "loginButton");
        QTRY_VERIFY_WITH_TIMEOUT(tip().startsWith(told), patienceMs);
        open();
        const QString atOnce = tip();
        QVERIFY(QFile::remove(m_root.filePath("nvlcrypto.key")));
        QVERIFY2(atOnce.startsWith(told), qPrintable(atOnce));
        m_dialog.reset();
        QCOMPARE(log.count("LoginDialog constructor"), 1);
        QCOMPARE(log.count("LoginDialog destructor"), 2);
    }

    void changedKeyIsAskedAbout_data() {
        QTest::addColumn<bool>("here");
        QTest::addColumn<bool>("trusted");
        QTest::newRow("this computer, trusted") << true << true;
        QTest::newRow("this computer, refused") << true << false;
        QTest::newRow("remote, trusted") << false << true;
        QTest::newRow("remote, refused") << false << false;
    }
    void changedKeyIsAskedAbout() {
        QFETCH(bool, here);
        QFETCH(bool, trusted);
        const QString address = "127.0.0.1:" + QString::number(m_service.port());
        const QString server = here ? ServerKeys::thisComputer : address;
        ServerKeys &keys = ServerKeys::instance();
        keys.forget(server);
        const auto logIn = [&] {
            open();
            here ? fillLocal(email, password) : fillRemote(address);
            QTest::keyClick(QApplication::focusWidget(), Qt::Key_Return);
        };
        for (const int kept : {1, 0}) {
            logIn();
            const QSignalSpy told(m_dialog.get(), &LoginDialog::serverKeyKept);
            QTRY_COMPARE_WITH_TIMEOUT(m_success->size(), 1, patienceMs);
            QCOMPARE(told.size(), kept);
        }
        const std::string first = keys.fingerprint(server);
        QCOMPARE(CLocalStore::instance().loginInfo().serverKey, first);
        QCOMPARE(CLocalStore::instance().loginInfo().server, server);

        QVERIFY(m_service.stop());
        QVERIFY(m_service.start({"--devices", "0", "--new-key", "--account", email + u':' + password}));
        QCOMPARE(m_service.command("expire-sessions"), QStringLiteral("ok"));
        logIn();
        QTRY_VERIFY_WITH_TIMEOUT(Form::visible<ServerKeyDialog>(), patienceMs);
        const auto *question = Form::visible<ServerKeyDialog>();
        QVERIFY(tip().startsWith("The server shows another key than before.") && !isBusy());
        QCOMPARE(Form::text(question, "rememberedKeyLabel").replace(u'\n', u' '),
                 ServerKeys::readable(first));
        QVERIFY(Form::text(question, "rememberedTimeLabel")
                    .contains(QString::number(QDate::currentDate().day())));
        const QString shown = Form::text(question, "newKeyLabel").replace(u'\n', u' ');
        QVERIFY(shown != ServerKeys::readable(first));
        QCOMPARE(sessions(), 0);
        QVERIFY(QTest::qWaitForWindowActive(Form::visible<ServerKeyDialog>()));
        // The Enter key does not trust by accident.
        if (trusted)
            QTest::keyClick(QApplication::focusWidget(), Qt::Key_Backtab);
        QTest::keyClick(QApplication::focusWidget(), trusted ? Qt::Key_Space : Qt::Key_Return);
        QTRY_VERIFY(!Form::visible<ServerKeyDialog>());
        QTRY_COMPARE_WITH_TIMEOUT(m_success->size(), trusted ? 1 : 0, patienceMs);
        QCOMPARE(sessions(), trusted ? 1 : 0);
        QCOMPARE(ServerKeys::readable(keys.fingerprint(server)),
                 trusted ? shown : ServerKeys::readable(first));
        keys.forget(server);
    }

    void mayBeClosedWhileTheLoginRuns() {
        QCOMPARE(m_service.command("fault late=1000@/v1/login"), QStringLiteral("ok"));
        fillLocal(email, password);
        const LogCapture log;
        QTest::keyClick(m_dialog.get(), Qt::Key_Return);
        QVERIFY(isBusy());
        QTRY_COMPARE(log.count("login local server!"), 1);
        m_success.reset();
        m_dialog.reset();
        QVERIFY(NetTask::waitForAll(patienceMs));
        QCoreApplication::processEvents();
        QVERIFY(!CLocalStore::instance().loginInfo().isComplete());
        QCOMPARE(log.count("login successfully!"), 0);
        QCOMPARE(log.count("Encountered unexpected error"), 0);
    }

private:
    void open() {
        m_success.reset();
        m_dialog = std::make_unique<LoginDialog>(QString());
        m_success = std::make_unique<QSignalSpy>(m_dialog.get(), &LoginDialog::loginSuccess);
        m_dialog->show();
        QVERIFY(QTest::qWaitForWindowActive(m_dialog.get()));
    }

    void fillLocal(const QString &account, const QString &secret) {
        Form::type(m_dialog.get(), "localEmailEdit", account);
        Form::type(m_dialog.get(), "localPassEdit", secret);
    }
    void fillRemote(const QString &server, const QString &account = email, const QString &secret = password) {
        Form::click(m_dialog.get(), "remoteRadio");
        auto *edit = Form::part<QComboBox>(m_dialog.get(), "remoteComboBox")->lineEdit();
        edit->selectAll();
        QTest::keyClick(edit, Qt::Key_Delete);
        QTest::keyClicks(edit, server);
        Form::type(m_dialog.get(), "remoteEmailEdit", account);
        Form::type(m_dialog.get(), "remotePassEdit", secret);
    }
    int sessions() { return m_service.command("counts").section("sessions=", 1).toInt(); }
    QString tip() const { return Form::text(m_dialog.get(), "tipLabel"); }
    bool isBusy() const { return !Form::part(m_dialog.get(), "loginButton")->isEnabled(); }

    IsolatedRoot m_root;
    EmulatorProcess m_service{m_root.path()};
    std::unique_ptr<LoginDialog> m_dialog;
    std::unique_ptr<QSignalSpy> m_success;
};

NVLDM_TEST(TestLoginDialog)
#include "tst_logindialog.moc"
