#pragma once

#include "devices/inventory/deviceinventory.h"
#include "devices/inventory/inventoryreader.h"
#include "devices/operations/operation.h"
#include "widgets/dialogs/transientmessage.h"

#include <QPointer>
#include <QWidget>

#include <memory>

class DeviceActions;
class DeviceFooter;
class DeviceMonitor;
class DeviceSiteActions;
class DeviceTabs;
class DeviceToolBar;
class InventoryUpdater;
class NoticeBar;
class QSplitter;
class QTimer;
class ReconnectingDialog;
class SiteCommit;
class SiteTree;
class StateRefresh;

/// The device console: the site tree, the tool bar, the three device tables and what keeps them current.
class DeviceWindow : public QWidget, public OperationContext {
    Q_OBJECT

public:
    explicit DeviceWindow(QWidget *parent = nullptr);
    ~DeviceWindow() override;

    /// Reads the inventory of the present session and begins to follow it.
    void startWork();
    /// Ends that and forgets everything that was shown.
    void stopWork();

    /// The devices of the last reading.
    const DeviceSnapshotPtr &devices() const override { return m_inventory.snapshot(); }
    /// True while there are changes of sites that were not sent.
    bool hasPendingEdits() const;
    void discardEdits();

    /// The devices that operations work on, in the order of their rows as they are sorted now.
    std::vector<DeviceRecordPtr> selectedDevices() const;

    QWidget *dialogParent() override { return this; }
    DeviceActions *actions() override { return m_actions; }
    InventoryUpdater *inventoryUpdater() override { return m_updater; }
    std::vector<int> shownDevices() const override;
    void refreshStates() override;
    void askToRemove() override;

public slots:
    /// Sends the changes of sites.
    void commitSites();
    /// Reads sites and devices again.
    void reload() override;
    /// Selects the device with the id, or else the one with the address, and brings it into view.
    void selectDevice(const QString &id, const QString &ip) override;
    /// Shows a transient message.
    void showDefAnimateMsgDlg(const QString &message,
                              TransientMessage::Kind kind = TransientMessage::Kind::Plain);
    void showSuccess(const QString &message);
    void showError(const QString &message);
    /// What shows until the outcome takes its place.
    void showProgress(const QString &message);
    /// Removes the devices that were selected when the user was asked: from the service, or from the site
    /// that was selected then.
    void removeDevices(bool fromOverview);

signals:
    /// No task is at work any more.
    void allTasksDone();
    void onShowAnimatedMsgDlg(const QString &message,
                              TransientMessage::Kind kind = TransientMessage::Kind::Plain);
    /// The user gives the lost server up.
    void disconnectRequested();
    /// A server of the saved list was chosen in place of the present one.
    void remoteServerChosen(const QString &serverId);

private:
    void buildLayout();
    void connectParts();
    void connectOperations();
    void addShortcuts();

    void onTaskListUpdated();
    void openOperation(const Operation &operation, OperationRequest request);
    /// Opens the dialog of a task's operation once more: what the user gave it then was not kept.
    void openAgain(const QString &taskType, const QStringList &deviceIds);
    void onDeviceDrop(const QString &siteId, const QStringList &deviceIds, Qt::DropAction action,
                      const QString &sourceSiteId);

    void applySearch(const QString &text);
    void followSiteNames();
    void applyStatusFilter(std::optional<DeviceStatusGroup> status);
    void clearFilter();
    void onFilterChanged();

    void onReading(const InventoryReader::Reading &reading);
    void onUpdateDeviceStatus(const DeviceStatusUpdate &update);
    void onServerAnswered();
    void onServerLost();
    void onSelectionChanged();
    void onSiteChanged(const QString &siteId);
    QHash<QString, QString> siteNames() const;
    OperationTargets::List targetsOf(const std::vector<DeviceRecordPtr> &devices) const;

    void onRefreshDone();

    void showContent();
    void showStatusCounts();
    void showSelectionCount();

    DeviceInventory m_inventory;
    std::unique_ptr<DeviceMonitor> m_monitor;

    QSplitter *m_splitter;
    QWidget *m_console; ///< right of the tree
    SiteTree *m_siteTree;
    SiteCommit *m_siteCommit;
    InventoryUpdater *m_updater;
    DeviceActions *m_actions;
    DeviceSiteActions *m_placement;
    StateRefresh *m_refresh;
    DeviceToolBar *m_toolBar;
    NoticeBar *m_noticeBar;
    DeviceTabs *m_tabs;
    DeviceFooter *m_footer;
    QTimer *m_selectionLogDelay;

    QPointer<ReconnectingDialog> m_reconnecting;
    QHash<QString, QString> m_searchedSites; ///< the names by which the search knows sites
    bool m_tasksRunning = false;
    bool m_online = false;
};
