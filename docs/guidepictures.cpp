// Walks the client through what the user guide tells of, on a service with a sample fleet, and leaves the
// pictures that its pages show.
//   guide-pictures FOLDER

#include "app/frame/mainwindow.h"
#include "app/frame/sidepanel.h"
#include "app/frame/titlebar.h"
#include "app/program.h"
#include "devices/operations/files/filefield.h"
#include "devices/page/devicewindow.h"
#include "devices/page/mainconsoletable.h"

#include <QAbstractButton>
#include <QAction>
#include <QApplication>
#include <QComboBox>
#include <QDir>
#include <QLineEdit>
#include <QMenu>
#include <QPlainTextEdit>
#include <QTableWidget>
#include <QTest>
#include <QTimer>
#include <QTreeWidget>

#include <cstdio>
#include <cstdlib>

namespace {

constexpr int patienceMs = 30000;
constexpr int settleMs = 900;
constexpr int chosenDevices = 6;
const QString email = QStringLiteral("admin@site.example");
const QString password = QStringLiteral("Passw0rd!");

[[noreturn]] void giveUp(const QString &reason) {
    std::fprintf(stderr, "%s\n", qPrintable(reason));
    std::_Exit(EXIT_FAILURE);
}

class Photographer {
public:
    Photographer(QWidget &frame, const QString &folder) : m_frame(frame), m_folder(folder) {}

    void run() {
        signIn();
        showDevices();
        showOperations();
        showUploads();
        showPanels();
        showPages();
        showAccountMenu();
    }

private:
    template <typename Part = QWidget>
    Part *part(const QString &name, const QWidget *of = nullptr) const {
        auto *found = (of ? of : &m_frame)->findChild<Part *>(name);
        if (!found)
            giveUp("There is no part " + name);
        return found;
    }

    /// The dialog with the object name, once it is shown.
    QWidget *dialog(const QString &name) const {
        QWidget *found = nullptr;
        const bool shown = QTest::qWaitFor(
            [&] {
                for (QWidget *window : QApplication::topLevelWidgets())
                    if (window->objectName() == name && window->isVisible())
                        found = window;
                return found != nullptr;
            },
            patienceMs);
        if (!shown)
            giveUp("There is no dialog " + name);
        return found;
    }

    void save(QWidget *widget, const QString &name) const {
        QTest::qWait(settleMs);
        if (!widget->grab().save(m_folder + '/' + name + ".png"))
            giveUp("The picture cannot be written: " + name);
    }
    void saveFrame(const QString &name) const { save(part("windowFrame"), name); }

    /// A picture of a dialog, which is closed then.
    void saveDialog(const QString &dialogName, const QString &name, int waitMs = 0) const {
        QWidget *window = dialog(dialogName);
        QTest::qWait(waitMs);
        save(part("dialogFrame", window), name);
        window->close();
        QTest::qWait(settleMs);
    }

    void press(const QString &button, const QWidget *of = nullptr) const {
        part<QAbstractButton>(button, of)->click();
    }
    void choose(const QString &action) const { part<QAction>(action)->trigger(); }
    void type(const QWidget *form, const QString &field, const QString &text) const {
        part<QLineEdit>(field, form)->setText(text);
    }

    void signIn() {
        QWidget *setup = dialog("AccountSetupDialog");
        type(setup, "emailEdit", email);
        type(setup, "passEdit", password);
        type(setup, "confirmEdit", password);
        save(part("dialogFrame", setup), "account-setup");
        press("nextButton", setup);

        QWidget *login = dialog("LoginDialog");
        addServers(login);
        type(login, "localPassEdit", password);
        save(part("dialogFrame", login), "login");
        press("loginButton", login);
        m_console = m_frame.findChild<DeviceWindow *>();
        if (!QTest::qWaitFor([this] { return m_console->isVisible() && m_console->devices(); }, patienceMs))
            giveUp("No devices are shown");
        // The first check of the connection brings the states of all of them.
        QTest::qWait(12000);
    }

    void addServers(QWidget *login) {
        press("manageServersButton", login);
        QWidget *servers = dialog("RemoteConnectionDialog");
        press("addButton", servers);
        QWidget *entry = dialog("AddServerDialog");
        type(entry, "nameEdit", "Harbour");
        type(entry, "infoEdit", "10.8.0.5:443");
        type(entry, "emailEdit", email);
        save(part("dialogFrame", entry), "add-server");
        press("applyButton", entry);
        save(part("dialogFrame", servers), "servers");
        press("saveButton", servers);
        QTest::qWait(settleMs);
    }

    MainConsoleTable *table() const {
        for (auto *each : m_frame.findChildren<MainConsoleTable *>())
            if (each->isVisible())
                return each;
        giveUp("No device table is shown");
    }

