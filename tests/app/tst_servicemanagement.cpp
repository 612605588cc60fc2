#include "api/session/nettask.h"
#include "api/session/servicesession.h"
#include "api/session/sessionevents.h"
#include "app/remote/servicemanagement.h"
#include "app/remote/servicemanagementaddservicedialog.h"
#include "app/remote/servicemanagementstatusdialog.h"
#include "form.h"
#include "store/clientstore.h"
#include "store/localstore.h"
#include "support/emulatorprocess.h"
#include "support/isolatedroot.h"
#include "support/logcapture.h"
#include "support/scriptedpeer.h"
#include "support/testmain.h"
#include "widgets/controls/toggleswitch.h"
#include "widgets/dialogs/confirmdialog.h"
#include "widgets/dialogs/transientmessage.h"

#include <QComboBox>
#include <QDesktopServices>
#include <QLabel>
#include <QSignalSpy>
#include <QTextDocumentFragment>

#include <nlohmann/json.hpp>

#include <memory>

using AddDialog = ServiceManagementAddServiceDialog;
using StatusDialog = ServiceManagementStatusDialog;

namespace {

constexpr int patienceMs = 20000;
const QString password = QStringLiteral("Passw0rd!");
const QString partner = QStringLiteral("partner@norvell.example");
const QString partnerPassword = QStringLiteral("Partner-1");
const QString unable =
    QStringLiteral("Unable to connect to this service. Check connection information, then retry.");
const QString unknown = QStringLiteral(
    "Oops! An unknown error happened. Try again or contact Norvell technical support for further "
    "assistance.");
const QString expired =
    QStringLiteral("Session expired. Click 'Back' to go to the previous step and try again.");
const QString noIndex =
    QStringLiteral("No organization or site exist. Create an organization first or site.");
const QString noAccess = QStringLiteral("One or more customers do not have remote access permission.");

/// What a label shows, without its markup.
QString shown(const QWidget *form, const char *name) {
    return QTextDocumentFragment::fromHtml(Form::text(form, name)).toPlainText();
}

} // namespace

/// Takes the place of the user's browser.
class Browser : public QObject {
    Q_OBJECT

public:
    Browser() { QDesktopServices::setUrlHandler("https", this, "open"); }
    ~Browser() override { QDesktopServices::unsetUrlHandler("https"); }
    QList<QUrl> opened;

public slots:
    void open(const QUrl &url) { opened << url; }
};

class TestServiceManagement : public QObject {
    Q_OBJECT

private slots:
    void initTestCase() {
        QVERIFY(m_service.start(
            {"--account", "boss@x:" + password, "--account", "op@x:" + password + ":operator"}));
    }

    void init() {
        m_service.command("faults clear");
        m_service.command("orb disconnect");
        tell("orb orgs default");
        logIn("boss@x");
        m_frame = std::make_unique<QWidget>();
        m_frame->resize(900, 600);
        m_management = new ServiceManagement(m_frame.get());
        m_frame->show();
        QVERIFY(QTest::qWaitForWindowExposed(m_frame.get()));
    }

    void cleanup() {
        m_frame.reset();
        CLocalStore::instance().clearLoginInfo();
        QVERIFY(NetTask::waitForAll(patienceMs));
        QCoreApplication::processEvents();
    }

    void fromTheFirstStepToTheLinkAndBack() {
        QSignalSpy asked(m_management, &ServiceManagement::connectToOrbMessage);
        QSignalSpy answered(m_management, &ServiceManagement::connectToOrbFinished);
        QSignalSpy added(m_management, &ServiceManagement::serviceAdded);
        m_management->validateOrbServiceAdded();
        m_management->validateOrbServiceAdded();
        QTRY_VERIFY_WITH_TIMEOUT(Form::visible<AddDialog>(), patienceMs);
        QCOMPARE(asked.size(), 1);
        QCOMPARE(asked[0][0].toString(), QStringLiteral("connecting to ORB..."));
        QCOMPARE(answered.size(), 1);
        QCOMPARE(Form::visible<AddDialog>()->windowTitle(), QStringLiteral("Norvell Service Management"));

        signInWithTheKeyboard();
        chooseOrganization();
        switchRemoteAccess();
        disconnectAfterAsking();
        QCOMPARE(added.size(), 3);
        QCOMPARE(added.last()[0].toBool(), false);
    }

