#include "discoveredmodel.h"

#include "devicesearch.h"

#include <QCoreApplication>
#include <QDebug>
#include <QThreadPool>

#include <algorithm>

namespace {

constexpr DeviceColumn deviceColumns[DiscoveredModel::columnTotal] = {
    DeviceColumn::Status, DeviceColumn::Model,    DeviceColumn::Ip,
    DeviceColumn::Mac,    DeviceColumn::HttpPort, DeviceColumn::HttpsPort};

/// The MAC address as devices are told apart by; empty where there is none.
QString macOf(const DeviceRecord &device) {
    QString mac = device.text(DeviceColumn::Mac).toUpper();
    return mac.removeIf([](QChar c) { return c == u':' || c == u'-' || c == u'.' || c.isSpace(); });
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

DiscoveredModel::DiscoveredModel(const DeviceSnapshot &managed, QObject *parent)
    : QAbstractTableModel(parent) {
    m_managed.reserve(managed.size());
    for (int i = 0; i < managed.size(); ++i)
        m_managed.insert(macOf(*managed.at(i)));
}

void DiscoveredModel::clear() {
    m_devices.clear();
    m_listed.clear();
    m_checkedCount = 0;
    arrange();
}

int DiscoveredModel::add(const std::vector<DeviceRecordPtr> &devices, DeviceSource source) {
    std::vector<Taken> taken;
    const std::size_t before = m_devices.size();
    int nameless = 0;
    for (const DeviceRecordPtr &device : devices) {
        // Without a MAC address nobody can tell whether the device is managed already.
        if (device->text(DeviceColumn::Mac) == QLatin1String("--")) {
            ++nameless;
            continue;
        }
        const QString mac = macOf(*device);
        const bool isNew = !m_managed.contains(mac) && !m_listed.contains(mac);
        taken.push_back({device, isNew});
        if (!isNew)
            continue;
        m_listed.insert(mac);
        m_devices.push_back({device, source});
    }
    if (nameless > 0)
        qWarning("%d devices have no MAC address and are not listed", nameless);
    log(std::move(taken));
    if (m_devices.size() > before)
        arrange();
    return static_cast<int>(m_devices.size() - before);
}

void DiscoveredModel::setSearch(const QString &text) {
    m_search = text;
    arrange();
}

std::vector<DeviceRecordPtr> DiscoveredModel::devices() const {
    std::vector<DeviceRecordPtr> all;
    for (const Entry &each : m_devices)
        all.push_back(each.record);
    return all;
}

std::vector<DeviceRecordPtr> DiscoveredModel::checkedDevices() const {
    std::vector<DeviceRecordPtr> checked;
    for (const Entry &each : m_devices) {
        if (each.checked)
            checked.push_back(each.record);
    }
    return checked;
}

void DiscoveredModel::check(Entry &entry, bool checked) {
    if (std::exchange(entry.checked, checked) != checked)
        m_checkedCount += checked ? 1 : -1;
}

void DiscoveredModel::setShownChecked(bool checked) {
    if (m_order.empty())
        return;
    for (const std::size_t place : m_order)
        check(m_devices[place], checked);
    emit dataChanged(index(0, 0), index(rowCount() - 1, 0), {Qt::CheckStateRole});
    emit changed();
}

Qt::CheckState DiscoveredModel::shownState() const {
    const auto checked = std::count_if(m_order.begin(), m_order.end(),
                                       [this](std::size_t place) { return m_devices[place].checked; });
    if (checked == 0)
        return Qt::Unchecked;
    return static_cast<std::size_t>(checked) == m_order.size() ? Qt::Checked : Qt::PartiallyChecked;
}

int DiscoveredModel::rowCount(const QModelIndex &parent) const {
    return parent.isValid() ? 0 : static_cast<int>(m_order.size());
}

int DiscoveredModel::columnCount(const QModelIndex &parent) const {
    return parent.isValid() ? 0 : columnTotal;
}

QString DiscoveredModel::text(const Entry &entry, int column) const {
    if (column != StatusColumn)
        return entry.record->text(deviceColumns[column]);
    switch (entry.source) {
    case DeviceSource::Network:
        return tr("Discovered");
    case DeviceSource::Manual:
        return tr("Found by IP");
    case DeviceSource::File:
        return tr("From file");
    }
    return {};
}

QVariant DiscoveredModel::data(const QModelIndex &index, int role) const {
    if (!checkIndex(index, CheckIndexOption::IndexIsValid))
        return {};
    if (role == Qt::DisplayRole)
        return text(entry(index.row()), index.column());
    if (role == Qt::CheckStateRole && index.column() == StatusColumn)
        return entry(index.row()).checked ? Qt::Checked : Qt::Unchecked;
    return {};
}

bool DiscoveredModel::setData(const QModelIndex &index, const QVariant &value, int role) {
    if (role != Qt::CheckStateRole || index.column() != StatusColumn)
        return false;
    check(entry(index.row()), value.toInt() == Qt::Checked);
    emit dataChanged(index, index, {role});
    emit changed();
    return true;
}

QVariant DiscoveredModel::headerData(int section, Qt::Orientation orientation, int role) const {
    if (orientation != Qt::Horizontal || role != Qt::DisplayRole || section < 0 || section >= columnTotal)
        return {};
    return DeviceRecords::columnTitle(deviceColumns[section]);
}

Qt::ItemFlags DiscoveredModel::flags(const QModelIndex &index) const {
    const Qt::ItemFlags checkable =
        index.column() == StatusColumn ? Qt::ItemIsUserCheckable : Qt::NoItemFlags;
    return QAbstractTableModel::flags(index) | checkable;
}

void DiscoveredModel::sort(int column, Qt::SortOrder order) {
    if (column < 0 || column >= columnTotal)
        return;
    m_sortColumn = column;
    m_sortOrder = order;
    emit layoutAboutToBeChanged();
    const std::vector<std::size_t> before = m_order;
    sortOrder();
    std::vector<int> rows(m_devices.size());
    for (std::size_t row = 0; row < m_order.size(); ++row)
        rows[m_order[row]] = static_cast<int>(row);
    for (const QModelIndex &old : persistentIndexList())
        changePersistentIndex(old, index(rows[before[static_cast<std::size_t>(old.row())]], old.column()));
    emit layoutChanged();
}

void DiscoveredModel::arrange() {
    const DeviceSearch search(m_search, {});
    beginResetModel();
    m_order.clear();
    for (std::size_t place = 0; place < m_devices.size(); ++place) {
        if (search.matches(*m_devices[place].record))
            m_order.push_back(place);
    }
    sortOrder();
    endResetModel();
    emit changed();
}

/// What is unknown comes last either way; equal ones keep the order in which they were found.
void DiscoveredModel::sortOrder() {
    const DeviceColumn column = deviceColumns[m_sortColumn];
    const auto key = [&](const Entry &each) {
        return m_sortColumn == StatusColumn ? static_cast<quint64>(each.source)
                                            : each.record->sortKey(column);
    };
    const bool ascending = m_sortOrder == Qt::AscendingOrder;
    std::sort(m_order.begin(), m_order.end(), [&](std::size_t left, std::size_t right) {
        const Entry &a = m_devices[left];
        const Entry &b = m_devices[right];
        if (const quint64 keyA = key(a), keyB = key(b); keyA != keyB) {
            if (keyA == DeviceRecord::unknownKey || keyB == DeviceRecord::unknownKey)
                return keyB == DeviceRecord::unknownKey;
            return (keyA < keyB) == ascending;
        }
        const int texts = m_sortColumn == StatusColumn
                              ? 0
                              : a.record->text(column).compare(b.record->text(column), Qt::CaseInsensitive);
        return texts != 0 ? (texts < 0) == ascending : left < right;
    });
}
