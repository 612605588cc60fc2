#pragma once

#include "devices/inventory/deviceinventory.h"
#include "devices/inventory/devicesearch.h"

#include <optional>
#include <vector>

/// What one table shows and in which order.
struct DeviceFilter {
    DeviceClass deviceClass = DeviceClass::Camera;
    QString siteId; ///< the overview's id for all sites
    DeviceSearch search = {};
    std::optional<DeviceStatusGroup> status = {}; ///< nothing for all states
};

struct DeviceSort {
    int column = -1; ///< as in DeviceColumn; -1 for the service's own order
    Qt::SortOrder order = Qt::AscendingOrder;
};

/// The order of a table's rows: places in the inventory, so that sorting and filtering move no item.
namespace DeviceOrder {

/// The devices that pass the filter, whatever their state, in the service's order.
std::vector<int> matching(const DeviceInventory &inventory, const DeviceFilter &filter);

/// The devices that pass the filter, in the wanted order. Values that are unknown come last either way, and
/// equal ones keep the service's order.
std::vector<int> arrange(const DeviceInventory &inventory, const DeviceFilter &filter,
                         const DeviceSort &sort);

} // namespace DeviceOrder
