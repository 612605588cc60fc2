#pragma once

#include "devices/inventory/deviceinventory.h"
#include "devices/inventory/statuscache.h"
#include "devices/sites/sitelist.h"

#include <optional>

class ServiceSession;

/// Reads sites, devices and their states from the service, page by page. For a runner's thread.
namespace InventoryReader {

/// A reading of everything the console shows.
struct Reading {
    std::optional<Sites::List> sites;    ///< nothing when they could not be read
    DeviceSnapshotPtr devices;           ///< null when they could not be read
    std::vector<DeviceStatusCode> codes; ///< one a device, in their order
};

/// Reads the sites alone. Returns an ApiResult.
unsigned readSites(ServiceSession &session, Sites::List &sites);

/// Reads the devices alone, as readAll() does. Null when they could not be read.
DeviceSnapshotPtr readDevices(ServiceSession &session, const DeviceSnapshotPtr &previous);

/// Reads all three. Records that are as before are taken over from the previous reading; when all are, the
/// very same snapshot comes back.
Reading readAll(ServiceSession &session, const DeviceSnapshotPtr &previous,
                std::vector<DeviceStatusCode> previousCodes);

/// Reads the states and compares them with those of a snapshot. Nothing when they could not be read. cache:
/// what an earlier reading of states has left for the next one, or null.
std::optional<DeviceStatusUpdate> readStatus(ServiceSession &session, const DeviceSnapshotPtr &snapshot,
                                             const std::vector<DeviceStatusCode> &codes,
                                             StatusCache *cache = nullptr);

} // namespace InventoryReader
