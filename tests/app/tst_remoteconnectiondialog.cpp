#include "app/login/remoteconnectiondialog.h"
#include "app/login/serverdialog.h"
#include "form.h"
#include "platform/files/nvldmstore.h"
#include "store/clientstore.h"
#include "store/serverkeys.h"
#include "support/isolatedroot.h"
#include "support/logcapture.h"
#include "support/testmain.h"
#include "widgets/lists/customtable.h"

#include <QCheckBox>
#include <QRegularExpression>
#include <QSignalSpy>

#include <nlohmann/json.hpp>

namespace {
constexpr const char *columns =
    "id TEXT PRIMARY KEY, svrname TEXT, info TEXT, acc TEXT, pass TEXT, remember TEXT";
} // namespace

class TestRemoteConnectionDialog : public QObject {
    Q_OBJECT

private slots:
    void init() {
        JSON servers = JSON::array();
        for (const char *name : {"Zulu", "Alpha", "<b>Mike</b>"})
            servers.push_back({{"id", std::string("SVR") + name},
                               {"svrname", name},
                               {"info", "10.0.0." + std::to_string(servers.size() + 1)},
                               {"acc", "me@norvell.example"},
                               {"pass", "MyPass12!"},
                               {"remember", "YES"}});
        QVERIFY(CClientStore::instance().saveServerList(servers));
        m_dialog = std::make_unique<RemoteConnectionDialog>();
        m_updated = std::make_unique<QSignalSpy>(m_dialog.get(), &RemoteConnectionDialog::updateSvr);
        m_table = Form::part<CustomTable>(m_dialog.get(), "tableWidget");
        m_dialog->show();
        QVERIFY(QTest::qWaitForWindowActive(m_dialog.get()));
    }

    void cleanup() {
        m_updated.reset();
        m_dialog.reset();
    }

    void addedServerIsSaved() {
        Form::type(m_dialog.get(), "remoteSearchEdit", "alpha");
        Form::click(m_dialog.get(), "addButton");
        QTRY_VERIFY(Form::visible<AddServerDialog>());
        const auto *add = Form::visible<AddServerDialog>();
        Form::type(add, "nameEdit", " Tango ");
        Form::type(add, "infoEdit", "tango.example:8443");
        Form::type(add, "emailEdit", "tango@norvell.example");
        QCOMPARE(Form::text(add, "msgWarningLabel"), QString());
        Form::type(add, "passEdit", "TangoPass1!");
        QCOMPARE(Form::text(add, "msgWarningLabel"),
                 QStringLiteral("The password is kept only with “Remember Me”."));
        Form::click(add, "applyButton");
        QTRY_VERIFY(!Form::visible<AddServerDialog>());
        QCOMPARE(visibleNames().last(), QStringLiteral("Tango"));
        QCOMPARE(saved("svrname"), QStringLiteral("Zulu|Alpha|<b>Mike</b>"));
        Form::click(m_dialog.get(), "saveButton");
        QTRY_COMPARE(m_updated->size(), 1);
        QVERIFY(!m_dialog->isVisible());
        QCOMPARE(saved("svrname"), QStringLiteral("Zulu|Alpha|<b>Mike</b>|Tango"));
        QCOMPARE(saved("info").section(u'|', 3), QStringLiteral("tango.example:8443"));
        QCOMPARE(saved("remember"), QStringLiteral("YES|YES|YES|NO"));
        // A password that nobody wants remembered is not kept.
        QCOMPARE(saved("pass"), QStringLiteral("MyPass12!|MyPass12!|MyPass12!|"));
        const QString id = saved("id").section(u'|', 3);
        QVERIFY2(QRegularExpression("^SVR\\d{13}$").match(id).hasMatch(), qPrintable(id));
    }

    void serverMustBeNamed() {
        Form::click(m_dialog.get(), "addButton");
        QTRY_VERIFY(Form::visible<AddServerDialog>());
        const auto *add = Form::visible<AddServerDialog>();
        const QString empty = QStringLiteral("The field can't be empty.");
        const QString wrong = QStringLiteral("Enter an address or a name");
        for (const QStringList &row :
             {QStringList{"", "10.0.0.1", empty}, QStringList{"  ", "10.0.0.1", empty},
              QStringList{"Tango", "", empty}, QStringList{"Tango", "10.0.0.1:x", wrong}}) {
            Form::type(add, "nameEdit", row[0]);
            Form::type(add, "infoEdit", row[1]);
            Form::click(add, "applyButton");
            QVERIFY(Form::visible<AddServerDialog>());
            QVERIFY(Form::text(add, "msgWarningLabel").startsWith(row[2]));
        }
        Form::click(add, "cancelButton");
        QCOMPARE(m_table->rowCount(), 3);
    }

    void editedServerKeepsItsPlace() {
        choose(1);
        Form::click(m_dialog.get(), "editButton");
        QTRY_VERIFY(Form::visible<EditServerDialog>());
        const auto *edit = Form::visible<EditServerDialog>();
        QCOMPARE(Form::text(edit, "nameEdit"), QStringLiteral("Alpha"));
        QCOMPARE(Form::text(edit, "infoEdit"), QStringLiteral("10.0.0.2"));
        QCOMPARE(Form::text(edit, "emailEdit"), QStringLiteral("me@norvell.example"));
        QCOMPARE(Form::text(edit, "passEdit"), QStringLiteral("MyPass12!"));
        QVERIFY(Form::part<QCheckBox>(edit, "rememberCheckBox")->isChecked());
        Form::type(edit, "nameEdit", "Bravo");
        QTest::keyClick(Form::part(edit, "nameEdit"), Qt::Key_Return);
        QTRY_VERIFY(!Form::visible<EditServerDialog>());
        QCOMPARE(visibleNames(), (QStringList{"Zulu", "Bravo", "<b>Mike</b>"}));
        Form::click(m_dialog.get(), "saveButton");
        QTRY_VERIFY(!m_dialog->isVisible());
        QCOMPARE(saved("svrname"), QStringLiteral("Zulu|Bravo|<b>Mike</b>"));
        QCOMPARE(saved("id"), QStringLiteral("SVRZulu|SVRAlpha|SVR<b>Mike</b>"));
        QCOMPARE(saved("pass"), QStringLiteral("MyPass12!|MyPass12!|MyPass12!"));
    }

