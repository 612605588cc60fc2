#pragma once

#include "devices/inventory/deviceinventory.h"
#include "widgets/lists/checklistmodel.h"

#include <QSet>

#include <vector>

/// Where a device of the list comes from.
enum class DeviceSource : quint8 { Network, Manual, File };

/// The devices that could be added, each with a check mark. A device is known by its MAC address, without
/// case and separators; what the service manages or the list holds already is not taken again.
class DiscoveredModel : public CheckListModel {
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

    explicit DiscoveredModel(QObject *parent = nullptr);

    /// The devices that the service manages now. Takes those out of the list and returns how many they were.
    int setManaged(const DeviceSnapshot &managed);
    void clear();
    /// What became of found devices.
    struct Added {
        int taken = 0;
        int known = 0; ///< managed or listed already
        int withoutMac = 0;
    };
    /// Takes what is new among the devices.
    Added add(const std::vector<DeviceRecordPtr> &devices, DeviceSource source);

    /// All devices of the list, also those that the search hides.
    std::vector<DeviceRecordPtr> devices() const;
    std::vector<DeviceRecordPtr> checkedDevices() const;

    int columnCount(const QModelIndex &parent = {}) const override;
    QVariant headerData(int section, Qt::Orientation orientation, int role) const override;

protected:
    QString text(int item, int column) const override;
    std::vector<int> find(const QString &search) const override;
    int compare(int left, int right, int column, bool ascending) const override;

private:
    struct Entry {
        DeviceRecordPtr record;
        DeviceSource source;
    };

    const Entry &entry(int item) const { return m_devices[static_cast<std::size_t>(item)]; }

    QSet<quint64> m_managed; ///< MAC addresses
    QSet<quint64> m_listed;
    std::vector<Entry> m_devices;
};
