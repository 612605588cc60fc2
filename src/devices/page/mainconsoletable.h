#pragma once

#include "devices/inventory/deviceorder.h"
#include "widgets/lists/customtable.h"

#include <QAccessible>
#include <QBasicTimer>
#include <QElapsedTimer>
#include <QItemSelection>

/// A device table of the console: the devices of one class, in fifteen columns.
///
/// It shows an inventory that belongs to somebody else. Its items are bound to their places and answer from
/// the record that the order puts into their row, so refilling, sorting and polling move no item. Only rows
/// in and near the view have items, all rows while a screen reader is there. Selection, current device and
/// scroll position stay with the devices, not with the rows.
class MainConsoleTable : public CustomTable, private QAccessible::ActivationObserver {
    Q_OBJECT

public:
    /// Role of the device's id, at every cell of its row.
    static constexpr int deviceIdRole = Qt::UserRole;

    explicit MainConsoleTable(DeviceClass deviceClass, QWidget *parent = nullptr);
    ~MainConsoleTable() override;

    void keyboardSearch(const QString &search) override;

    /// The inventory must outlive the table.
    void setInventory(const DeviceInventory *inventory);
    /// Shows the devices of a site, or all for the overview's id.
    void setSite(const QString &siteId);

    /// Shows what the search finds, and of that the devices in a group of states; nothing for all states.
    void setSearch(const DeviceSearch &search);
    void setStatusFilter(std::optional<DeviceStatusGroup> status);
    bool isFiltered() const { return !m_filter.search.isEmpty() || m_filter.status; }

    /// To be called after the inventory's devices have changed.
    void refill();
    /// To be called after states have changed: paints again, and sorts again when the states decide the
    /// order.
    void refreshStatus();

    /// The devices that the site and the search leave, whatever their state; places in the inventory.
    std::vector<int> matchingDevices() const;
    /// How many devices of the table's class the site has.
    int unfilteredCount() const;
    /// The devices of all rows, as places in the inventory, in the order of the rows.
    const std::vector<int> &shownDevices() const { return m_order; }
    /// The devices of the selected rows, as places in the inventory, in the order of the rows.
    std::vector<int> selectedDevices() const;
    /// Their records, as the rows show them: good also while the inventory has changed and the table has not.
    std::vector<DeviceRecordPtr> selectedRecords() const;

    /// Selects a device alone and brings it into view. False when the table does not show it.
    bool selectDevice(int place);

    /// The selected rows as text: tabs between the visible columns, whose titles come first.
    QString selectionText() const;
    void copySelection() const;

    /// Makes columns as they were kept under the table's object name, and keeps changes from now on.
    void keepColumns();
    void resetColumns();

    /// What an item of the table answers.
    QVariant cellData(int row, int column, int role) const;

signals:
    /// Other devices are selected than before.
    void selectedDevicesChanged();
    void deleteRequested();
    /// A menu was asked for, of the selected rows or of the columns; global position.
    void rowMenuRequested(const QPoint &position);
    void columnMenuRequested(const QPoint &position);

protected:
    void timerEvent(QTimerEvent *event) override;
    void keyPressEvent(QKeyEvent *event) override;
    void startDrag(Qt::DropActions actions) override;
    void paintEvent(QPaintEvent *event) override;

private:
    struct Rows {
        int first = 0;
        int end = 0;

        bool contains(int row) const { return row >= first && row < end; }
    };

    struct Place; // what has to survive a new order
    Place saveViewState() const;
    void restoreViewState(const Place &place);
    bool isSameOrder(const Place &place) const;
    int placeNow(const Place &place, int device) const;
    std::pair<QItemSelection, int> selectionNow(const Place &place) const;

    void arrange();
    void sortBy(int column);
    void keepItems();
    void makeAllItems(int budgetMs);
    void makeItems(int row);
    void deleteItems(int row);
    void accessibilityActiveChanged(bool active) override;
    void fitColumns();
    void saveColumns() const;
    QStringList visibleTexts(int row) const;
    std::vector<int> selectedRows() const;

    const DeviceInventory *m_inventory = nullptr;
    DeviceSnapshotPtr m_shown; ///< the reading whose places m_order holds
    DeviceFilter m_filter;
    DeviceSort m_sort;
    std::vector<int> m_order;
    Rows m_items;               ///< those that have items
    bool m_isReadAloud = false; ///< a screen reader or the like is there
    QElapsedTimer m_sinceTyped;
    QString m_typed; ///< to find a row by its first letters
    QBasicTimer m_fillTimer;
    QBasicTimer m_saveTimer;
    bool m_columnsFitted = false;
};
