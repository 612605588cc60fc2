#include "app/help/userguide.h"

#include <QCoreApplication>
#include <QDesktopServices>
#include <QFileInfo>
#include <QHash>
#include <QUrl>
#include <QVariant>
#include <QWidget>

namespace UserGuide {

namespace {

const QString firstPage = QStringLiteral("index.html");

/// Pages by the object names of what they tell of.
const QHash<QString, QString> &pages() {
    static const QHash<QString, QString> names{
        {"AccountManagementDialog", "accounts.html"},
        {"AccountSetupDialog", "first-start.html"},
        {"AddDeviceManualDialog", "adding-devices.html"},
        {"AddServerDialog", "servers.html"},
        {"CrashDialog", "troubleshooting.html"},
        {"DeviceWindow", "device-page.html"},
        {"EditServerDialog", "servers.html"},
        {"InvalidDeviceDialog", "adding-devices.html"},
        {"LogWindow", "logs.html"},
        {"LoginDialog", "first-start.html"},
        {"ReconnectingDialog", "troubleshooting.html"},
        {"RemoteConnectionDialog", "servers.html"},
        {"ServiceManagementAddServiceDialog", "remote-access.html"},
        {"ServiceManagementStatusDialog", "remote-access.html"},
        {"SettingWindow", "settings.html"},
        {"SettingsChangedDialog", "settings.html"},
        {"alarmPanel", "alarms.html"},
        {"deviceSearchEdit", "searching.html"},
        {"rolloutStrip", "firmware.html"},
        {"siteTree", "sites.html"},
        {"taskPanel", "tasks.html"},
    };
    return names;
}

/// Beside the program where everything stands in one folder, else where the system keeps shared data; builds
/// are laid out like the latter.
QString folder() {
    const QString program = QCoreApplication::applicationDirPath();
    for (const char *place : {"/guide", "/../share/norvell-device-manager/guide"}) {
        if (const QString path = program + QLatin1String(place); QFileInfo(path + '/' + firstPage).isFile())
            return QFileInfo(path).canonicalFilePath();
    }
    return {};
}

} // namespace

QString pageFor(const QWidget *widget) {
    for (; widget; widget = widget->parentWidget()) {
        // The dialogs of operations carry theirs.
        if (const QString page = widget->property("helpPage").toString(); !page.isEmpty())
            return page;
        if (const QString page = pages().value(widget->objectName()); !page.isEmpty())
            return page;
    }
    return {};
}

bool open(const QString &page) {
    const QString path = folder();
    return !path.isEmpty() &&
           QDesktopServices::openUrl(QUrl::fromLocalFile(path + '/' + (page.isEmpty() ? firstPage : page)));
}

} // namespace UserGuide