    void signInFails_data() {
        const QString desk = QStringLiteral(" Check account information via Norvell Partner Desk.");
        const QString expiredPassword =
            QStringLiteral("Invalid password: Password reset required or password expired.");
        const QString empty = QStringLiteral("The field can't be empty.");
        rows({{"no e-mail", "", "", "x", empty},
              {"no password", "", partner, "", empty},
              {"wrong password", "", partner, "wrong", "Incorrect email or password." + desk},
              {"expired", "", "expired@norvell.example", partnerPassword, expiredPassword + desk},
              {"unknown", "", "a@x", "x", "User does not exist. Become a Partner via Norvell Partner Desk."},
              {"no answer", "fault reset@/v1/orb/login", partner, partnerPassword, unable},
              {"no JSON", "fault not-json@/v1/orb/login", partner, partnerPassword, unknown}});
    }
    void signInFails() {
        QFETCH(QStringList, texts);
        AddDialog *add = openAddDialog();
        tell(texts[0]);
        signIn(add, texts[1], texts[2]);
        QTRY_COMPARE_WITH_TIMEOUT(errorOf(add), texts[3], patienceMs);
        QVERIFY(Form::part(add, "nextButton")->isEnabled() && !atLocation(add));
        // A link in it can be followed with the keyboard.
        const Browser browser;
        auto *error = Form::part<QLabel>(add, "errMsg");
        const bool linked = texts[3].contains("Norvell Partner Desk");
        QCOMPARE(error->focusPolicy() != Qt::NoFocus, linked);
        error->setFocus(Qt::TabFocusReason);
        QTest::keyClick(error, Qt::Key_Return);
        QCOMPARE(browser.opened.size(), linked ? 1 : 0);
    }

    void locationsThatCannotBeChosen_data() {
        rows({{"none", "orb orgs 0", "", noIndex},
              {"no sites", "", "Alder Retail", noIndex},
              {"no remote access", "", "Riverside Schools", noAccess},
              {"the list is not answered", "fault reset@/v1/orb/orgs", "", unable},
              {"the list is no list", "fault wrong-types=data@/v1/orb/orgs", "", unknown},
              {"the sign-in has ended", "fault code=105@/v1/orb/orgs", "", expired}});
    }
    void locationsThatCannotBeChosen() {
        QFETCH(QStringList, texts);
        AddDialog *add = openAddDialog();
        tell(texts[0]);
        signIn(add, partner, partnerPassword);
        QTRY_VERIFY_WITH_TIMEOUT(atLocation(add), patienceMs);
        if (!texts[1].isEmpty())
            Form::part<QComboBox>(add, "organizationComboBox")->setCurrentText(texts[1]);
        QCOMPARE(errorOf(add), texts[2]);
        QVERIFY(!Form::part(add, "applyButton")->isEnabled());
        Form::click(add, "backButton");
        QVERIFY(!atLocation(add));
        QCOMPARE(errorOf(add), QString());
        QCOMPARE(Form::text(add, "passwordInput"), partnerPassword);
    }

    void applyFails_data() {
        rows({{"sign-in ended", "orb expire", expired, ""},
              {"no answer", "fault reset@/v1/orb/add_service", unable, ""},
              {"refused", "fault code=4@/v1/orb/add_service", "", unknown}});
    }
    void applyFails() {
        QFETCH(QStringList, texts);
        AddDialog *add = openAddDialog();
        signIn(add, partner, partnerPassword);
        QTRY_VERIFY_WITH_TIMEOUT(atLocation(add), patienceMs);
        tell(texts[0]);
        Form::part<QComboBox>(add, "organizationComboBox")->setCurrentIndex(1);
        Form::part<QComboBox>(add, "siteComboBox")->setCurrentIndex(0);
        Form::click(add, "applyButton");
        QTRY_VERIFY_WITH_TIMEOUT(Form::part(add, "applyButton")->isEnabled(), patienceMs);
        QCOMPARE(errorOf(add), texts[1]);
        QCOMPARE(message(add), texts[2]);
        QVERIFY(add->isVisible());
    }

