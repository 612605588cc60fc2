#include "api/session/nettask.h"
#include "fakeservice.h"
#include "pages/settings/settingschangeddialog.h"
#include "pages/settings/settingwindow.h"
#include "platform/toast/toast.h"
#include "store/storewriter.h"
#include "support/isolatedroot.h"
#include "support/logcapture.h"
#include "support/testmain.h"
#include "tasks/notify/notifier.h"
#include "widgets/controls/waitingspinner.h"

#include <QApplication>
#include <QCheckBox>
#include <QComboBox>
#include <QLabel>
#include <QLineEdit>
#include <QPushButton>
#include <QSignalSpy>
#include <QSpinBox>
#include <QTest>

using nlohmann::json;

namespace {

json someSettings() {
    return {{"nf_alarms", true},
            {"nf_tasks", true},
            {"ui_lang", "en"},
            {"sys_lang", "en"},
            {"log_keepdays", 30},
            {"rp_download_path", "/srv/reports"},
            {"rp_auto", false},
            {"rp_keepnum", 3},
            {"svr_fw_upload_limit_enabled", true},
            {"svr_fw_upload_limit", 5},
            {"color", "of another client"}};
}

/// A desktop that counts what it is shown.
class CountedToasts : public ToastPresenter {
public:
    bool initialize(const QString &, const QString &) override { return true; }
    void showToast(const Toast &, std::unique_ptr<ToastHandler>) override { ++shown; }
    int shown = 0;
};

} // namespace

/// The settings page as a user meets it, on the settings of a service that is not there otherwise.
class TestSettingWindow : public QObject {
    Q_OBJECT

private slots:
    void init() {
        m_log = std::make_unique<LogCapture>();
        m_service = std::make_unique<FakeService>();
        m_service->setSettings(someSettings());
    }
    void cleanup() {
        m_window.reset();
        QVERIFY(NetTask::waitForAll(10000));
        m_service.reset();
        m_log.reset();
    }

    void limitsApplyWhileTyping_data() {
        QTest::addColumn<QString>("name");
        QTest::addColumn<QString>("typed");
        QTest::addColumn<int>("left");
        QTest::newRow("days") << "logSpinBox"
                              << "2000" << 1095;
        QTest::newRow("days at the limit") << "logSpinBox"
                                           << "1095" << 1095;
        QTest::newRow("uploads") << "uploadLimitSpinBox"
                                 << "80" << 50;
        QTest::newRow("restore points") << "restorePointSpinBox"
                                        << "9999" << 9999;
    }
    void limitsApplyWhileTyping() {
        QFETCH(QString, name);
        QFETCH(QString, typed);
        open();
        auto *box = m_window->findChild<QSpinBox *>(name);
        box->setFocus();
        box->selectAll();
        QTest::keyClicks(box, typed);
        QTEST(box->value(), "left");
        QVERIFY(button("applyButton")->isEnabled());
    }

    void buttonsComeOnWithTheFirstEdit() {
        open();
        QVERIFY(!button("applyButton")->isEnabled() && !button("cancelButton")->isEnabled());
        auto *alarms = find<QCheckBox>("alarmCheckBox");
        QTest::mouseClick(alarms, Qt::LeftButton, {}, alarms->rect().center());
        QTest::keyClick(alarms, Qt::Key_Space);
        QVERIFY(alarms->isChecked());
        QVERIFY(button("applyButton")->isEnabled() && button("cancelButton")->isEnabled());
        QVERIFY(!m_window->hasUnsavedEdits());
        find<QComboBox>("languageComboBox")->setCurrentIndex(2);
        find<QCheckBox>("uploadLimitCheckBox")->setChecked(false);
        QVERIFY(!find<QSpinBox>("uploadLimitSpinBox")->isEnabled());
        QVERIFY(m_window->hasUnsavedEdits());
        button("cancelButton")->click();
        QCOMPARE(find<QComboBox>("languageComboBox")->currentData().toString(), QStringLiteral("en"));
        QVERIFY(find<QSpinBox>("uploadLimitSpinBox")->isEnabled());
        QVERIFY(!button("applyButton")->isEnabled() && !button("cancelButton")->isEnabled());
        QVERIFY(!m_window->hasUnsavedEdits());
    }

