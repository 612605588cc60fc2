#include "devices/discovery/discoveredmodel.h"

#include "devices/inventory/devicesearch.h"

#include <QCoreApplication>
#include <QDebug>
#include <QThreadPool>

namespace {

constexpr DeviceColumn deviceColumns[DiscoveredModel::columnTotal] = {
    DeviceColumn::Status, DeviceColumn::Model,    DeviceColumn::Ip,
    DeviceColumn::Mac,    DeviceColumn::HttpPort, DeviceColumn::HttpsPort};

/// The MAC address, by which devices are told apart; unknownKey where there is none.
quint64 macOf(const DeviceRecord &device) {
    return device.sortKey(DeviceColumn::Mac);
}

struct Taken {
    DeviceRecordPtr device;
    bool isNew;
};

/// Not in the user-interface thread: for many devices it takes longer than a window may stand still.
void log(std::vector<Taken> devices) {
    QThreadPool::globalInstance()->start([devices = std::move(devices)] {
        for (const auto &[device, isNew] : devices) {
            if (QCoreApplication::closingDown())
                return;
            const QByteArray mac = device->text(DeviceColumn::Mac).toUtf8();
            if (!isNew) {
                qDebug("device(mac: %s) have been added already!", mac.constData());
                continue;
            }
            qDebug("add device(mac: %s)!", mac.constData());
            qDebug("fill device table: model: %s, ip: %s, mac: %s, http port: %d, https port: %d",
                   qUtf8Printable(device->text(DeviceColumn::Model)),
                   qUtf8Printable(device->text(DeviceColumn::Ip)), mac.constData(),
                   device->text(DeviceColumn::HttpPort).toInt(),
                   device->text(DeviceColumn::HttpsPort).toInt());
        }
    });
}

} // namespace

DiscoveredModel::DiscoveredModel(QObject *parent) : CheckListModel(parent) {
    sort(IpColumn, Qt::AscendingOrder);
}

int DiscoveredModel::setManaged(const DeviceSnapshot &managed) {
    m_managed.clear();
    m_managed.reserve(managed.size());
    for (int i = 0; i < managed.size(); ++i)
        m_managed.insert(macOf(*managed.at(i)));
    std::vector<Entry> left;
    std::vector<int> checked;
    for (int item = 0; item < itemCount(); ++item) {
        const quint64 mac = macOf(*entry(item).record);
        if (m_managed.contains(mac)) {
            m_listed.remove(mac);
            continue;
        }
        if (isChecked(item))
            checked.push_back(static_cast<int>(left.size()));
        left.push_back(entry(item));
    }
    const auto dropped = static_cast<int>(m_devices.size() - left.size());
    if (dropped == 0)
        return 0;
    // The places are others now, so the marks are set anew.
    m_devices.clear();
    setItemCount(0, false);
    m_devices = std::move(left);
    setItemCount(static_cast<int>(m_devices.size()), false);
    setChecked(checked, true);
    return dropped;
}

void DiscoveredModel::clear() {
    m_devices.clear();
    m_listed.clear();
    setItemCount(0, false);
}

DiscoveredModel::Added DiscoveredModel::add(const std::vector<DeviceRecordPtr> &devices,
                                            DeviceSource source) {
    std::vector<Taken> taken;
    Added added;
    for (const DeviceRecordPtr &device : devices) {
        const quint64 mac = macOf(*device);
        // Without a MAC address nobody can tell whether the device is managed already.
        if (mac == DeviceRecord::unknownKey) {
            ++added.withoutMac;
            continue;
        }
        const bool isNew = !m_managed.contains(mac) && !m_listed.contains(mac);
        ++(isNew ? added.taken : added.known);
        taken.push_back({device, isNew});
        if (!isNew)
            continue;
        m_listed.insert(mac);
        m_devices.push_back({device, source});
    }
    if (added.withoutMac > 0)
        qWarning("%d devices have no MAC address and are not listed", added.withoutMac);
    log(std::move(taken));
    if (added.taken > 0)
        setItemCount(static_cast<int>(m_devices.size()), false);
    return added;
}

std::vector<DeviceRecordPtr> DiscoveredModel::devices() const {
    std::vector<DeviceRecordPtr> all;
    for (const Entry &each : m_devices)
        all.push_back(each.record);
    return all;
}

std::vector<DeviceRecordPtr> DiscoveredModel::checkedDevices() const {
    std::vector<DeviceRecordPtr> checked;
    for (int item = 0; item < itemCount(); ++item) {
        if (isChecked(item))
            checked.push_back(entry(item).record);
    }
    return checked;
}

int DiscoveredModel::columnCount(const QModelIndex &parent) const {
    return parent.isValid() ? 0 : columnTotal;
}

QVariant DiscoveredModel::headerData(int section, Qt::Orientation orientation, int role) const {
    if (orientation != Qt::Horizontal || role != Qt::DisplayRole || section < 0 || section >= columnTotal)
        return {};
    return DeviceRecords::columnTitle(deviceColumns[section]);
}

QString DiscoveredModel::text(int item, int column) const {
    if (column != StatusColumn)
        return entry(item).record->text(deviceColumns[column]);
    switch (entry(item).source) {
    case DeviceSource::Network:
        return tr("Discovered");
    case DeviceSource::Manual:
        return tr("Found by IP");
    case DeviceSource::File:
        return tr("From file");
    }
    return {};
}

std::vector<int> DiscoveredModel::find(const QString &search) const {
    const DeviceSearch words(search, {});
    std::vector<int> found;
    for (int item = 0; item < static_cast<int>(m_devices.size()); ++item) {
        if (words.matches(*entry(item).record))
            found.push_back(item);
    }
    return found;
}

int DiscoveredModel::compare(int left, int right, int column, bool ascending) const {
    const Entry &a = entry(left);
    const Entry &b = entry(right);
    if (column != StatusColumn)
        return DeviceRecords::compare(*a.record, *b.record, deviceColumns[column], ascending);
    const int difference = static_cast<int>(a.source) - static_cast<int>(b.source);
    return ascending ? difference : -difference;
}