    void statusDialogTellsFailures_data() {
        rows({{"switch refused", "fault code=5@/v1/orb/remote_access", "", "Failed to set remote access."},
              {"switch unanswered", "fault reset@/v1/orb/remote_access", unable, ""},
              {"switch, no data", "fault no-data@/v1/orb/remote_access", unknown, ""},
              {"disconnection refused", "orb disconnect", unknown, ""},
              {"disconnection unanswered", "fault reset@/v1/orb/logout_service", unable, ""}});
    }
    void statusDialogTellsFailures() {
        QFETCH(QStringList, texts);
        StatusDialog *status = openStatusDialog();
        auto *toggle = Form::part<ToggleSwitch>(status, "remoteAccessSwitch");
        QTRY_VERIFY_WITH_TIMEOUT(toggle->isEnabled(), patienceMs);
        QSignalSpy changed(status, &StatusDialog::statusChanged);
        const LogCapture log;
        tell(texts[0]);
        if (texts[0].contains("remote_access")) {
            QTest::mouseClick(toggle, Qt::LeftButton);
        } else {
            Form::click(status, "disconnectButton");
            QTRY_VERIFY(Form::visible<ConfirmDialog>());
            QTest::keyClick(Form::visible<ConfirmDialog>(), Qt::Key_Return);
            QCOMPARE(message(status), QStringLiteral("Disconnecting..."));
        }
        QVERIFY(!toggle->isEnabled());
        QTRY_VERIFY_WITH_TIMEOUT(toggle->isEnabled(), patienceMs);
        QVERIFY(!toggle->isChecked() && status->isVisible());
        QCOMPARE(shown(status, "errorMessage"), texts[1]);
        QCOMPARE(message(status), texts[2]);
        QCOMPARE(log.count(texts[0].contains("remote_access") ? "HTTP API(toggleRemoteAccess) failed! ("
                                                              : "HTTP API(disconnectOrbService) failed! ("),
                 1);
        QCOMPARE(changed.size(), 0);
    }

    void switchAnsweredOtherwise() {
        ScriptedPeer peer;
        peer.follow([](const ScriptedPeer::Request &request) {
            return ScriptedPeer::sealed(request.path == "/v1/orb/remote_access"
                                            ? JSON{{"enable", false}}
                                            : JSON{{"is_orb_service_added", true},
                                                   {"connected", true},
                                                   {"remoteAccess", {{"enable", false}}}});
        });
        link();
        const LoginInfo login = CLocalStore::instance().loginInfo();
        CLocalStore::instance().setLoginInfo("127.0.0.1", peer.port(), login.account, login.token);
        StatusDialog *status = openStatusDialog();
        auto *toggle = Form::part<ToggleSwitch>(status, "remoteAccessSwitch");
        QTRY_VERIFY_WITH_TIMEOUT(toggle->isEnabled(), patienceMs);
        QTest::mouseClick(toggle, Qt::LeftButton);
        QTRY_COMPARE_WITH_TIMEOUT(message(status), QStringLiteral("Failed to set remote access."),
                                  patienceMs);
        QVERIFY(!toggle->isChecked());
        CLocalStore::instance().clearLoginInfo();
        QVERIFY(NetTask::waitForAll(patienceMs));
        QCoreApplication::processEvents();
    }

    void statusThatIsNotKnown_data() {
        const QString notKnown = QStringLiteral("The status is not known.");
        rows({{"no answer", "fault reset@/v1/orb/cache/status", notKnown, unable},
              {"bad cipher", "fault bad-cipher@/v1/orb/cache/status", notKnown, unknown},
              {"interrupted", "orb connected off", "Not connected at the moment", ""}});
    }
    void statusThatIsNotKnown() {
        QFETCH(QStringList, texts);
        link();
        tell(texts[0]);
        StatusDialog *status = openStatusDialog();
        QTRY_COMPARE_WITH_TIMEOUT(Form::text(status, "linkStateLabel"), texts[1], patienceMs);
        QCOMPARE(shown(status, "errorMessage"), texts[2]);
        QCOMPARE(Form::part(status, "remoteAccessSwitch")->isEnabled(), texts[2].isEmpty());
        QVERIFY(Form::part(status, "disconnectButton")->isEnabled());
    }

