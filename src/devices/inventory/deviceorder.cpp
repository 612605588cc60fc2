#include "devices/inventory/deviceorder.h"

#include "devices/sites/sitelist.h"

#include <algorithm>

namespace DeviceOrder {

namespace {

/// A row while it is sorted: the key decides, the text of the same column where keys are equal.
struct Sortable {
    quint64 key;
    int index;
    const QString *text;
};

Sortable sortable(const DeviceInventory &inventory, int index, DeviceColumn column) {
    const DeviceRecord &record = inventory.record(index);
    if (column == DeviceColumn::Status)
        return {static_cast<quint64>(inventory.status(index)), index, &record.text(column)};
    return {record.sortKey(column), index, &record.text(column)};
}

bool comesFirst(const Sortable &a, const Sortable &b, bool ascending) {
    if (a.key != b.key) {
        if (a.key == DeviceRecord::unknownKey || b.key == DeviceRecord::unknownKey)
            return b.key == DeviceRecord::unknownKey;
        return (a.key < b.key) == ascending;
    }
    const int order = a.text->compare(*b.text, Qt::CaseInsensitive);
    if (order != 0)
        return (order < 0) == ascending;
    return a.index < b.index;
}

} // namespace

std::vector<int> matching(const DeviceInventory &inventory, const DeviceFilter &filter) {
    std::vector<int> indexes;
    const bool all = filter.siteId == Sites::overviewId;
    const int size = inventory.snapshot()->size();
    indexes.reserve(static_cast<std::size_t>(size));
    for (int i = 0; i < size; ++i) {
        const DeviceRecord &record = inventory.record(i);
        if (record.deviceClass == filter.deviceClass && (all || record.siteIds.contains(filter.siteId)) &&
            filter.search.matches(record))
            indexes.push_back(i);
    }
    return indexes;
}

std::vector<int> arrange(const DeviceInventory &inventory, const DeviceFilter &filter,
                         const DeviceSort &sort) {
    std::vector<int> indexes = matching(inventory, filter);
    if (filter.status)
        std::erase_if(indexes,
                      [&](int i) { return DeviceStatus::groupOf(inventory.status(i)) != *filter.status; });
    if (sort.column < 0 || sort.column >= deviceColumnCount)
        return indexes;
    std::vector<Sortable> rows;
    rows.reserve(indexes.size());
    for (const int index : indexes)
        rows.push_back(sortable(inventory, index, static_cast<DeviceColumn>(sort.column)));
    const bool ascending = sort.order == Qt::AscendingOrder;
    std::sort(rows.begin(), rows.end(),
              [ascending](const Sortable &a, const Sortable &b) { return comesFirst(a, b, ascending); });
    std::transform(rows.begin(), rows.end(), indexes.begin(), [](const Sortable &row) { return row.index; });
    return indexes;
}

} // namespace DeviceOrder