    void chooseDevices(int count = chosenDevices) const {
        MainConsoleTable *devices = table();
        QItemSelection rows;
        for (int row = 0; row < count; ++row)
            rows.select(devices->model()->index(row, 0), devices->model()->index(row, 0));
        devices->selectionModel()->select(rows,
                                          QItemSelectionModel::ClearAndSelect | QItemSelectionModel::Rows);
        QTest::qWait(settleMs);
    }

    void search(const QString &text) const {
        part<QLineEdit>("deviceSearchEdit")->setText(text);
        QTest::qWait(settleMs);
    }

    void showDevices() {
        chooseDevices(3);
        saveFrame("device-page");
        search("10.20.0.0/24 NC-9381");
        saveFrame("searching");
        search({});
        auto *sites = part<QTreeWidget>("siteTree");
        for (int presses = 0; presses < 3; ++presses)
            QTest::keyClick(sites, Qt::Key_Down);
        saveFrame("sites");
        for (int presses = 0; presses < 4; ++presses)
            QTest::keyClick(sites, Qt::Key_Up);
    }

    void showOperations() {
        press("addDeviceButton");
        saveDialog("AddDeviceDialog", "adding-devices", 6000);
        chooseDevices();
        for (const auto &[button, name, picture] :
             {std::tuple("authorizeButton", "AuthorizeDeviceDialog", "authorizing"),
              std::tuple("setPasswordButton", "SetPasswordDialog", "set-password"),
              std::tuple("ipButton", "AssignIpDialogII", "addresses")}) {
            press(button);
            saveDialog(name, picture);
        }
        press("restartButton");
        saveDialog("ConfirmDialog", "restarting");
        choose("factoryDefaultAction");
        saveDialog("RestoreDeviceDialog", "restoring");
    }

    /// Shows what a dialog has to say beyond its first sight, and nothing of this user.
    void fill(const QWidget *form) const {
        QTest::qWait(settleMs);
        if (auto *waves = form->findChild<QAbstractButton *>("inWavesCheckBox"))
            waves->setChecked(true);
        if (form->objectName() == "ExportDebugInfoDialog")
            part<FileField>("folderField", form)->setPath(QDir::tempPath());
    }

    void showUploads() {
        for (const auto &[action, name, picture] :
             {std::tuple("uploadFirmwareAction", "UploadFirmwareDialog", "firmware"),
              std::tuple("uploadPackageAction", "UploadPackageDialog", "upload-package"),
              std::tuple("uploadConfigurationAction", "UploadConfigurationDialog", "upload-configuration"),
              std::tuple("uploadHttpsAction", "UploadHttpsDialog", "certificate-https"),
              std::tuple("certificateListAction", "CertificatesDialog", "certificates"),
              std::tuple("exportDebugInfoAction", "ExportDebugInfoDialog", "export-debug-info")}) {
            choose(action);
            fill(dialog(name));
            saveDialog(name, picture);
        }
        press("quickSettingButton");
        saveDialog("QuickSetupDialog", "quick-setup");
    }

    void showPanels() {
        press("taskButton");
        QTest::qWait(4000);
        saveFrame("tasks");
        press("alarmButton");
        QTest::qWait(4000);
        saveFrame("alarms");
        press("alarmButton");
    }

    void showPages() {
        press("logButton");
        QTest::qWait(3000);
        saveFrame("logs");
        press("settingsButton");
        QTest::qWait(2000);
        saveFrame("settings");
        press("deviceButton");
    }

    void showAccountMenu() {
        auto *bar = m_frame.findChild<TitleBar *>();
        bar->accountManagementAction()->trigger();
        saveDialog("AccountManagementDialog", "accounts", 1500);
        bar->serviceManagementAction()->trigger();
        saveDialog("ServiceManagementAddServiceDialog", "remote-access", 1500);
    }

    QWidget &m_frame;
    QString m_folder;
    DeviceWindow *m_console = nullptr;
};

} // namespace

int main(int argc, char *argv[]) {
    if (argc != 2)
        giveUp("guide-pictures FOLDER");
    const QString folder = QDir(QString::fromLocal8Bit(argv[1])).absolutePath();
    return Program::run(argc, argv, [folder](QWidget &frame) {
        QTimer::singleShot(0, &frame, [&frame, folder] {
            Photographer(frame, folder).run();
            // The event loop that is to end may not have begun: the splash screen waits for the frame.
            auto *end = new QTimer(&frame);
            QObject::connect(end, &QTimer::timeout, &frame, [] { QCoreApplication::quit(); });
            end->start(settleMs);
        });
    });
}