    void permissionDecidesWhatIsOffered() {
        link();
        logIn("op@x");
        QSignalSpy added(m_management, &ServiceManagement::serviceAdded);
        m_management->lookUp();
        QTRY_COMPARE_WITH_TIMEOUT(added.size(), 1, patienceMs);
        QVERIFY(added[0][0].toBool());
        StatusDialog *status = openStatusDialog();
        QTRY_COMPARE_WITH_TIMEOUT(shown(status, "errorMessage"),
                                  QStringLiteral("Only an administrator can change this."), patienceMs);
        QVERIFY(!Form::part(status, "remoteAccessSwitch")->isEnabled());
        QVERIFY(!Form::part(status, "disconnectButton")->isEnabled());
        QTest::keyClick(status, Qt::Key_Escape);
        tell("orb disconnect");
        m_management->validateOrbServiceAdded();
        QTRY_COMPARE_WITH_TIMEOUT(message(m_frame.get()),
                                  QStringLiteral("Only an administrator can connect the service."),
                                  patienceMs);
        QVERIFY(!Form::visible<AddDialog>() && !Form::visible<StatusDialog>());
    }

    void closingWhileARequestRuns() {
        AddDialog *add = openAddDialog();
        tell("fault late=500@/v1/orb/login,times=1");
        signIn(add, partner, partnerPassword);
        QTest::keyClick(add, Qt::Key_Escape);
        QTRY_VERIFY(!m_frame->findChild<AddDialog *>());
        QVERIFY(NetTask::waitForAll(patienceMs));
        QCoreApplication::processEvents();
        openAddDialog();
    }

    void closedWhileAChangeIsUnderWay_data() {
        rows({{"linked", "fault late=700@/v1/orb/add_service", "Applying...", "Applied successfully"},
              {"not linked", "fault code=4@/v1/orb/add_service", "Applying...", unknown},
              {"unlinked", "fault late=700@/v1/orb/logout_service", "Disconnecting...",
               "Disconnected successfully!"}});
    }
    void closedWhileAChangeIsUnderWay() {
        QFETCH(QStringList, texts);
        const bool unlinks = texts[1] == "Disconnecting...";
        QSignalSpy added(m_management, &ServiceManagement::serviceAdded);
        ServiceDialog *dialog = unlinks ? static_cast<ServiceDialog *>(openStatusDialog()) : openAddDialog();
        tell(texts[0] + ",times=1");
        if (unlinks) {
            QTRY_VERIFY_WITH_TIMEOUT(Form::part(dialog, "disconnectButton")->isEnabled(), patienceMs);
            Form::click(dialog, "disconnectButton");
            QTRY_VERIFY(Form::visible<ConfirmDialog>());
            Form::click(Form::visible<ConfirmDialog>(), "acceptButton");
        } else {
            auto *add = static_cast<AddDialog *>(dialog);
            signIn(add, partner, partnerPassword);
            QTRY_VERIFY_WITH_TIMEOUT(atLocation(add), patienceMs);
            Form::part<QComboBox>(add, "organizationComboBox")->setCurrentIndex(1);
            Form::part<QComboBox>(add, "siteComboBox")->setCurrentIndex(0);
            Form::click(add, "applyButton");
        }
        QPointer<ServiceDialog> closed = dialog;
        QTest::keyClick(dialog, Qt::Key_Escape);
        QVERIFY(!dialog->isVisible());
        QCOMPARE(message(m_frame.get()), texts[1]);
        // Asked for again, it is there again, and may be closed again.
        m_management->validateOrbServiceAdded();
        QVERIFY(dialog->isVisible());
        QTest::keyClick(dialog, Qt::Key_Escape);
        QTRY_COMPARE_WITH_TIMEOUT(message(m_frame.get()), texts[2], patienceMs);
        QTRY_VERIFY(!closed);
        QVERIFY(!Form::visible<AddDialog>() && !Form::visible<StatusDialog>());
        QCOMPARE(added.last()[0].toBool(), texts[2] == "Applied successfully");
        QCOMPARE(m_service.command("orb status").contains("added=1"), added.last()[0].toBool());
    }