    void savesAndActsAtOnce() {
        open();
        auto toasts = std::make_unique<CountedToasts>();
        const CountedToasts &desktop = *toasts;
        Notifier::instance().setPresenter(std::move(toasts));
        find<QCheckBox>("alarmCheckBox")->setChecked(false);
        find<QComboBox>("languageComboBox")->setCurrentText(QStringLiteral("Deutsch"));
        find<QLineEdit>("filePathEdit")->setText(QStringLiteral("/srv/elsewhere"));
        find<QSpinBox>("logSpinBox")->setValue(60);
        QTest::mouseClick(button("applyButton"), Qt::LeftButton);
        QTRY_COMPARE(text("statusLabel"), QStringLiteral("Settings saved."));
        QVERIFY(!button("applyButton")->isEnabled() && !button("cancelButton")->isEnabled());
        QVERIFY(!m_window->hasUnsavedEdits());
        json expected = someSettings();
        expected.update({{"nf_alarms", false},
                         {"ui_lang", "de"},
                         {"rp_download_path", "/srv/elsewhere"},
                         {"log_keepdays", 60}});
        QCOMPARE(QString::fromStdString(m_service->settings().dump()),
                 QString::fromStdString(expected.dump()));
        Notifier::instance().ShowMessage("alarm", Notifier::Alarm);
        Notifier::instance().ShowMessage("task", Notifier::Task);
        QCOMPARE(desktop.shown, 1);
        StoreWriter::flush();
        QCOMPARE(CLocalStore::instance().uiLanguage(), QStringLiteral("de"));
        QCOMPARE(CLocalStore::instance().defaultFilePath(), QStringLiteral("/srv/elsewhere"));
    }

    void oddValuesAreToldAndShown_data() {
        QTest::addColumn<QByteArray>("settings");
        QTest::addColumn<int>("days");
        QTest::addColumn<QString>("told"); // a part of it; empty where there is nothing to tell
        const auto row = [](const char *name, const char *settings, int days, const char *told) {
            QTest::newRow(name) << QByteArray(settings) << days << QString::fromLatin1(told);
        };
        row("the alias", R"({"days":45})", 45, "");
        row("too many", R"({"log_keepdays":5000})", 1095, "the server has 5000, shown is 1095");
        row("too few", R"({"log_keepdays":-1e30})", 1, "shown is 1");
        row("a text", R"({"log_keepdays":"45"})", 45, "the server has \"45\", shown is 45");
        row("a fraction", R"({"log_keepdays":45.5})", 45, "shown is 45");
        row("no number", R"({"log_keepdays":[45]})", 30, "value [45] cannot be shown");
        row("null", R"({"log_keepdays":null,"nf_alarms":{},"rp_download_path":[]})", 30, "cannot be shown");
        row("nothing", "{}", 30, "offers no settings");
        row("no object", "[1]", 30, "offers no settings");
        row("one of them", R"({"svr_fw_upload_limit_enabled":true})", 30, "");
    }
    void oddValuesAreToldAndShown() {
        QFETCH(QByteArray, settings);
        QFETCH(QString, told);
        m_service->setSettings(json::parse(settings.toStdString()));
        open();
        QTEST(find<QSpinBox>("logSpinBox")->value(), "days");
        QVERIFY(find<QSpinBox>("logSpinBox")->isEnabled());
        QVERIFY2(text("noticeLabel").contains(told), qPrintable(text("noticeLabel")));
        QCOMPARE(find<QLabel>("noticeLabel")->isVisible(), !told.isEmpty());
        QVERIFY(!m_window->hasUnsavedEdits());
    }

