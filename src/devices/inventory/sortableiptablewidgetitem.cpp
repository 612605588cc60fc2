#include "devices/inventory/sortableiptablewidgetitem.h"

#include "devices/inventory/devicerecord.h"

bool SortableIpTableWidgetItem::operator<(const QTableWidgetItem &other) const {
    const auto key = [](const QTableWidgetItem &item) {
        return DeviceRecords::ipSortKey(item.data(Qt::DisplayRole).toString());
    };
    return key(*this) < key(other);
}