    void deletedServerIsGone() {
        QVERIFY(!Form::part(m_dialog.get(), "deleteButton")->isEnabled());
        choose(0);
        Form::click(m_dialog.get(), "deleteButton");
        QCOMPARE(visibleNames(), (QStringList{"Alpha", "<b>Mike</b>"}));
        // Nothing is selected now, so a second click has nothing to delete.
        QVERIFY(!Form::part(m_dialog.get(), "deleteButton")->isEnabled());
        Form::click(m_dialog.get(), "cancelButton");
        QVERIFY(!m_dialog->isVisible());
        QCOMPARE(saved("svrname"), QStringLiteral("Zulu|Alpha|<b>Mike</b>"));
        init();
        choose(0);
        Form::click(m_dialog.get(), "deleteButton");
        Form::click(m_dialog.get(), "saveButton");
        QTRY_VERIFY(!m_dialog->isVisible());
        QCOMPARE(saved("svrname"), QStringLiteral("Alpha|<b>Mike</b>"));
    }

    void keyIsShownAndForgotten() {
        ServerKeys &keys = ServerKeys::instance();
        const std::string key(64, 'a');
        keys.trust("10.0.0.1:8079", key);
        keys.trust("10.0.0.2:8079", std::string(64, 'b'));
        init();
        QCOMPARE(m_table->item(0, 2)->text(), ServerKeys::readable(key));
        QCOMPARE(m_table->item(2, 2)->text(), QString());
        choose(0);
        QCOMPARE(Form::text(m_dialog.get(), "keyLabel"), ServerKeys::readable(key));
        QVERIFY(Form::text(m_dialog.get(), "keyTimeLabel").startsWith("First seen"));
        for (const char *button : {"cancelButton", "saveButton"}) {
            init();
            choose(0);
            Form::click(m_dialog.get(), "deleteButton");
            Form::click(m_dialog.get(), button);
            QTRY_VERIFY(!m_dialog->isVisible());
            QCOMPARE(keys.find("10.0.0.1:8079").has_value(), button == QByteArray("cancelButton"));
        }
        QVERIFY(keys.find("10.0.0.2:8079"));
    }

    /// What is stored is not replaced by a list that never showed it.
    void unreadableListIsLeftAlone() {
        const QByteArray file = m_root.filePath("ndclisvrs.sdb").toUtf8();
        const LogCapture log;
        QCOMPARE(nvldmstore::createDBTable(file.constData(), "kept", columns), 0);
        QCOMPARE(nvldmstore::replaceTable(file.constData(), "svrsMainT", "kept"), 0);
        m_dialog = std::make_unique<RemoteConnectionDialog>();
        QCOMPARE(Form::text(m_dialog.get(), "msgWarningLabel"),
                 QStringLiteral("The saved servers could not be read."));
        QVERIFY(!Form::part(m_dialog.get(), "addButton")->isEnabled());
        QVERIFY(!Form::part(m_dialog.get(), "saveButton")->isEnabled());
    }

    void searchHidesTheOthers() {
        QCOMPARE(m_table->item(2, 0)->toolTip(), QStringLiteral("<span>&lt;b&gt;Mike&lt;/b&gt;</span>"));
        choose(0);
        Form::type(m_dialog.get(), "remoteSearchEdit", "0.0.3");
        QCOMPARE(visibleNames(), QStringList{"<b>Mike</b>"});
        Form::type(m_dialog.get(), "remoteSearchEdit", "aLP");
        QCOMPARE(visibleNames(), QStringList{"Alpha"});
        // What is hidden is out of reach.
        QVERIFY(!Form::part(m_dialog.get(), "editButton")->isEnabled());
        QVERIFY(!Form::part(m_dialog.get(), "deleteButton")->isEnabled());
        choose(1);
        Form::click(m_dialog.get(), "deleteButton");
        QCOMPARE(visibleNames(), QStringList());
        Form::type(m_dialog.get(), "remoteSearchEdit", "");
        QCOMPARE(visibleNames(), (QStringList{"Zulu", "<b>Mike</b>"}));
    }

private:
    void choose(int row) {
        QTest::mouseClick(m_table->viewport(), Qt::LeftButton, {},
                          m_table->visualItemRect(m_table->item(row, 0)).center());
    }

    QStringList visibleNames() const {
        QStringList names;
        for (int row = 0; row < m_table->rowCount(); ++row) {
            if (!m_table->isRowHidden(row))
                names.append(m_table->item(row, 0)->text());
        }
        return names;
    }

    /// A member of all stored servers, in their order.
    static QString saved(const char *member) {
        JSON servers;
        CClientStore::instance().loadServerList(servers);
        QStringList values;
        for (const JSON &server : servers)
            values.append(QString::fromStdString(server.value(member, std::string("missing"))));
        return values.join(u'|');
    }

    IsolatedRoot m_root;
    std::unique_ptr<RemoteConnectionDialog> m_dialog;
    std::unique_ptr<QSignalSpy> m_updated;
    CustomTable *m_table = nullptr;
};

NVLDM_TEST(TestRemoteConnectionDialog)
#include "tst_remoteconnectiondialog.moc"