    void unansweredQuestionEndsOnce() {
        QSignalSpy answered(m_management, &ServiceManagement::connectToOrbFinished);
        tell("fault reset@/v1/orb/cache,times=1");
        m_management->validateOrbServiceAdded();
        QTRY_COMPARE_WITH_TIMEOUT(message(m_frame.get()), unable, patienceMs);
        QCOMPARE(answered.size(), 1);
        // The session may end as well; then there is nothing to be told.
        QSignalSpy lost(&SessionEvents::instance(), &SessionEvents::sessionLost);
        connect(&SessionEvents::instance(), &SessionEvents::sessionLost, m_management,
                &ServiceManagement::reset);
        tell("expire-sessions");
        m_management->validateOrbServiceAdded();
        QTRY_COMPARE_WITH_TIMEOUT(answered.size(), 2, patienceMs);
        QCOMPARE(lost.size(), 1);
        QVERIFY(!Form::visible<AddDialog>());
    }

private:
    void signInWithTheKeyboard() {
        auto *add = Form::visible<AddDialog>();
        QVERIFY(QTest::qWaitForWindowActive(add));
        QCOMPARE(add->focusWidget()->objectName(), QStringLiteral("serviceComboBox"));
        QTest::keyClick(add->focusWidget(), Qt::Key_Down);
        QTest::keyClick(add->focusWidget(), Qt::Key_Tab);
        QTest::keyClicks(add->focusWidget(), partner);
        QTest::keyClick(add->focusWidget(), Qt::Key_Tab);
        QTest::keyClicks(add->focusWidget(), partnerPassword);
        QTest::keyClick(add->focusWidget(), Qt::Key_Return);
        QTRY_VERIFY_WITH_TIMEOUT(atLocation(add), patienceMs);
        QCOMPARE(errorOf(add), noAccess);
        QTRY_COMPARE(add->focusWidget()->objectName(), QStringLiteral("organizationComboBox"));
    }

    void chooseOrganization() {
        auto *add = Form::visible<AddDialog>();
        auto *organizations = Form::part<QComboBox>(add, "organizationComboBox");
        QStringList names;
        for (int i = 0; i < organizations->count(); ++i)
            names << organizations->itemText(i);
        QCOMPARE(names, QStringList({"Alder Retail", "Harbour Logistics", "Riverside Schools"}));
        QTest::keyClicks(organizations, "har");
        QCOMPARE(errorOf(add), QString());
        QVERIFY(!Form::part(add, "applyButton")->isEnabled());
        QTest::keyClick(add->focusWidget(), Qt::Key_Tab);
        QTest::keyClicks(add->focusWidget(), "ware");
        for (int clicks = 0; clicks < 2; ++clicks)
            Form::click(add, "applyButton");
        QCOMPARE(message(add), QStringLiteral("Applying..."));
        QTRY_VERIFY_WITH_TIMEOUT(Form::visible<StatusDialog>(), patienceMs);
        QCOMPARE(message(m_frame.get()), QStringLiteral("Applied successfully"));
        QVERIFY(!Form::visible<AddDialog>());
        QVERIFY(m_service.command("orb status").contains("\"connected\":true"));
    }

    void switchRemoteAccess() {
        auto *status = Form::visible<StatusDialog>();
        auto *toggle = Form::part<ToggleSwitch>(status, "remoteAccessSwitch");
        QTRY_VERIFY_WITH_TIMEOUT(toggle->isEnabled(), patienceMs);
        QVERIFY(!toggle->isChecked());
        QCOMPARE(Form::text(status, "linkStateLabel"), QStringLiteral("Connected"));
        toggle->setFocus();
        QTest::keyClick(toggle, Qt::Key_Space);
        QCOMPARE(message(status), QStringLiteral("Set Remote Access..."));
        QVERIFY(!toggle->isEnabled() && !Form::part(status, "disconnectButton")->isEnabled());
        QTRY_COMPARE_WITH_TIMEOUT(message(status), QStringLiteral("Set remote access successfully!"),
                                  patienceMs);
        QVERIFY(toggle->isChecked() && toggle->isEnabled());
        QVERIFY(m_service.command("orb status").contains("\"enable\":true"));
    }

