#include "tasks/service/tasktype.h"

#include <QCoreApplication>

namespace TaskType {

namespace {

struct Title {
    const char *type;
    const char *text;
};

constexpr Title titles[] = {
    {"deviceFWUpgrade", QT_TRANSLATE_NOOP("TaskType", "Upload Firmware")},
    {"deviceConfigFileUpload", QT_TRANSLATE_NOOP("TaskType", "Upload Configuration File")},
    {"devicePackageUpload", QT_TRANSLATE_NOOP("TaskType", "Upload Package")},
    {"deviceGenSelfSignedCert", QT_TRANSLATE_NOOP("TaskType", "Generate HTTPS Certificate")},
    {"deviceHttpsCertInstall", QT_TRANSLATE_NOOP("TaskType", "Install HTTPS Certificate")},
    {"deviceHttpsCertsAndPKeys", QT_TRANSLATE_NOOP("TaskType", "Upload HTTPS Certificate and Key")},
    {"deviceIEEE_EAP_PEAP", QT_TRANSLATE_NOOP("TaskType", "Upload IEEE 802.1x Certificate (EAP-PEAP)")},
    {"deviceIEEE_EAP_TLS", QT_TRANSLATE_NOOP("TaskType", "Upload IEEE 802.1x Certificate (EAP-TLS)")},
    {"deviceAssignIPAuto", QT_TRANSLATE_NOOP("TaskType", "Assign IP Address (Auto)")},
    {"deviceAssignIPManual", QT_TRANSLATE_NOOP("TaskType", "Assign IP Address (Manual)")},
    {"deviceExportDeviceInfo", QT_TRANSLATE_NOOP("TaskType", "Export Debug Info")},
    {"deviceQuickSetup", QT_TRANSLATE_NOOP("TaskType", "Quick Setup")},
    {"deviceRestart", QT_TRANSLATE_NOOP("TaskType", "Restart Device")},
    {"deviceRestore", QT_TRANSLATE_NOOP("TaskType", "Restore Device")},
    {"deviceChangePass", QT_TRANSLATE_NOOP("TaskType", "Set Password")},
    {"devicePassPolicy", QT_TRANSLATE_NOOP("TaskType", "Set Password Policy")},
    {"deviceCreateTemplate", QT_TRANSLATE_NOOP("TaskType", "Create Template")},
    {"deviceSetTemplate", QT_TRANSLATE_NOOP("TaskType", "Set Configuration")},
    {"deviceCustomCommand", QT_TRANSLATE_NOOP("TaskType", "Custom Command")},
};

} // namespace

QString title(const QString &type) {
    for (const Title &each : titles) {
        if (type == QLatin1String(each.type))
            return QCoreApplication::translate("TaskType", each.text);
    }
    return type.isEmpty() ? QCoreApplication::translate("TaskType", "Task") : type;
}

} // namespace TaskType
