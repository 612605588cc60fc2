#pragma once

#include "devices/inventory/devicerecord.h"
#include "devices/inventory/devicestatus.h"
#include "devices/page/devicetab.h"
#include "widgets/controls/countedtabwidget.h"

#include <optional>
#include <vector>

class DeviceTabsCorner;
class DeviceInventory;
class DeviceSearch;
class MainConsoleTable;

/// The device tables, one tab a class of devices, and what stands beside the tabs.
class DeviceTabs : public CountedTabWidget {
    Q_OBJECT

public:
    /// The inventory must outlive the tabs.
    explicit DeviceTabs(const DeviceInventory &inventory, QWidget *parent = nullptr);

    DeviceTabsCorner *corner() const { return m_corner; }
    MainConsoleTable *currentTable() const;

    /// The inventory has other devices now.
    void refill();
    /// The inventory has other states now.
    void refreshStatus();

    void setSite(const QString &siteId);
    void setSearch(const DeviceSearch &search);
    void setStatusFilter(std::optional<DeviceStatusGroup> status);

    /// isSite: a site is shown, not the overview.
    void showContent(DeviceTab::Content content, bool isSite);

    /// Turns to a device and selects it; false where its table does not show it.
    bool selectDevice(int place);

signals:
    /// The selection of the current table, what its rows show, or which one that is, has changed. All tables
    /// show the same inventory then.
    void selectionChanged();
    void deleteRequested();
    void addDeviceRequested();
    void clearFilterRequested();
    void rowMenuRequested(MainConsoleTable *table, const QPoint &position);

private:
    void addTable(DeviceClass deviceClass, const QString &title, const char *name);
    template <typename Change>
    void changeTables(const Change &change);
    void showCounts();

    const DeviceInventory &m_inventory;
    DeviceTabsCorner *m_corner;
    std::vector<DeviceTab *> m_tabs;
    bool m_changing = false;         ///< some tables have what is new, others not yet
    bool m_selectionChanged = false; ///< meanwhile
};
