#pragma once

#include "devices/operations/operationtargets.h"

#include <QCoreApplication>

#include <array>
#include <optional>

class DeviceActions;
class InventoryUpdater;
class QDialog;
class QWidget;

/// What the device console offers to the operations that are opened on it. User-interface thread.
class OperationContext {
public:
    virtual QWidget *dialogParent() = 0;
    virtual DeviceActions *actions() = 0;
    virtual const DeviceSnapshotPtr &devices() const = 0;
    virtual InventoryUpdater *inventoryUpdater() = 0;
    /// The rows of the current table: indexes in the snapshot, in the order of the table.
    virtual std::vector<int> shownDevices() const = 0;
    virtual void selectDevice(const QString &id, const QString &ip) = 0;
    virtual void reload() = 0;
    /// Reads the states of all devices again, behind a dialog.
    virtual void refreshStates() = 0;
    /// Asks whether the selected devices are to leave the site, or the service in the overview.
    virtual void askToRemove() = 0;

protected:
    ~OperationContext() = default;
};

/// What an operation is opened for.
struct OperationRequest {
    OperationTargets::List targets; ///< empty for an operation that does not need a selection
    QString taskType;               ///< of the task that is tried again; empty for a new one
};

/// One operation of the device console. The tool bar, its menus, the row menu, the user guide and the retry
/// of tasks read these rows; see Operations::all.
struct Operation {
    /// Where it is offered: a group of buttons of the tool bar, or a menu.
    enum class Group {
        DeviceButtons,
        ConfigurationButtons,
        MaintenanceButtons,
        ListButtons,
        UploadMenu,
        CertificateMenu,
        ConfigurationMenu,
        RestoreMenu,
        ExportMenu,
        RowMenu
    };
    /// What must be there for it to be enabled.
    enum class Needs { Nothing, Session, Selection, LaterVersion };

    const char *objectName;
    const char *text; ///< marked for translation in the context "Operation"
    const char *icon = nullptr;
    Group group;
    Needs needs;
    std::optional<Group> menu = {};             ///< the menu that its button opens, in place of a dialog
    std::array<const char *, 3> taskTypes = {}; ///< tasks that it makes
    const char *helpPage = nullptr;             ///< of the user guide
    /// Returns the dialog that asks for what the operation needs, not yet shown; null where there is none.
    QDialog *(*open)(OperationContext &, OperationRequest) = nullptr;

    bool isButton() const { return group <= Group::ListButtons; }
    QString title() const { return tr(text); }

    Q_DECLARE_TR_FUNCTIONS(Operation)
};
