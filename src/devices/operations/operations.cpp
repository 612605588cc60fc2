#include "devices/operations/operations.h"

#include <algorithm>

namespace Operations {

namespace {

using Group = Operation::Group;
using Needs = Operation::Needs;

constexpr const Operation *rows[] = {
    &addDevice,
    &authorize,
    &setPassword,
    &assignIp,
    &upload,
    &uploadFirmware,
    &uploadPackage,
    &uploadConfiguration,
    &uploadCertificate,
    &uploadHttps,
    &uploadIeee,
    &quickSetup,
    &setConfiguration,
    &createTemplate,
    &importTemplate,
    &backupConfiguration,
    &restart,
    &restore,
    &restorePoint,
    &factoryDefault,
    &replace,
    &exportMenu,
    &exportDeviceList,
    &exportDebugInfo,
    &refresh,
    &deleteDevices,
    &certificateList,
};

} // namespace

// The menus.

const Operation upload{.objectName = "uploadButton",
                       .text = QT_TRANSLATE_NOOP("Operation", "Upload"),
                       .icon = "tool_upload_line",
                       .group = Group::ConfigurationButtons,
                       .needs = Needs::Session,
                       .menu = Group::UploadMenu,
                       .helpPage = "uploads.html"};
const Operation uploadCertificate{.objectName = "uploadCertificateMenu",
                                  .text = QT_TRANSLATE_NOOP("Operation", "Upload Certificate"),
                                  .group = Group::UploadMenu,
                                  .needs = Needs::Nothing,
                                  .menu = Group::CertificateMenu};
const Operation setConfiguration{.objectName = "setConfigurationButton",
                                 .text = QT_TRANSLATE_NOOP("Operation", "Set Configuration"),
                                 .icon = "tool_set_configuration_line",
                                 .group = Group::ConfigurationButtons,
                                 .needs = Needs::LaterVersion,
                                 .menu = Group::ConfigurationMenu};
const Operation restore{.objectName = "restoreButton",
                        .text = QT_TRANSLATE_NOOP("Operation", "Restore Device"),
                        .icon = "tool_restore_line",
                        .group = Group::MaintenanceButtons,
                        .needs = Needs::Selection,
                        .menu = Group::RestoreMenu,
                        .helpPage = "restarting.html"};
const Operation exportMenu{.objectName = "exportButton",
                           .text = QT_TRANSLATE_NOOP("Operation", "Export"),
                           .icon = "tool_export_line",
                           .group = Group::ListButtons,
                           .needs = Needs::Session,
                           .menu = Group::ExportMenu,
                           .helpPage = "exporting.html"};

// What comes with a later version; each row moves to the file of its operation then.

const Operation createTemplate{.objectName = "createTemplateAction",
                               .text = QT_TRANSLATE_NOOP("Operation", "Create Template"),
                               .group = Group::ConfigurationMenu,
                               .needs = Needs::LaterVersion};
const Operation importTemplate{.objectName = "importTemplateAction",
                               .text = QT_TRANSLATE_NOOP("Operation", "Import Template"),
                               .group = Group::ConfigurationMenu,
                               .needs = Needs::LaterVersion};
const Operation backupConfiguration{.objectName = "backupConfigurationButton",
                                    .text = QT_TRANSLATE_NOOP("Operation", "Backup Configuration"),
                                    .icon = "tool_backup_configuration_line",
                                    .group = Group::ConfigurationButtons,
                                    .needs = Needs::LaterVersion};
const Operation restorePoint{.objectName = "restorePointAction",
                             .text = QT_TRANSLATE_NOOP("Operation", "Restore to Restore Point"),
                             .group = Group::RestoreMenu,
                             .needs = Needs::LaterVersion};
const Operation replace{.objectName = "replaceButton",
                        .text = QT_TRANSLATE_NOOP("Operation", "Replace Device"),
                        .icon = "tool_replace_line",
                        .group = Group::MaintenanceButtons,
                        .needs = Needs::LaterVersion};

// What the console itself does.

const Operation refresh{.objectName = "refreshButton",
                        .text = QT_TRANSLATE_NOOP("Operation", "Refresh"),
                        .icon = "tool_refresh_line",
                        .group = Group::ListButtons,
                        .needs = Needs::Session,
                        .open = [](OperationContext &context, OperationRequest) -> QDialog * {
                            context.refreshStates();
                            return nullptr;
                        }};
const Operation deleteDevices{.objectName = "deleteButton",
                              .text = QT_TRANSLATE_NOOP("Operation", "Delete Device"),
                              .icon = "tool_delete_line",
                              .group = Group::ListButtons,
                              .needs = Needs::Selection,
                              .open = [](OperationContext &context, OperationRequest) -> QDialog * {
                                  context.askToRemove();
                                  return nullptr;
                              }};

std::span<const Operation *const> all() {
    return rows;
}

const Operation *findByTask(const QString &taskType) {
    for (const Operation *operation : rows) {
        const auto &types = operation->taskTypes;
        if (std::any_of(types.begin(), types.end(),
                        [&](const char *type) { return type && taskType == QLatin1String(type); }))
            return operation;
    }
    return nullptr;
}

} // namespace Operations