    void settingThatTheServerLacksIsSentOnceChanged() {
        m_service->setSettings({{"log_keepdays", 30}});
        open();
        find<QSpinBox>("restorePointSpinBox")->setValue(7);
        QVERIFY(!button("applyButton")->isEnabled());
        find<QSpinBox>("logSpinBox")->setValue(31);
        button("cancelButton")->click();
        QCOMPARE(find<QSpinBox>("restorePointSpinBox")->value(), 10);
        find<QSpinBox>("restorePointSpinBox")->setValue(8);
        find<QSpinBox>("logSpinBox")->setValue(60);
        button("applyButton")->click();
        QTRY_COMPARE(text("statusLabel"), QStringLiteral("Settings saved."));
        const json expected = {
            {"log_keepdays", 60}, {"rp_keepnum", 8}, {"svr_fw_upload_limit_enabled", false}};
        QCOMPARE(QString::fromStdString(m_service->settings().dump()),
                 QString::fromStdString(expected.dump()));
    }

    void saveThatOutlivesItsSessionReadsForTheNext() {
        open();
        find<QSpinBox>("logSpinBox")->setValue(60);
        button("applyButton")->click();
        // The page is left and entered again while the answer is awaited.
        m_service->logIn();
        m_window->reset();
        m_window->loadConfig();
        QTRY_VERIFY(find<QWidget>("settingsForm")->isEnabled());
        QTRY_COMPARE(find<QSpinBox>("logSpinBox")->value(),
                     m_service->settings().at("log_keepdays").get<int>());
    }

    void discardedWhileSaving_data() {
        QTest::addColumn<int>("code");   // of the answer to the save
        QTest::addColumn<int>("theirs"); // what another client has set meanwhile
        QTest::addColumn<int>("days");   // in the end, here and on the service
        QTest::newRow("saved") << 0 << 30 << 60;
        QTest::newRow("refused") << 5 << 30 << 30;
        QTest::newRow("changed by others") << 0 << 90 << 90;
    }
    void discardedWhileSaving() {
        QFETCH(int, code);
        QFETCH(int, theirs);
        open();
        json changed = someSettings();
        changed["log_keepdays"] = theirs;
        m_service->setSettings(changed);
        m_service->refuse("/v1/config/set", code);
        find<QSpinBox>("logSpinBox")->setValue(60);
        button("applyButton")->click();
        find<QSpinBox>("restorePointSpinBox")->setValue(8);
        button("cancelButton")->click();
        QVERIFY(!m_window->hasUnsavedEdits());
        QTRY_VERIFY(!m_window->findChild<WaitingSpinner *>()->isVisible());
        QTEST(find<QSpinBox>("logSpinBox")->value(), "days");
        QTEST(m_service->settings().at("log_keepdays").get<int>(), "days");
        QCOMPARE(find<QSpinBox>("restorePointSpinBox")->value(), 3);
        QVERIFY(!m_window->hasUnsavedEdits() && !button("applyButton")->isEnabled());
        QVERIFY(!QApplication::activeModalWidget());
    }

    void twoAdministrators_data() {
        QTest::addColumn<QString>("answer");
        QTest::addColumn<int>("days"); // in the end, on the service
        QTest::addColumn<bool>("restorePoints");
        QTest::addColumn<bool>("unsaved");
        QTest::newRow("mine") << "keepPageButton" << 60 << true << false;
        QTest::newRow("theirs") << "keepServerButton" << 90 << true << false;
        QTest::newRow("neither") << "cancelButton" << 90 << false << true;
    }
    void twoAdministrators() {
        QFETCH(QString, answer);
        QFETCH(bool, restorePoints);
        open();
        find<QSpinBox>("logSpinBox")->setValue(60);
        find<QCheckBox>("restorePointCheckBox")->setChecked(true);
        json theirs = someSettings();
        theirs["log_keepdays"] = 90;
        m_service->setSettings(theirs);
        button("applyButton")->click();
        QTRY_VERIFY(qobject_cast<SettingsChangedDialog *>(QApplication::activeModalWidget()));
        QWidget *dialog = QApplication::activeModalWidget();
        QStringList told;
        for (const QLabel *cell : dialog->findChild<QWidget *>("changesList")->findChildren<QLabel *>())
            told += cell->text();
        QCOMPARE(told.mid(3), QStringList({"Number of days to keep logs", "60", "90"}));
        QCOMPARE(m_service->sentTo("/v1/config/set").size(), std::size_t{0});
        QTest::mouseClick(dialog->findChild<QPushButton *>(answer), Qt::LeftButton);
        QTRY_COMPARE(m_service->settings().at("rp_auto").get<bool>(), restorePoints);
        QTEST(m_service->settings().at("log_keepdays").get<int>(), "days");
        QTRY_VERIFY(!button("applyButton")->isEnabled() || answer == "cancelButton");
        QTEST(m_window->hasUnsavedEdits(), "unsaved");
    }

