#pragma once

#include "deviceinventory.h"

#include <QAbstractTableModel>
#include <QSet>

#include <vector>

/// Where a device of the list comes from.
enum class DeviceSource : quint8 { Network, Manual, File };

/// The devices that could be added, each with a check mark. A device is known by its MAC address, without
/// case and separators; what the service manages or the list holds already is not taken again.
class DiscoveredModel : public QAbstractTableModel {
    Q_OBJECT

public:
    enum Column {
        StatusColumn,
        ModelColumn,
        IpColumn,
        MacColumn,
        HttpPortColumn,
        HttpsPortColumn,
        columnTotal
    };

    explicit DiscoveredModel(const DeviceSnapshot &managed, QObject *parent = nullptr);

    void clear();
    /// Takes what is new among the devices; returns how many that were.
    int add(const std::vector<DeviceRecordPtr> &devices, DeviceSource source);

    /// Shows the devices alone in which the words of a search are found.
    void setSearch(const QString &text);

    /// All devices of the list, also those that the search hides.
    std::vector<DeviceRecordPtr> devices() const;
    std::vector<DeviceRecordPtr> checkedDevices() const;
    int deviceCount() const { return static_cast<int>(m_devices.size()); }
    int checkedCount() const { return m_checkedCount; }

    /// For all rows that the search leaves.
    void setShownChecked(bool checked);
    /// What a check box for all shown rows says.
    Qt::CheckState shownState() const;

    int rowCount(const QModelIndex &parent = {}) const override;
    int columnCount(const QModelIndex &parent = {}) const override;
    QVariant data(const QModelIndex &index, int role) const override;
    bool setData(const QModelIndex &index, const QVariant &value, int role) override;
    QVariant headerData(int section, Qt::Orientation orientation, int role) const override;
    Qt::ItemFlags flags(const QModelIndex &index) const override;
    void sort(int column, Qt::SortOrder order) override;

signals:
    /// Devices or check marks are others now, or the search shows others.
    void changed();

private:
    struct Entry {
        DeviceRecordPtr record;
        DeviceSource source;
        bool checked = false;
    };

    Entry &entry(int row) { return m_devices[m_order[static_cast<std::size_t>(row)]]; }
    const Entry &entry(int row) const { return m_devices[m_order[static_cast<std::size_t>(row)]]; }
    QString text(const Entry &entry, int column) const;
    void check(Entry &entry, bool checked);
    void arrange();
    void sortOrder();

    QSet<QString> m_managed; ///< MAC addresses
    QSet<QString> m_listed;
    std::vector<Entry> m_devices;
    std::vector<std::size_t> m_order; ///< places of the devices in the rows
    int m_checkedCount = 0;
    QString m_search;
    int m_sortColumn = IpColumn;
    Qt::SortOrder m_sortOrder = Qt::AscendingOrder;
};