    void disconnectAfterAsking() {
        auto *status = Form::visible<StatusDialog>();
        for (const char *answer : {"cancelButton", "acceptButton"}) {
            Form::click(status, "disconnectButton");
            QTRY_VERIFY(Form::visible<ConfirmDialog>());
            QCOMPARE(
                Form::text(Form::visible<ConfirmDialog>(), "messageLabel"),
                QStringLiteral("Are you sure you want to disconnect from this service?\n\nDisconnecting will "
                               "stop the synchronization of all devices managed by this Device Manager. You "
                               "will need to set up the connection again to restore synchronization."));
            Form::click(Form::visible<ConfirmDialog>(), answer);
            QTRY_VERIFY(!Form::visible<ConfirmDialog>());
        }
        QTRY_VERIFY_WITH_TIMEOUT(Form::visible<AddDialog>(), patienceMs);
        QCOMPARE(message(m_frame.get()), QStringLiteral("Disconnected successfully!"));
        QVERIFY(m_service.command("orb status").contains("added=0"));
    }

    /// Each begins with its name.
    static void rows(const QList<QStringList> &all) {
        QTest::addColumn<QStringList>("texts");
        for (const QStringList &row : all)
            QTest::newRow(qPrintable(row.first())) << row.mid(1);
    }

    /// A command to the emulator; an empty one is none.
    void tell(const QString &command) {
        if (!command.isEmpty())
            QCOMPARE(m_service.command(command), QStringLiteral("ok"));
    }

    void logIn(const char *account) {
        CApiClient client("127.0.0.1", m_service.port());
        QCOMPARE(client.loginServer(account, qPrintable(password)), unsigned(ApiOk));
        CLocalStore &store = CLocalStore::instance();
        store.setLoginInfo("127.0.0.1", m_service.port(), account, store.access(), true);
    }

    /// Links the service as its dialog would.
    void link() {
        ServiceSession session(CLocalStore::instance().loginInfo());
        const auto call = [&](auto endpoint) { QCOMPARE(session.call(endpoint), unsigned(ApiOk)); };
        call([](CApiClient &c) {
            return c.authenticateWithOrb(qPrintable(partner), qPrintable(partnerPassword));
        });
        call([](CApiClient &c) { return c.addService("ORG1", "ORG1-S1"); });
    }

    template <typename Dialog>
    Dialog *openDialog() {
        m_management->validateOrbServiceAdded();
        (void)QTest::qWaitFor([] { return Form::visible<Dialog>() != nullptr; }, patienceMs);
        auto *dialog = Form::visible<Dialog>();
        if (!dialog || !QTest::qWaitForWindowActive(dialog))
            qFatal("the dialog did not come");
        return dialog;
    }
    AddDialog *openAddDialog() { return openDialog<AddDialog>(); }
    StatusDialog *openStatusDialog() {
        if (m_service.command("orb status").contains("added=0"))
            link();
        return openDialog<StatusDialog>();
    }

    static void signIn(AddDialog *add, const QString &email, const QString &secret) {
        Form::part<QComboBox>(add, "serviceComboBox")->setCurrentIndex(0);
        Form::type(add, "emailInput", email);
        Form::type(add, "passwordInput", secret);
        Form::click(add, "nextButton");
    }

    static bool atLocation(const AddDialog *add) { return Form::part(add, "locationPage")->isVisible(); }
    static QString errorOf(const AddDialog *add) { return shown(add, "errMsg"); }
    static QString message(const QWidget *window) {
        for (const auto *message : window->findChildren<TransientMessage *>()) {
            if (message->isVisible())
                return message->text();
        }
        return {};
    }

    IsolatedRoot m_root;
    EmulatorProcess m_service{m_root.path()};
    std::unique_ptr<QWidget> m_frame;
    ServiceManagement *m_management = nullptr;
};

NVLDM_TEST(TestServiceManagement)
#include "tst_servicemanagement.moc"
