#include "devices/discovery/adddevicedialog.h"
#include "devices/inventory/inventoryupdater.h"
#include "devices/operations/operations.h"

namespace {

/// The devices that the service has; null while these are not known.
DeviceSnapshotPtr managedDevices(OperationContext &context) {
    const bool isRead = context.inventoryUpdater()->knowledge() == InventoryUpdater::LoadState::Read;
    return isRead ? context.devices() : nullptr;
}

QDialog *openAddDevice(OperationContext &context, OperationRequest) {
    auto *dialog = new AddDeviceDialog(managedDevices(context), context.dialogParent());
    // The console is connected first, so its snapshot is the new one by now.
    QObject::connect(context.inventoryUpdater(), &InventoryUpdater::read, dialog,
                     [dialog, &context] { dialog->setManaged(managedDevices(context)); });
    QObject::connect(dialog, &AddDeviceDialog::devicesAdded, context.dialogParent(),
                     [&context] { context.reload(); });
    return dialog;
}

} // namespace

const Operation Operations::addDevice{.objectName = "addDeviceButton",
                                      .text = QT_TRANSLATE_NOOP("Operation", "Add Device"),
                                      .icon = "tool_add_device_line",
                                      .group = Operation::Group::DeviceButtons,
                                      .needs = Operation::Needs::Session,
                                      .helpPage = "adding-devices.html",
                                      .open = openAddDevice};