    void failuresAreToldAndKeepTheEdits() {
        m_service->refuse("/v1/config/get", 5);
        m_window = std::make_unique<SettingWindow>();
        load();
        QTRY_VERIFY(find<QPushButton>("retryButton")->isVisible());
        QCOMPARE(m_log->count("HTTP API(loadServerSettings) failed!"), 1);
        QVERIFY(!find<QSpinBox>("logSpinBox")->isEnabled());
        m_service->refuse("/v1/config/get", 0);
        button("retryButton")->click();
        QTRY_VERIFY(find<QSpinBox>("logSpinBox")->isEnabled());
        QVERIFY(!find<QLabel>("noticeLabel")->isVisible());
        find<QSpinBox>("logSpinBox")->setValue(60);
        m_service->refuse("/v1/config/get", 5);
        button("applyButton")->click();
        QTRY_COMPARE(m_log->count("HTTP API(saveServerSettings) failed!"), 1);
        QTRY_VERIFY(find<QLabel>("noticeLabel")->isVisible());
        m_service->refuse("/v1/config/get", 0);
        m_service->refuse("/v1/config/set", 5);
        button("applyButton")->click();
        QTRY_COMPARE(m_log->count("HTTP API(saveServerSettings) failed!"), 2);
        QTRY_VERIFY(find<QLabel>("noticeLabel")->isVisible());
        QVERIFY(m_window->hasUnsavedEdits());
        QCOMPARE(find<QSpinBox>("logSpinBox")->value(), 60);
        QVERIFY(button("applyButton")->isEnabled());
    }

    void unknownLanguageStaysAndTabsLeadDown() {
        json settings = someSettings();
        settings["ui_lang"] = "tlh";
        m_service->setSettings(settings);
        open();
        QStringList names;
        find<QSpinBox>("logSpinBox")->setValue(31);
        find<QWidget>("alarmCheckBox")->setFocus();
        for (int i = 0; i < 30 && !names.contains(m_window->focusWidget()->objectName()); ++i) {
            names += m_window->focusWidget()->objectName();
            QTest::keyClick(m_window->focusWidget(), Qt::Key_Tab);
        }
        QCOMPARE(names.join(' '),
                 QStringLiteral("alarmCheckBox taskCheckBox languageComboBox logSpinBox filePathEdit "
                                "browseButton restorePointCheckBox restorePointSpinBox uploadLimitCheckBox "
                                "uploadLimitSpinBox cancelButton applyButton"));
        QTest::keyClick(button("applyButton"), Qt::Key_Space);
        QTRY_COMPARE(text("statusLabel"), QStringLiteral("Settings saved."));
        QCOMPARE(m_service->settings().at("ui_lang").get<std::string>(), std::string("tlh"));
    }

private:
    void load() {
        m_window->resize(900, 640);
        m_window->show();
        m_window->activateWindow();
        QVERIFY(QTest::qWaitForWindowActive(m_window.get()));
        m_window->loadConfig();
    }
    void open() {
        m_window = std::make_unique<SettingWindow>();
        load();
        QTRY_VERIFY(find<QWidget>("settingsForm")->isEnabled());
        QTRY_VERIFY(text("statusLabel").isEmpty());
    }
    template <typename T>
    T *find(const char *name) const {
        return m_window->findChild<T *>(QLatin1String(name));
    }
    QPushButton *button(const char *name) const { return find<QPushButton>(name); }
    QString text(const char *name) const { return find<QLabel>(name)->text(); }

    IsolatedRoot m_root;
    std::unique_ptr<LogCapture> m_log;
    std::unique_ptr<FakeService> m_service;
    std::unique_ptr<SettingWindow> m_window;
};

NVLDM_TEST(TestSettingWindow)
#include "tst_settingwindow.moc"
